// SPDX-License-Identifier: MIT
// A balloon with rows of known size in a parent of 400 x 300, in a window.
#pragma once

#include "popover/Balloon.h"
#include "popover/Container.h"

#include <QtCore/QEvent>
#include <QtWidgets/QApplication>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QVBoxLayout>
#include <QtWidgets/QWidget>

#include <memory>

namespace zelkovtest
{
/// A row that wants a size.
class PlainRow : public QWidget
{
public:
    explicit PlainRow(const QSize& hint, QWidget* parent = nullptr)
        : QWidget(parent)
        , m_hint(hint)
    {
        setMinimumSize(hint);
    }

    QSize sizeHint() const override { return m_hint; }
    QSize minimumSizeHint() const override { return m_hint; }
    void setHint(const QSize& hint)
    {
        m_hint = hint;
        setMinimumSize(hint);
        updateGeometry();
    }

private:
    QSize m_hint;
};

/// Counts the events of one type that reach an object.
class EventCount : public QObject
{
public:
    explicit EventCount(QVector<QEvent::Type> types)
        : m_types(std::move(types))
    {
    }
    void watch(QObject* object) { object->installEventFilter(this); }
    void watchTree(QWidget* widget)
    {
        watch(widget);
        const auto children = widget->findChildren<QWidget*>();
        for (QWidget* child : children) {
            watch(child);
        }
    }
    int count() const { return m_count; }
    void clear() { m_count = 0; }

protected:
    bool eventFilter(QObject*, QEvent* event) override
    {
        m_count += m_types.contains(event->type()) ? 1 : 0;
        return false;
    }

private:
    QVector<QEvent::Type> m_types;
    int m_count = 0;
};

/// The parent covers the window from (0, 0) on, as an overlay does; targets are children of the window.
class BalloonScene
{
public:
    using Balloon = vx::PopoverWidget::Balloon;
    using Container = vx::PopoverWidget::Container;

    static QFlags<Balloon::EArrowDirection> sides(int bits)
    {
        return QFlags<Balloon::EArrowDirection>(QFlag(bits));
    }
    static QFlags<Balloon::EBalloonFeature> features(int bits)
    {
        return QFlags<Balloon::EBalloonFeature>(QFlag(bits));
    }
    static QFlags<Balloon::ESizeConstraint> constraints(int bits)
    {
        return QFlags<Balloon::ESizeConstraint>(QFlag(bits));
    }

    explicit BalloonScene(const QSize& windowSize = QSize(400, 300))
    {
        window.resize(windowSize);
        target = new QWidget(&window);
        target->setGeometry(180, 130, 40, 20);
        parent = new QWidget(&window);
        parent->setGeometry(QRect(QPoint(0, 0), windowSize));
        container = makeContainer(QStringLiteral("content"));
    }

    static Container* makeContainer(const QString& name)
    {
        auto* const made = new Container(nullptr, name, Qt::Vertical, Qt::Alignment());
        for (const auto set : {&Container::setLeftMargin, &Container::setTopMargin, &Container::setRightMargin,
                 &Container::setBottomMargin}) {
            (made->*set)(0);
        }
        return made;
    }

    PlainRow* addRow(const QSize& hint) { return addRow(container, hint); }
    static PlainRow* addRow(Container* to, const QSize& hint)
    {
        auto* const row = new PlainRow(hint);
        to->addWidgetItem(row, QStringLiteral("row"), -1);
        return row;
    }

    /// By default without a title bar, pointing at the target from wherever there is room.
    Balloon* make(int featureBits = 8, int sideBits = 15, const QSizeF& size = QSizeF(), int constraintBits = 3,
        bool atTarget = true)
    {
        balloon = new Balloon(parent, atTarget ? target : nullptr, container, features(featureBits),
            sides(sideBits), size, constraints(constraintBits));
        balloon->hide();
        return balloon;
    }

    void show()
    {
        window.show();
        balloon->show();
        settle();
    }

    static void settle()
    {
        for (int i = 0; i < 5; ++i) {
            QCoreApplication::sendPostedEvents();
            QCoreApplication::processEvents();
        }
    }

    QWidget window;
    QWidget* target = nullptr;
    QWidget* parent = nullptr;
    Container* container = nullptr;
    Balloon* balloon = nullptr;
};
}

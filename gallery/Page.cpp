// SPDX-License-Identifier: MIT
// What all pages of the gallery share.
#include "Page.h"

#include <QtCore/QEvent>
#include <QtWidgets/QFrame>
#include <QtWidgets/QLabel>

#include "SignalLog.h"

namespace gallery
{
namespace
{
class PlaceReporter : public QObject
{
public:
    PlaceReporter(QWidget* widget, const QString& name, SignalLog& log)
        : QObject(widget), m_widget(widget), m_name(name), m_log(log)
    {
        widget->installEventFilter(this);
    }

    bool eventFilter(QObject* object, QEvent* event) override
    {
        switch (event->type()) {
        case QEvent::Show:
            m_widget->window()->installEventFilter(this);
            break;
        case QEvent::Move:
        case QEvent::Resize:
        case QEvent::Paint:
            report();
            break;
        default:
            break;
        }
        return QObject::eventFilter(object, event);
    }

private:
    void report()
    {
        if (!m_widget->isVisible()) {
            return;
        }
        const qreal ratio = m_widget->devicePixelRatioF();
        const QPoint corner = m_widget->mapToGlobal(QPoint()) * ratio;
        const QRect place(corner, m_widget->size() * ratio);
        if (place != m_place) {
            m_place = place;
            m_log.writeComment(QStringLiteral("%1 %2 %3 %4 %5")
                                   .arg(m_name)
                                   .arg(place.x())
                                   .arg(place.y())
                                   .arg(place.width())
                                   .arg(place.height()));
        }
    }

    QWidget* m_widget;
    QString m_name;
    SignalLog& m_log;
    QRect m_place;
};
}

Page::Page(SignalLog& log, QWidget* parent)
    : QWidget(parent), m_log(log)
{
}

void Page::rehearse(Hand&)
{
}

void Page::watch(QObject* object, const QString& name, const QStringList& chatty)
{
    m_log.watch(object, name, chatty);
}

void Page::announcePlace(QWidget* widget, const QString& name)
{
    new PlaceReporter(widget, name, m_log);
}

QLabel* Page::label(const QString& text, const char* role)
{
    auto* result = new QLabel(text);
    if (role) {
        result->setProperty("role", QLatin1String(role));
    }
    return result;
}

QWidget* Page::panel()
{
    auto* result = new QFrame;
    result->setFrameShape(QFrame::StyledPanel);
    result->setProperty("role", QStringLiteral("panel"));
    return result;
}
}

// SPDX-License-Identifier: MIT
// A view with one stripe panel, for the tests of the panel.
#pragma once

#include "sliders/MultiNubsieSlider.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "views/FadeStripeView.h"
#include "views/FadeStripeViewController.h"

#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtCore/QTimer>
#include <QtGui/QDropEvent>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QBoxLayout>
#include <QtWidgets/QStackedLayout>

Q_DECLARE_METATYPE(FadeView::EPositions)

namespace stripescene
{
constexpr auto c_Top = FadeView::ePositionTop;
constexpr auto c_Bottom = FadeView::ePositionBottom;

inline QString word(const char* text)
{
    return QString::fromLatin1(text);
}

inline QStringList list(const char* text)
{
    return QString::fromLatin1(text).split(QLatin1Char(' '));
}

class OpenStripe : public FadeStripeView
{
public:
    using FadeStripeView::FadeStripeView;
    using FadeStripeView::isMimeTypeAccepted;
    using FadeView::m_fadeInSize;
    using FadeView::m_fullscreenTransition;
    using FadeView::m_maximumHeight;
    using FadeView::m_minimumSize;
    using FadeView::m_stripeMinimumHeight;
};

/// A stripe over a view of 400 by 600 pixels, with rows of 100: heights 15, 130, 230.
struct Scene
{
    explicit Scene(FadeView::EPositions edge = c_Top, bool open = true)
        : top(edge == c_Top)
    {
        view.resize(400, 600);
        contents = new QWidget;
        stripe = new OpenStripe(edge, contents, &view);
        stripe->setFadeStripeAsPartOfLayout(false);
        stripe->setContentsHeight(100);
        stripe->show();
        view.show();
        if (!QTest::qWaitForWindowExposed(&view)) {
            qFatal("no window");
        }
        stripe->setRows(open ? 1 : 0);
        stripe->resize();
        QCoreApplication::processEvents();
        recorder.add(stripe);
    }

    QWidget* bar(bool header) const
    {
        const auto* const layout = stripe->layout();
        return layout->itemAt(header ? 0 : 2)->widget();
    }
    QWidget* movingBar() const { return bar(!top); }
    QPoint onHandle() const { return movingBar()->geometry().center(); }
    QPoint besideHandle() const { return QPoint(50, movingBar()->geometry().center().y()); }

    void send(QEvent::Type type, const QPoint& at)
    {
        const QPoint inWindow = stripe->mapTo(&view, at);
        const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, at, inWindow, view.mapToGlobal(inWindow),
            type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton, buttons, Qt::NoModifier);
        QApplication::sendEvent(stripe, &event);
    }
    void click(const QPoint& at)
    {
        send(QEvent::MouseButtonPress, at);
        send(QEvent::MouseButtonRelease, at);
    }
    /// Drags the moving bar until the panel has the height, and does not let go.
    void dragTo(int height, int steps = 4)
    {
        const QPoint press = besideHandle();
        const int from = stripe->height();
        const int y = stripe->mapTo(&view, press).y();
        send(QEvent::MouseButtonPress, press);
        for (int i = 1; i <= steps; ++i) {
            // On top a panel stays a pixel behind the pointer: odd on purpose.
            const int by = (height - from) * i / steps + (top ? 1 : 0);
            const QPoint inView(50, y + (top ? by : -by));
            send(QEvent::MouseMove, stripe->mapFrom(&view, inView));
            last = inView;
        }
    }
    void letGo() { send(QEvent::MouseButtonRelease, stripe->mapFrom(&view, last)); }

    QStringList without(const QStringList& ignored) const
    {
        QStringList result;
        for (const QString& name : recorder.names()) {
            if (!ignored.contains(name)) {
                result << name;
            }
        }
        return result;
    }
    void wait(const char* signal) const
    {
        QTRY_VERIFY_WITH_TIMEOUT(recorder.count(word(signal)) > 0, 5000);
        QCoreApplication::processEvents();
    }

    bool top;
    QWidget view;
    QWidget* contents;
    OpenStripe* stripe;
    zelkovtest::SignalRecorder recorder;
    QPoint last;
};
}

// SPDX-License-Identifier: MIT
// A view with one rubber band, for the tests of the band.
#pragma once

#include "support/Pointer.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "views/RubberBandWidget.h"
#include "ZelkovUtils/LinearCoordinateSystem.h"

#include <QtCore/QPointer>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

#include <limits>

namespace bandscene
{
using vx::RubberBandWidget;

inline QString word(const char* text)
{
    return QString::fromLatin1(text);
}

/// Lets a test call what is protected and see which of the virtual functions were asked.
class OpenBand : public RubberBandWidget
{
public:
    using RubberBandWidget::calcDrag;
    using RubberBandWidget::RubberBandWidget;

    void setContentsGeometry(const QRect& rect) override
    {
        asked << word("setContentsGeometry");
        RubberBandWidget::setContentsGeometry(rect);
    }
    void startDragging(QPoint position, Grip grip) override
    {
        asked << word("startDragging");
        RubberBandWidget::startDragging(position, grip);
    }
    QStringList asked;

protected:
    void drawFrame(QPainter* painter) override
    {
        asked << word("drawFrame");
        RubberBandWidget::drawFrame(painter);
    }
    void drawContents(QPainter* painter) override
    {
        asked << word("drawContents");
        RubberBandWidget::drawContents(painter);
    }
};

/// A view of 500 by 250 pixels that shows 1000 by 500 units, and a band over (100, 50) to (199, 124) pixels.
struct Scene
{
    Scene()
        : system(QRectF(0, 0, 1000, 500), &view)
    {
        view.resize(500, 250);
        view.setFocusPolicy(Qt::StrongFocus);
        view.setFocus();
        band = new OpenBand(&system, &view);
        band->setApplicationGeometry(QRectF(200, 100, 200, 150));
        view.show();
        (void)QTest::qWaitForWindowExposed(&view);
        band->asked.clear();
    }

    void send(QEvent::Type type, const QPoint& inView, Qt::KeyboardModifiers modifiers = Qt::NoModifier,
        Qt::MouseButton button = Qt::LeftButton)
    {
        const bool isMove = type == QEvent::MouseMove;
        const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : button;
        QMouseEvent event(type, band->mapFrom(&view, inView), view.mapToGlobal(inView),
            isMove ? Qt::NoButton : button, buttons, modifiers);
        QApplication::sendEvent(band, &event);
    }

    void drag(const QPoint& from, const QPoint& to, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        send(QEvent::MouseButtonPress, from, modifiers);
        send(QEvent::MouseMove, to, modifiers);
        send(QEvent::MouseButtonRelease, to, modifiers);
    }

    QWidget view;
    vx::LinearCoordinateSystem system;
    OpenBand* band;
};

const QPoint c_Inside(150, 90);
const QPoint c_BottomRight(199, 124);
}

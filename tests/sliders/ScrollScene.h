// SPDX-License-Identifier: MIT
// A scroll area with one overlay bar, for the tests of the bar.
#pragma once

#include "sliders/NicerScrollBar.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QTimer>
#include <QtWidgets/QScrollArea>

/// 300 x 200 without a frame; the content is as large as the test wants it.
class ScrollScene
{
public:
    explicit ScrollScene(Qt::Orientation orientation = Qt::Vertical,
        NicerScrollBar::EPositions position = NicerScrollBar::epAutomatic,
        const QSize& content = QSize(2000, 3000))
    {
        area.setFrameShape(QFrame::NoFrame);
        area.resize(300, 200);
        bar = new NicerScrollBar(&area, orientation, position, &area);
        real = orientation == Qt::Horizontal ? area.horizontalScrollBar() : area.verticalScrollBar();
        auto* widget = new QWidget;
        widget->resize(content);
        area.setWidget(widget);
        area.show();
        settle();
    }

    static void settle()
    {
        for (int i = 0; i < 5; ++i) {
            QCoreApplication::processEvents();
        }
    }

    QTimer* timer() const { return bar->findChild<QTimer*>(QString(), Qt::FindDirectChildrenOnly); }

    /// What the end of the delay brings, without waiting for it.
    void fade() const { QMetaObject::invokeMethod(bar, "fadeBar", Qt::DirectConnection); }

    bool faded() const { return bar->styleSheet().contains(QLatin1String("transparent")); }

    QScrollArea area;
    NicerScrollBar* bar = nullptr;
    QScrollBar* real = nullptr;
};

/// An area that computes no range of its own, with one overlay bar: the test sets the range.
class BareScene
{
public:
    explicit BareScene(Qt::Orientation orientation = Qt::Vertical)
        : bar(new NicerScrollBar(&area, orientation, NicerScrollBar::epAutomatic, &area))
        , real(orientation == Qt::Horizontal ? area.horizontalScrollBar() : area.verticalScrollBar())
    {
        area.resize(300, 200);
        area.show();
        ScrollScene::settle();
    }

    QAbstractScrollArea area;
    NicerScrollBar* bar;
    QScrollBar* real;
};

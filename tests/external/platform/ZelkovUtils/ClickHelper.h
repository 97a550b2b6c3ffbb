// SPDX-License-Identifier: MIT
// Second platform set: a click helper that reports nothing.
#pragma once

#include <QtCore/QPointF>
#include <QtWidgets/QWidget>

namespace vx
{
class ClickHelper : public QObject
{
    Q_OBJECT

public:
    ClickHelper(QWidget* parent, int)
        : QObject(parent)
    {
    }
    void setReceiver(QWidget*) {}
    void setActive(bool) {}

Q_SIGNALS:
    void clicked(const QPointF& position);
    void doubleClicked(const QPointF& position);
};
}

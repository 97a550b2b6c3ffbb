// SPDX-License-Identifier: MIT
// Page "Popovers": balloons that point at targets all around, a modal one, and one that helps with a drag.
#pragma once

#include "../Page.h"
#include "popover/Balloon.h"
#include "popover/Controller.h"

#include <QtCore/QPointer>
#include <QtCore/QVector>

class QCheckBox;
class QComboBox;
class QLabel;
class QPushButton;

namespace gallery
{
class PopoversPage : public Page
{
    Q_OBJECT

public:
    explicit PopoversPage(SignalLog& log, QWidget* parent = nullptr);
    ~PopoversPage() override;

    void rehearse(Hand& hand) override;

private:
    using Balloon = vx::PopoverWidget::Balloon;
    using Controller = vx::PopoverWidget::Controller;

    QWidget* makeTargets();
    QWidget* makeSettings();
    QWidget* makeModal();
    QWidget* makeDragHelp();
    QCheckBox* makeBox(const QString& text, int bit, bool checked);
    static int bitsOf(const QVector<QCheckBox*>& boxes);
    QPointer<Controller> makePopover(QWidget* target, const QString& title, int sides);
    void open(QWidget* target, int sides, int features);
    void askModally();
    void fillTray();

    QVector<QPushButton*> m_targets;
    QVector<QCheckBox*> m_sides;
    QVector<QCheckBox*> m_features;
    QComboBox* m_rows = nullptr;
    QCheckBox* m_grow = nullptr;
    QPushButton* m_ask = nullptr;
    QLabel* m_answer = nullptr;
    QLabel* m_dropped = nullptr;
    QPointer<Controller> m_tray;
    QVector<QPointer<Controller>> m_open;
};
}

// SPDX-License-Identifier: MIT
// Page "Pages and slideshow": NavigationViewController and WidgetSlideshow.
#pragma once

#include <QtCore/QTimer>
#include <QtCore/QVector>

#include "../Page.h"

class QLabel;
class QPushButton;

namespace vx
{
class NavigationViewController;
class WidgetSlideshow;
}

namespace gallery
{
class CameraTile;

class PagesPage : public Page
{
    Q_OBJECT

public:
    explicit PagesPage(SignalLog& log, QWidget* parent = nullptr);

    void rehearse(Hand& hand) override;

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    QWidget* makeAssistant();
    QWidget* makeSlideshow();
    QWidget* makeStep(const QString& title, const QString& text, const QVector<QPair<QString, QString>>& rows);
    void showState();
    void turn(int by);

    vx::NavigationViewController* m_pages = nullptr;
    vx::WidgetSlideshow* m_show = nullptr;
    QPushButton* m_back = nullptr;
    QPushButton* m_forward = nullptr;
    QLabel* m_place = nullptr;
    QVector<CameraTile*> m_cameras;
    QTimer m_frames;
};
}

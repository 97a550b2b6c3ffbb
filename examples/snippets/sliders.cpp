// SPDX-License-Identifier: MIT
// The code of docs/sliders.md.
//! [jump]
#include "sliders/HSlider.h"
#include "sliders/JumpSlider.h"

//! [jump]
//! [bars]
#include "sliders/NicerScrollBar.h"

//! [bars]
#include "Snippets.h"

#include <QtWidgets/QScrollArea>

namespace snippets_sliders
{
class Player : public QObject
{
public:
    void setVolume(int) {}
    void setZoom(int) {}
};
class Client : public QWidget
{
public:
    void build(Player* player)
    {
        //! [jump]
        auto* volume = new vx::JumpSlider(Qt::Horizontal, this);
        volume->setRange(0, 100);
        connect(volume, &QSlider::valueChanged, player, &Player::setVolume);

        auto* zoom = new vx::HSlider(this); // horizontal, whatever a form says
        connect(zoom, &QSlider::valueChanged, player, &Player::setZoom);
        //! [jump]
    }
    void bars()
    {
        //! [bars]
        auto* list = new QScrollArea(this);
        new NicerScrollBar(list, Qt::Vertical, NicerScrollBar::epAutomatic, list);
        new NicerScrollBar(list, Qt::Horizontal, NicerScrollBar::epTop, list);
        //! [bars]
        auto* content = new QWidget;
        content->resize(900, 900);
        list->setWidget(content);
    }
};
}

namespace snippets
{
void sliders()
{
    snippets_sliders::Client client;
    snippets_sliders::Player player;
    client.build(&player);
    client.bars();
    client.show();
    pause();
}
}

// SPDX-License-Identifier: MIT
// The code of docs/mouse-gestures.md.
//! [adapter]
#include "input/MouseAdapter.h"

//! [adapter]
#include "Snippets.h"

#include <QtWidgets/QScrollArea>

namespace snippets_mouse_gestures
{
class Client : public QScrollArea
{
public:
    void select() {}
    void turnPage(int) {}
    void build(QWidget* view, QScrollArea* area)
    {
        //! [adapter]
        auto* mouse = new vx::MouseAdapter(view, false); // false: the view still gets the events
        connect(mouse, &vx::MouseAdapter::clicked, this, [this] { select(); });
        connect(mouse, &vx::MouseAdapter::swiped, this, [this](const vx::MouseGesture::Ptr& gesture) {
            if (gesture->wasSwipe(Qt::Horizontal)) {
                turnPage(gesture->wasSwipe(vx::dLeft) ? 1 : -1);
            }
        });
        connect(mouse, &vx::MouseAdapter::panning, this, [mouse, area](const vx::MouseGesture::Ptr& gesture) {
            mouse->scroll(area, gesture->lastPanOffset());
        });
        //! [adapter]
    }
};
}

namespace snippets
{
void mouse_gestures()
{
    snippets_mouse_gestures::Client client;
    auto* view = new QWidget;
    client.setWidget(view);
    client.build(view, &client);
    client.show();
    pause();
}
}

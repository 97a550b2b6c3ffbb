// SPDX-License-Identifier: MIT
// The code of docs/overlays.md.
//! [overlays]
#include "indicators/BusyOverlayView.h"
#include "indicators/IconOverlayView.h"

//! [overlays]
#include "Snippets.h"

#include <QtWidgets/QWidget>

namespace snippets_overlays
{
class Camera : public QObject
{
    Q_OBJECT
Q_SIGNALS:
    void lost();
    void found();
};
class Client : public QWidget
{
public:
    void build(QWidget* view, Camera* camera)
    {
        //! [overlays]
        auto* busy = new vx::BusyOverlayView(view);
        connect(busy, &vx::BusyOverlayView::updatedLayout, view,
            [=] { busy->move(view->rect().center() - busy->rect().center()); });
        connect(camera, &Camera::lost, busy, [busy] { busy->showBusyOverlay(true); });
        connect(camera, &Camera::found, busy, &vx::BusyOverlayView::hideBusyOverlay);

        vx::IconOverlayView::showIcon(view, "playSign", false);
        vx::IconOverlayView::showText(view, tr("Start of the recording"), "signText", false);
        //! [overlays]
        Q_EMIT camera->lost();
        Q_EMIT camera->found();
    }
};
}

namespace snippets
{
void overlays()
{
    snippets_overlays::Client client;
    snippets_overlays::Camera camera;
    client.resize(400, 300);
    client.show();
    client.build(&client, &camera);
    pause();
}
}

#include "overlays.moc"

// SPDX-License-Identifier: MIT
// The code of docs/rubber-band.md.
//! [band]
#include "ZelkovUtils/LinearCoordinateSystem.h"
#include "views/RubberBandWidget.h"

//! [band]
#include "Snippets.h"

#include <memory>

namespace snippets_rubber_band
{
class Client : public QWidget
{
public:
    void store(const QRectF&) {}
    void build(QWidget* view)
    {
        //! [band]
        m_system = std::make_unique<vx::LinearCoordinateSystem>(QRectF(0, 0, 1920, 1080), view);
        auto* band = new vx::RubberBandWidget(m_system.get(), view);
        band->setLabel(tr("Gate"));
        band->setColors(Qt::yellow, 0.2F);
        band->setApplicationGeometry(QRectF(300, 330, 520, 420));
        connect(band, &vx::RubberBandWidget::endDrag, this, [this](vx::RubberBandWidget* edited) {
            store(edited->applicationGeometry());
        });
        connect(band, &vx::RubberBandWidget::closeClicked, band, &QObject::deleteLater); // the button does nothing else
        //! [band]
        band->show();
    }
    std::unique_ptr<vx::CoordinateSystem> m_system;
};
}

namespace snippets
{
void rubber_band()
{
    snippets_rubber_band::Client client;
    auto* view = new QWidget(&client);
    view->resize(640, 360);
    client.resize(640, 360);
    client.build(view);
    client.show();
    pause();
    delete view; // the band goes before what it converts with
}
}

// SPDX-License-Identifier: MIT
// The code of docs/zoom-area.md.
//! [area]
#include "views/ZoomScrollArea.h"

//! [area]
#include "Snippets.h"

#include <QtWidgets/QVBoxLayout>

namespace snippets_zoom_area
{
class Client : public QWidget
{
public:
    void build(QWidget* picture)
    {
        m_picture = picture;
        //! [area]
        auto* area = new ZoomScrollArea;
        area->setWidget(picture);
        connect(area, &ZoomScrollArea::updateZoomFactor, this, [this](double factor) {
            m_scale *= 1.0 + 0.035 * factor; // -1 out, 0 still, 1 in
            m_picture->resize(m_original * m_scale);
        });
        //! [area]
        (new QVBoxLayout(this))->addWidget(area);
    }

private:
    QWidget* m_picture = nullptr;
    QSize m_original{640, 480};
    double m_scale = 1.0;
};
}

namespace snippets
{
void zoom_area()
{
    snippets_zoom_area::Client client;
    client.build(new QWidget);
    client.show();
    pause();
}
}

// SPDX-License-Identifier: MIT
// The code of docs/labels.md.
//! [labels]
#include "indicators/ElidedButton.h"
#include "indicators/ElidedLabel.h"
#include "indicators/Label.h"

//! [labels]
#include "Snippets.h"

#include <QtWidgets/QVBoxLayout>

namespace snippets_labels
{
class Client : public QWidget
{
public:
    void build(const QPixmap& snapshot, const QString& cameraName)
    {
        //! [labels]
        auto* preview = new vx::Label(this);
        preview->setScaledContents(true); // covers the label, cut where it overhangs
        preview->setPixmap(snapshot);

        auto* name = new vx::ElidedLabel(cameraName, this);
        name->setElideMode(Qt::ElideMiddle);
        name->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred); // may become narrower than its text

        auto* open = new ElidedButton(tr("Open the recording of %1").arg(cameraName), this);
        open->setElideMode(Qt::ElideRight);
        //! [labels]
        auto* layout = new QVBoxLayout(this);
        layout->addWidget(preview);
        layout->addWidget(name);
        layout->addWidget(open);
    }
};
}

namespace snippets
{
void labels()
{
    snippets_labels::Client client;
    QPixmap picture(64, 48);
    picture.fill(Qt::blue);
    client.build(picture, "A camera at the far end of the yard");
    client.resize(100, 200);
    client.show();
    pause();
}
}

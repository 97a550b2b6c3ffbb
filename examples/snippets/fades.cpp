// SPDX-License-Identifier: MIT
// The code of docs/fades.md.
//! [hint]
#include "foundation/FadableThing.h"

//! [hint]
//! [pulse]
#include "foundation/TFadingWidget.h"

//! [pulse]
#include "Snippets.h"

#include <QtWidgets/QVBoxLayout>

namespace snippets_fades
{
//! [hint]
class Hint : public FadableThing<QWidget>
{
    Q_OBJECT // without it the style sheet paints the background at full strength
public:
    using FadableThing::FadableThing;
};

//! [hint]
class Client : public QWidget
{
public:
    void build(QWidget* view, QWidget* panel, QWidget* bar, const QIcon& bell)
    {
        //! [hint]
        auto* hint = new Hint(view);
        hint->setStyleSheet("Hint { background: #2c6ede; border-radius: 10px; }");
        hint->hide();
        connect(hint->fader(), &OpacityAnimation::didFadeOut, hint, &QObject::deleteLater);
        hint->fader()->fadeIn();
        //! [hint]

        //! [children]
        auto* fader = new OpacityAnimation(panel); // belongs to the panel
        fader->setFadeChildren(true);
        fader->fadeOut();
        //! [children]

        //! [pulse]
        // every 100 ms a step of 16, between the alphas 0 and 128; no shadow
        auto* alarm = new vx::TFadingWidget<QToolButton>(bar, 100, 16, QColor(228, 52, 52), 0, 128, false);
        alarm->setIcon(bell);
        alarm->startFading();
        alarm->badge().setBadgeLabel("3", false);
        alarm->setOverlay(":/pictures/muted.png", Qt::AlignBottom | Qt::AlignLeft, QPoint());
        //! [pulse]
    }
};
}

namespace snippets
{
void fades()
{
    snippets_fades::Client client;
    auto* layout = new QVBoxLayout(&client);
    for (int i = 0; i < 3; ++i) {
        layout->addWidget(new QWidget);
    }
    QPixmap picture(16, 16);
    picture.fill(Qt::red);
    client.resize(200, 200);
    client.show();
    client.build(layout->itemAt(0)->widget(), layout->itemAt(1)->widget(), layout->itemAt(2)->widget(), picture);
    pause();
}
}

#include "fades.moc"

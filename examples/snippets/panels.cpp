// SPDX-License-Identifier: MIT
// The code of docs/panels.md.
//! [panel]
#include "views/FadeView.h"

//! [panel]
//! [stripe]
#include "sliders/MultiNubsieSlider.h"
#include "views/FadeStripeView.h"

//! [stripe]
//! [pages]
#include "views/NavigationViewController.h"
#include "views/WidgetSlideshow.h"

//! [pages]
#include "Snippets.h"

#include <QtCore/QMimeData>
#include <QtCore/QPointer>
#include <QtWidgets/QListWidget>

namespace snippets_panels
{
class Thumbnails : public QWidget
{
public:
    void setRowHeight(int height) { m_height = height; }
    int m_height = 0;
};
class View : public QWidget
{
public:
    void loadThumbnails() {}
    void refresh(QWidget*) {}
    void addCamera(QPointer<QObject>, const QMimeData&, int) {}
    void build(QWidget* view)
    {
        //! [panel]
        auto* panel = new FadeView(FadeView::ePositionTop, nullptr, view);
        panel->setFadeStripeAsPartOfLayout(false); // lies over the view and places itself
        panel->setSizeHint(15, true);              // closed
        panel->show();
        connect(panel, &FadeView::fadingInFinished, this, [this] { loadThumbnails(); });

        panel->fadein(true, false, 120);           // opens to 120 pixels in 300 ms
        panel->fadeout();                          // and shuts
        //! [panel]
        m_panel = panel;
    }
    void buildStripe(QWidget* view, Thumbnails* thumbnails)
    {
        //! [stripe]
        auto* stripe = new FadeStripeView(FadeView::ePositionBottom, thumbnails, view);
        stripe->setFadeStripeAsPartOfLayout(false);
        stripe->setContentsHeight(100); // heights to snap to: 15, 130, 230
        stripe->setStyleDefault();      // names for the style sheet: #header, #footer, #grab
        stripe->setRows(0);
        stripe->slider()->addNubsie("time", 0, 0, 86400, 1);
        connect(stripe, &FadeStripeView::sizeChanged, thumbnails, [=](int height) { thumbnails->setRowHeight(height); });
        stripe->addAcceptedMimeType("application/camera");
        connect(stripe, &FadeStripeView::dragAccepted, this, &View::addCamera);
        //! [stripe]
    }
    void buildPages(QWidget* first, QWidget* second, QWidget* a, QWidget* b)
    {
        //! [pages]
        auto* pages = new vx::NavigationViewController(350, QEasingCurve::OutCubic);
        connect(pages, &vx::NavigationViewController::viewWillAppear, this, [this](QWidget* page) { refresh(page); });
        pages->addWidget(first);  // viewWillAppear, viewDidAppear
        pages->addWidget(second); // nothing
        pages->setCurrentIndexWithAnimation(1);

        auto* show = new vx::WidgetSlideshow({a, b}); // turns every five seconds
        //! [pages]
        pages->setParent(this);
        show->setParent(this);
    }

protected:
    //! [resize]
    // a panel does not watch its parent
    void resizeEvent(QResizeEvent*) override
    {
        if (m_panel) {
            m_panel->resize();
        }
    }
    //! [resize]

private:
    FadeView* m_panel = nullptr;
};
}

namespace snippets
{
void panels()
{
    snippets_panels::View client;
    client.resize(500, 400);
    client.show();
    client.build(&client);
    client.buildStripe(&client, new snippets_panels::Thumbnails);
    client.buildPages(new QWidget, new QWidget, new QWidget, new QWidget);
    client.resize(520, 410);
    pause();
}
}

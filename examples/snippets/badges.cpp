// SPDX-License-Identifier: MIT
// The code of docs/badges.md.
//! [widget]
#include "indicators/BadgeWidget.h"

//! [widget]
#include "Snippets.h"

#include <QtGui/QPainter>
#include <QtWidgets/QVBoxLayout>

namespace snippets_badges
{
class Client : public QWidget
{
public:
    void build(QVBoxLayout* layout)
    {
        //! [widget]
        auto* spinner = new vx::BadgeWidget(this);
        spinner->setBadgeSize(QSize(32, 32));
        spinner->setBusyBadgeType(vx::BadgeDrawer::ebbtSpokes);
        spinner->setAlignment(Qt::AlignCenter);
        layout->addWidget(spinner);
        spinner->setBadgeBusy(true); // turns while it is visible

        auto* count = new vx::BadgeWidget(this);
        count->setBadgeLabel("12");
        //! [widget]
        layout->addWidget(count);
    }
};

//! [drawer]
class CameraView : public QWidget
{
public:
    using QWidget::QWidget;
    void setAlarms(int count) { m_badge.setBadgeLabel(QString::number(count), false); }

protected:
    void paintEvent(QPaintEvent*) override
    {
        QPainter painter(this);
        painter.fillRect(rect(), Qt::darkGray);
        m_badge.drawBadge(painter, Qt::AlignTop | Qt::AlignRight);
    }

private:
    vx::BadgeDrawer m_badge{this, this}; // parent and host
};
//! [drawer]
}

namespace snippets
{
void badges()
{
    snippets_badges::Client client;
    client.build(new QVBoxLayout(&client));
    auto* view = new snippets_badges::CameraView(&client);
    view->setAlarms(3);
    client.layout()->addWidget(view);
    client.resize(300, 300);
    client.show();
    pause();
}
}

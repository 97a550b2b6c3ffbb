// SPDX-License-Identifier: MIT
// The code of docs/popovers.md.
//! [row]
#include "popover/Item.h"

//! [row]
//! [content]
#include "popover/HeaderContainer.h"

//! [content]
//! [value]
#include "popover/PopoverBalloonWidget.h"

//! [value]
//! [popover]
#include "popover/Manager.h"

//! [popover]
#include "Snippets.h"

#include <QtGui/QMouseEvent>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>

namespace snippets_popovers
{
//! [row]
class CameraRow : public vx::PopoverWidget::Item
{
public:
    CameraRow(int id, const QString& name, const QString& state)
        : Item(nullptr, vx::PopoverWidget::eifText | vx::PopoverWidget::eifAdditionalText, id, "camera", name, state)
    {
    }

protected:
    void mouseReleaseEvent(QMouseEvent* event) override
    {
        if (!isProtected() && rect().contains(event->pos()) && event->button() == Qt::LeftButton) {
            emit itemPerformed(id(), value(), userData(), getItemPerformedFlag(event->pos(), event->button()));
        }
    }
};
//! [row]

//! [value]
class Dial : public QWidget
{
public:
    Dial()
    {
        m_balloon.setBalloonTextMap({{vx::ValueRange(0, 9), tr("wide")}, {vx::ValueRange(10, 100), tr("near")}});
    }
    void turned(int value) { m_balloon.updateBalloon(value, 0, 100); }

private:
    vx::PopoverBalloonWidget m_balloon{this, QString(), 40, tr("Zoom")};
};
//! [value]

class Client : public QWidget
{
public:
    void open(int id) { qDebug("opening %d", id); }
    vx::PopoverWidget::Container* build()
    {
        //! [content]
        auto* content = new vx::PopoverWidget::Container(nullptr, "cameras", Qt::Vertical, Qt::AlignTop);
        auto* header = new vx::PopoverWidget::HeaderContainer(nullptr, "head", Qt::Horizontal, Qt::AlignLeft);
        header->addWidgetItem(new QLineEdit, "search", 1);
        content->addHeader(header);
        content->addItem(new CameraRow(10, "Gate", "live"));
        content->addItem(new CameraRow(11, "Yard", "off"), vx::PopoverWidget::ecfDismiss);
        content->addStretch(1);
        connect(content, &vx::PopoverWidget::Container::itemPerformed, this, &Client::open);
        content->setItemText(10, "Main gate", true);
        //! [content]
        return content;
    }
    void busy(vx::PopoverWidget::Item* row)
    {
        //! [busy]
        row->setBusy(true, true);        // a spinner in place of the last element
        row->setBusyText("12", false);   // or a count beside it
        row->setBusy(false, true);
        //! [busy]
    }
    void show(vx::PopoverWidget::Container* content, QPushButton* button)
    {
        QWidget* const window = this;
        //! [popover]
        using namespace vx::PopoverWidget;

        Manager::init(1000); // once, at the start of the application

        auto popover = Manager::instance()->createController(7, false, false, window, button, tr("Cameras"), "cameras",
            Balloon::eadTop | Balloon::eadBottom, QSizeF(), {});
        popover->setContainer(content, Balloon::ebfTitle | Balloon::ebfClose);
        connect(popover, &Controller::itemPerformed, this, &Client::open);
        popover->setActive();
        //! [popover]
        pause(popover, button, button, 10);
    }
    void pause(vx::PopoverWidget::Controller* controller, QWidget* button, QWidget* slider, qreal handleX)
    {
        using vx::PopoverWidget::Balloon;
        //! [balloon]
        Balloon* balloon = controller->balloon();
        balloon->setForWidget(button, QPointF(-1, 0));        // the middle of the edge
        balloon->setForWidget(slider, QPointF(handleX, 0));   // this x, the edge's y
        balloon->setForRect(QRect(40, 60, 120, 30));          // a rectangle; wins while it is valid
        balloon->setPreferredArrowDirections(Balloon::eadLeft | Balloon::eadRight);
        balloon->setMargins(12, 40, 12, 12);                  // keep off the edges of the window
        //! [balloon]
    }
};
}

namespace snippets
{
void popovers()
{
    vx::PopoverWidget::Manager::init(1000); // values in balloons need it
    snippets_popovers::Client client;
    client.resize(600, 400);
    auto* button = new QPushButton(&client);
    static_cast<QWidget&>(client).show();
    auto* content = client.build();
    client.busy(content->getItem(10));
    client.show(content, button);
    auto* dial = new snippets_popovers::Dial;
    dial->setParent(&client);
    dial->show();
    dial->turned(5);
    pause();
}
}

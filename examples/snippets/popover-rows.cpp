// SPDX-License-Identifier: MIT
// The code of docs/popover-rows.md.
//! [rows]
#include "popover/Controller.h"
#include "popover/items/PushItem.h"
#include "popover/items/iOSCheckItem.h"

//! [rows]
#include "Snippets.h"

#include <QtCore/QDebug>

#include "popover/Container.h"
#include "popover/Manager.h"

namespace snippets_popover_rows
{
enum
{
    IdRecording,
    IdDelete
};

class Window : public QWidget
{
public:
    void onPerformed(int id, const QVariant& value) { qDebug() << id << value; }
    void build(vx::PopoverWidget::Controller* controller, const QVariant& defaultValue)
    {
        //! [rows]
        namespace rows = vx::PopoverWidget;

        auto* content = new rows::Container(nullptr, "camera", Qt::Vertical, Qt::AlignTop);
        content->addItem(new rows::iOSCheckItem(tr("Recording"), "recording", IdRecording, true,
            rows::eifText | rows::eifControl, nullptr));
        content->addItem(new rows::PushItem(tr("Delete..."), QString(), "delete", IdDelete, rows::eifText, nullptr));
        controller->setContainer(content, rows::Balloon::ebfTitle);
        connect(controller, &rows::Controller::itemPerformed, this, &Window::onPerformed);

        content->setItemValue(IdRecording, false, false); // performs nothing
        //! [rows]
        rows::Item* row = content->getItem(IdRecording);
        //! [reset]
        row->setResetPopover(tr("Set back"));
        connect(row, &rows::Item::resetContextMenuPerformed, this, [=] { row->setValue(defaultValue); });
        //! [reset]
    }
};
}

namespace snippets
{
void popover_rows()
{
    using namespace vx::PopoverWidget;
    Manager::init(1000);
    snippets_popover_rows::Window window;
    window.resize(600, 400);
    window.show();
    auto popover = Manager::instance()->createController(
        0, false, false, &window, "Camera", "camera", QSizeF(), Balloon::ESizeConstraint());
    window.build(popover, false);
    popover->setActive();
    pause();
}
}

// SPDX-License-Identifier: MIT
// The code of docs/dial-and-joystick.md.
//! [dial]
#include "controls/DialButton.h"
#include "controls/JoystickViewWidget.h"
#include "popover/Manager.h"

//! [dial]
#include "Snippets.h"

#include <QtWidgets/QVBoxLayout>

namespace snippets_dial_and_joystick
{
class Client : public QWidget
{
public:
    vx::DialButton* build()
    {
        //! [dial]
        vx::PopoverWidget::Manager::init(1000); // once: the balloons need it

        auto* pan = new vx::DialButton(0, this); // 0 is where it springs back to
        pan->setRange(-100, 100);
        pan->setValue(0);
        pan->setReboundEnabled(true);
        auto* stick = new JoystickViewWidget(this);
        connect(pan, &QDial::valueChanged, stick, [=](int value) { stick->setPointPosition(float(value) / 100, 0); });
        //! [dial]
        return pan;
    }
};
}

namespace snippets
{
void dial_and_joystick()
{
    snippets_dial_and_joystick::Client client;
    vx::DialButton* pan = client.build();
    client.show();
    pan->setValue(50);
    pause();
}
}

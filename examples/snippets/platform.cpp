// SPDX-License-Identifier: MIT
// The code of docs/platform.md.
//! [connect]
#include "CoreQt/Connect.h"
#include "CoreQt/QtSlot.h"

//! [connect]
//! [log]
#include "Core/Log.h"

//! [log]
//! [clicks]
#include "ZelkovUtils/ClickHelper.h"

//! [clicks]
//! [rights]
#include "ZelkovUtils/ISecurityManager.h"

//! [rights]
//! [system]
#include "ZelkovUtils/LinearCoordinateSystem.h"

//! [system]
//! [texts]
#include "ZelkovUtils/ReloadStyleSheet.h"
#include "ZelkovUtils/TimeUtils.h"

//! [texts]
#include "Snippets.h"

#include "input/CustomClickAdapter.h"

#include <QtCore/QTimer>
#include <QtWidgets/QLabel>

#include <memory>
#include <sstream>

namespace snippets_platform
{
//! [rights]
class Rights : public vx::ISecurityManager
{
public:
    bool isRightRefused(const QString& right, bool, bool, bool) override { return right != "record"; }
    bool isAdministrator(bool, bool) override { return false; }
};
//! [rights]

class Player : public QObject
{
    Q_OBJECT
public Q_SLOTS:
    void refresh() {}
    void seekTo(int second) { m_second = second; }

public:
    void build(QTimer* timer)
    {
        //! [connect]
        vx::connect(timer, "2timeout()", this, "1refresh()"); // false, and not a word, where that does not fit

        vx::QtSlot slot(this, "seekTo"); // what to call when something happens
        int second = 43200;
        slot.setParameter(0, Q_ARG(int, second)); // copied
        QMetaObject::invokeMethod(slot.receiver(), slot.slotName(), slot.connectionType(), slot.parameter(0));
        //! [connect]
    }
    int m_second = 0;
};

class Client : public QWidget
{
public:
    void open(const QPointF&) {}
    void log(std::wostream& stream)
    {
        //! [log]
        vx::Log::setStream(vx::Log::elFault, &stream); // not owned
        vx::Log::setLogLevel(vx::Log::elFault);        // this one and the graver ones
        //! [log]
        vx::Log::setStream(vx::Log::elFault, nullptr);
    }
    void build(QWidget* view)
    {
        //! [clicks]
        auto* clicks = new vx::ClickHelper(view, vx::ClickHelper::efClick | vx::ClickHelper::efDoubleClick);
        connect(clicks, &vx::ClickHelper::doubleClicked, this, &Client::open);
        clicks->setReceiver(view);
        clicks->setActive(true);
        //! [clicks]
    }
    void rights()
    {
        //! [rights]

        vx::CustomClickAdapter::setSecurityManager(std::make_shared<Rights>()); // click buttons ask here
        //! [rights]
        vx::CustomClickAdapter::setSecurityManager(nullptr);
    }
    void map(QWidget* view)
    {
        //! [system]
        vx::LinearCoordinateSystem system(QRectF(0, 0, 1920, 1080), view); // the picture fills the view
        QRectF region(480, 270, 960, 540);
        const QRect pixels = system.mapToScreen(region);
        system.setRight(region, pixels.right() + 10); // ten pixels wider, in the picture's own units
        //! [system]
    }
    void texts(QLabel* label, qint64 seconds)
    {
        //! [texts]
        label->setText(TimeUtils::formatTimeUserFriendly(seconds)); // "3 min 20 s"
        vx::reloadStyleSheet(label, "outage");                      // now rules for #outage hold
        //! [texts]
    }
};
}

namespace snippets
{
void platform()
{
    snippets_platform::Client client;
    client.resize(320, 180);
    client.build(&client);
    std::wostringstream stream;
    client.log(stream);
    client.rights();
    client.map(&client);
    QLabel label(&client);
    client.texts(&label, 200);
    Q_ASSERT(label.text() == "3 min 20 s");
    snippets_platform::Player player;
    QTimer timer;
    player.build(&timer);
    Q_ASSERT(player.m_second == 43200);
    client.show();
    pause();
}
}

#include "platform.moc"

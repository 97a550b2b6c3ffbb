// SPDX-License-Identifier: MIT
// The camera client in the gallery.
#include "ClientPage.h"

#include <QtWidgets/QFrame>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QToolButton>
#include <QtWidgets/QVBoxLayout>

#include "../Hand.h"
#include "../client/ClientWindow.h"
#include "../client/Desk.h"
#include "../client/Fleet.h"
#include "../client/LiveWall.h"
#include "../client/RecordStripes.h"
#include "../client/Session.h"

namespace gallery
{
namespace
{
QPoint middleOf(const QWidget* widget)
{
    return widget->rect().center();
}
}

ClientPage::ClientPage(SignalLog& log, QWidget* parent)
    : Page(log, parent)
    , m_client(new client::ClientWindow)
{
    watch(m_client, QStringLiteral("client"));
    watch(&m_client->session(), QStringLiteral("session"));
    watch(&m_client->fleet(), QStringLiteral("fleet"));
    watch(&m_client->desk().wall(), QStringLiteral("wall"), {QStringLiteral("frameRateChanged")});
    watch(&m_client->desk().stripes(), QStringLiteral("stripes"), {QStringLiteral("timeChosen")});
    connect(m_client, &client::ClientWindow::themeWanted, this, &Page::themeWanted);
    connect(m_client, &client::ClientWindow::languageWanted, this, &Page::languageWanted);

    // In a window that is too small the client scrolls as a whole.
    auto* scroll = new QScrollArea;
    scroll->setObjectName(QStringLiteral("clientFrame"));
    scroll->setWidgetResizable(true);
    scroll->setWidget(m_client);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(scroll);
}

void ClientPage::rehearse(Hand& hand)
{
    m_client->logOut();
    hand.wait(500);
    auto* const user = m_client->findChild<QLineEdit*>(QStringLiteral("userEdit"));
    auto* const password = m_client->findChild<QLineEdit*>(QStringLiteral("passwordEdit"));
    hand.call(user, [user, password] {
        user->setText(QStringLiteral("admin"));
        password->setText(QStringLiteral("camera2!"));
    });
    auto* const logIn = m_client->findChild<QWidget*>(QStringLiteral("logInButton"));
    hand.click(logIn, middleOf(logIn)).wait(600);
    hand.call(m_client, [this] { m_client->desk().setViewCount(16); });
    hand.wait(500);
    auto* const settings = m_client->findChild<QWidget*>(QStringLiteral("settingsButton"));
    hand.click(settings, QPoint(12, 12)).wait(300);
}
}

// SPDX-License-Identifier: MIT
// The whole client.
#include "ClientWindow.h"

#include "Desk.h"
#include "Fleet.h"
#include "LoginPanel.h"
#include "PasswordPanel.h"
#include "Session.h"
#include "views/NavigationViewController.h"

#include <QtWidgets/QVBoxLayout>

// Must stand outside any namespace, or a static library does not link.
static void initClientResource()
{
    Q_INIT_RESOURCE(client);
}

namespace client
{
namespace
{
constexpr int c_pageMs = 350;
}

ClientWindow::ClientWindow(QWidget* parent)
    : QWidget(parent)
    , m_fleet(new Fleet(this))
    , m_session(new Session(this))
    , m_pages(new vx::NavigationViewController(c_pageMs, QEasingCurve::OutCubic))
    , m_login(new LoginPanel(*m_session))
    , m_password(new PasswordPanel(*m_session))
    , m_desk(new Desk(*m_fleet, *m_session))
{
    setObjectName(QStringLiteral("clientWindow"));
    m_pages->setObjectName(QStringLiteral("clientPages"));
    m_pages->addWidget(m_login);
    m_pages->addWidget(m_password);
    m_pages->addWidget(m_desk);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_pages);

    connect(m_pages, &vx::NavigationViewController::viewDidAppear, this, [this](QWidget* page) {
        if (page == m_desk) {
            m_desk->enter();
        }
    });
    const auto toPassword = [this] {
        m_desk->leave();
        m_password->clear();
        slideTo(m_password);
    };
    const auto toDesk = [this] { slideTo(m_desk); };
    connect(m_login, &LoginPanel::loggedIn, this, toDesk);
    connect(m_login, &LoginPanel::newPasswordWanted, this, toPassword);
    connect(m_password, &PasswordPanel::saved, this, toDesk);
    connect(m_password, &PasswordPanel::cancelled, this, toDesk);
    connect(m_desk, &Desk::newPasswordWanted, this, toPassword);
    connect(m_desk, &Desk::logOutWanted, this, &ClientWindow::logOut);
    connect(m_desk, &Desk::themeWanted, this, &ClientWindow::themeWanted);
    connect(m_desk, &Desk::languageWanted, this, &ClientWindow::languageWanted);
}

ClientWindow::~ClientWindow()
{
    // Before the session and the fleet that they refer to.
    delete m_pages;
}

void ClientWindow::logOut()
{
    m_desk->leave();
    m_session->logOut();
    m_login->clear();
    slideTo(m_login);
}

void ClientWindow::initCatalogues()
{
    initClientResource();
}

void ClientWindow::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    // Others may have asked for rights while this was away.
    m_session->takeOver();
}

void ClientWindow::slideTo(QWidget* page)
{
    const int index = m_pages->indexOf(page);
    if (m_pages->animatedWidget() != page) {
        m_pages->setCurrentIndexWithAnimation(index);
    }
}
}

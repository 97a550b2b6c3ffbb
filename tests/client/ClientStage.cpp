// SPDX-License-Identifier: MIT
// The whole client in a window of its own.
#include "client/ClientStage.h"

#include "client/Desk.h"
#include "client/DeviceList.h"
#include "client/DeviceRow.h"
#include "client/Fleet.h"
#include "client/LiveWall.h"
#include "client/RecordStripes.h"
#include "client/RecordTimeLine.h"
#include "client/TimeTrack.h"
#include "sliders/MultiNubsieSlider.h"
#include "theme/Theme.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QLocale>
#include <QtCore/QTimer>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QVBoxLayout>

namespace zelkovtest
{
namespace
{
constexpr int s_patience = 8000; // milliseconds
constexpr int s_still = 80;

QtMessageHandler s_next = nullptr;

// Qt's remark on the grey of overlay scroll bars, whose alpha it takes all the same.
void dropRemark(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (!message.contains(QLatin1String("Specified color without alpha value but alpha given"))) {
        s_next(type, context, message);
    }
}
}

ClientStage::ClientStage(const QSize& size)
{
    s_next = qInstallMessageHandler(dropRemark);
    client::ClientWindow::initCatalogues();
    applyTheme(QStringLiteral("light"));
    m_client = new client::ClientWindow;
    auto* layout = new QVBoxLayout(&m_window);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_client);
    connect(m_client, &client::ClientWindow::themeWanted, this, [this](const QString& name) {
        themes << name;
        applyTheme(name);
    });
    connect(m_client, &client::ClientWindow::languageWanted, this, [this](const QString& language) {
        languages << language;
        applyLanguage(language);
    });
    m_window.resize(size);
    m_window.show();
    QVERIFY(QTest::qWaitForWindowActive(&m_window));
}

ClientStage::~ClientStage()
{
    delete m_client.data();
    QCoreApplication::removeTranslator(&m_translator);
    QLocale::setDefault(QLocale::c());
    zelkov::theme::apply(*qApp, zelkov::theme::Name::None);
    qInstallMessageHandler(s_next);
}

void ClientStage::applyTheme(const QString& name)
{
    zelkov::theme::apply(
        *qApp, name == QLatin1String("dark") ? zelkov::theme::Name::Dark : zelkov::theme::Name::Light);
}

void ClientStage::applyLanguage(const QString& language)
{
    QLocale::setDefault(QLocale(language));
    QCoreApplication::removeTranslator(&m_translator);
    if (m_translator.load(QStringLiteral(":/client/client_%1.qm").arg(language))) {
        QCoreApplication::installTranslator(&m_translator);
    }
}

client::LiveWall& ClientStage::wall() const
{
    return m_client->desk().wall();
}

client::RecordStripes& ClientStage::stripes() const
{
    return m_client->desk().stripes();
}

client::TimeTrack* ClientStage::track() const
{
    return stripes().timeLine()->track();
}

client::DeviceList* ClientStage::devices() const
{
    return m_window.findChild<client::DeviceList*>(QStringLiteral("deviceList"));
}

QVector<int> ClientStage::shownDevices() const
{
    QVector<int> ids;
    for (int row = 0; row < devices()->count(); ++row) {
        if (!devices()->isRowHidden(row)) {
            ids << devices()->deviceAt(row)->id();
        }
    }
    return ids;
}

QVector<int> ClientStage::fleetOrder() const
{
    QVector<int> ids;
    for (const client::Camera& camera : m_client->fleet().cameras()) {
        ids << camera.id;
    }
    return ids;
}

QWidget* ClientStage::waitFor(const char* name, const std::function<QWidget*()>& find,
    const std::function<QPoint(const QWidget*)>& where)
{
    QWidget* result = nullptr;
    QRect last;
    QElapsedTimer still;
    QString found = QStringLiteral("nothing");
    const bool isThere = QTest::qWaitFor(
        [&] {
            result = find();
            if (!result) {
                still.invalidate();
                return false;
            }
            const QRect now(result->mapTo(&m_window, QPoint()), result->size());
            if (!still.isValid() || now != last) {
                last = now;
                still.start();
                return false;
            }
            const QPoint at = result->mapTo(&m_window, where ? where(result) : middleOf(result));
            const QWidget* const hit = m_window.childAt(at);
            found = hit ? QString::fromLatin1(hit->metaObject()->className()) + QLatin1Char(' ') + hit->objectName()
                        : QStringLiteral("nothing");
            return still.elapsed() > s_still && hit && (hit == result || result->isAncestorOf(hit));
        },
        s_patience);
    if (!isThere) {
        qInfo("%s: %s; there is %s", name, result ? "covered or never still" : "not to be seen", qPrintable(found));
        return nullptr;
    }
    return result;
}

bool ClientStage::gone(const char* name)
{
    return QTest::qWaitFor([this, name] { return !seen(name); }, s_patience);
}

QPoint ClientStage::handleOf(vx::MultiNubsieSlider* slider)
{
    QPoint result;
    const QPointer<vx::MultiNubsieSlider> alive(slider);
    QRect last;
    const bool isThere = QTest::qWaitFor(
        [&] {
            QWidget* const handle
                = alive && !alive->getNubsies().isEmpty() ? alive->getNubsies().constFirst().data() : nullptr;
            if (!handle || !handle->isVisible()) {
                return false;
            }
            const QRect now = handle->geometry();
            const bool isStill = now == last;
            last = now;
            result = now.center();
            return isStill;
        },
        s_patience);
    return isThere ? result : QPoint();
}

void ClientStage::whenSeen(const char* name, const std::function<void()>& action)
{
    auto* const timer = new QTimer(this);
    timer->setInterval(50);
    const QByteArray wanted(name);
    connect(timer, &QTimer::timeout, timer, [this, timer, wanted, action, last = QRect()]() mutable {
        const QWidget* const widget = seen(wanted.constData());
        const QRect now = widget ? QRect(widget->mapTo(&m_window, QPoint()), widget->size()) : QRect();
        if (now.isValid() && now == last) {
            timer->stop();
            timer->deleteLater();
            // A timer is deaf while its own slot runs a loop.
            QTimer::singleShot(0, this, action);
        }
        last = now;
    });
    timer->start();
}
}

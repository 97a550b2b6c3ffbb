// SPDX-License-Identifier: MIT
// The devices of the client: searched, renamed, deleted, and seen as a wall of thumbnails.
#include "client/DevicePanel.h"
#include "client/DeviceList.h"
#include "client/DeviceRow.h"
#include "client/Fleet.h"
#include "client/FleetModel.h"
#include "client/Session.h"
#include "client/ThumbnailModel.h"
#include "client/ThumbnailWall.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "support/Pointer.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QTranslator>
#include <QtGui/QImage>
#include <QtTest/QtTest>
#include <QtTest/qtestspontaneevent.h>
#include <QtWidgets/QApplication>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QTableView>
#include <QtWidgets/QVBoxLayout>

#include <memory>

static void initClientResource()
{
    Q_INIT_RESOURCE(client);
}

namespace
{
using client::Camera;
using client::DeviceList;
using client::DevicePanel;
using client::DeviceRow;
using client::Fleet;
using client::FleetModel;
using client::Session;
using client::ThumbnailModel;
using client::ThumbnailWall;

template <typename T>
T* find(const QWidget* root, const char* name)
{
    return root->findChild<T*>(QLatin1String(name));
}

// The panel in a window of its own, an administrator in front of it.
struct Desk
{
    Session session;
    Fleet fleet;
    QWidget window;
    DevicePanel* panel;

    explicit Desk(bool administrator = true)
    {
        session.logIn(administrator ? QStringLiteral("admin") : QStringLiteral("user"),
            administrator ? QStringLiteral("camera2!") : QStringLiteral("camera1!"));
        window.resize(320, 420);
        panel = new DevicePanel(fleet, session);
        auto* layout = new QVBoxLayout(&window);
        layout->addWidget(panel);
        window.show();
        QVERIFY(QTest::qWaitForWindowActive(&window));
    }

    DeviceList* list() const { return find<DeviceList>(panel, "deviceList"); }
    QLineEdit* search() const { return find<QLineEdit>(panel, "deviceSearch"); }
    QPushButton* edit() const { return find<QPushButton>(panel, "deviceEditButton"); }
    QString count() const { return find<QLabel>(panel, "deviceCount")->text(); }
    QWidget* row(int id) const { return list()->itemWidget(list()->device(id)); }
    QLineEdit* field(int id) const { return find<QLineEdit>(row(id), "deviceNameEdit"); }
    QString shownName(int id) const { return find<QLabel>(row(id), "deviceName")->text(); }

    QVector<int> shown() const
    {
        QVector<int> ids;
        for (int i = 0; i < list()->count(); ++i) {
            if (!list()->isRowHidden(i)) {
                ids << list()->deviceAt(i)->id();
            }
        }
        return ids;
    }

    QVector<int> order() const
    {
        QVector<int> ids;
        for (int i = 0; i < list()->count(); ++i) {
            ids << (list()->deviceAt(i) ? list()->deviceAt(i)->id() : -1);
        }
        return ids;
    }

    QVector<int> fleetOrder() const
    {
        QVector<int> ids;
        for (const Camera& camera : fleet.cameras()) {
            ids << camera.id;
        }
        return ids;
    }

    void click(QWidget* widget, const QPoint& at) { zelkovtest::Pointer(widget).click(at); }
    void click(QWidget* widget) { click(widget, widget->rect().center()); }
};

struct Wall
{
    Fleet fleet;
    QWidget window;
    ThumbnailWall* wall;

    explicit Wall(int width = 780)
    {
        window.resize(width, 420);
        wall = new ThumbnailWall(fleet, &window);
        wall->resize(window.size());
        window.show();
        QVERIFY(QTest::qWaitForWindowActive(&window));
    }

    QTableView* table() const { return find<QTableView>(wall, "thumbnailTable"); }
    QLineEdit* search() const { return find<QLineEdit>(wall, "thumbnailSearch"); }
    ThumbnailModel* cells() const { return qobject_cast<ThumbnailModel*>(table()->model()); }
    QVector<int> shown() const
    {
        QVector<int> ids;
        for (int cell = 0; cell < cells()->cellCount({}); ++cell) {
            ids << cells()->idAt(cells()->modelIndex(cell));
        }
        return ids;
    }
    QString caption(int id) const { return cells()->indexOf(id).data().toString(); }
};

QVector<int> withName(const Fleet& fleet, const QString& part)
{
    QVector<int> ids;
    for (const Camera& camera : fleet.cameras()) {
        if (camera.name.contains(part)) {
            ids << camera.id;
        }
    }
    return ids;
}
}

class TestDevices : public zelkovtest::TestCase
{
    Q_OBJECT

    // Installed for as long as the test function runs.
    static std::unique_ptr<QTranslator> german()
    {
        initClientResource();
        std::unique_ptr<QTranslator> translator(new QTranslator);
        if (translator->load(QStringLiteral(":/client/client_de.qm"))) {
            QCoreApplication::installTranslator(translator.get());
        }
        QCoreApplication::sendPostedEvents();
        return translator;
    }

private Q_SLOTS:
    // The fleet
    void aCameraThatIsGoneIsNotChanged()
    {
        Fleet fleet;
        fleet.remove(3);
        QVERIFY(!fleet.camera(3));
        QCOMPARE(fleet.indexOf(3), -1);
        QSignalSpy spy(&fleet, &Fleet::onlineChanged);
        QSignalSpy renamed(&fleet, &Fleet::renamed);
        fleet.setOnline(3, true);
        fleet.setEvents(3, 4);
        fleet.rename(3, QStringLiteral("x"));
        fleet.remove(3);
        fleet.move(0, Fleet::s_count - 1);
        QCOMPARE(fleet.cameras().first().id, 0);
        QCOMPARE(spy.count() + renamed.count(), 0);
    }

    void theModelOutlivesTheFleet()
    {
        std::unique_ptr<Fleet> fleet(new Fleet);
        FleetModel model(*fleet);
        QCOMPARE(model.rowCount(), Fleet::s_count);
        QCOMPARE(model.index(9, FleetModel::Name).data().toString(), QStringLiteral("Yard 2"));
        QCOMPARE(model.index(9, FleetModel::Place).data().toString(), QStringLiteral("Yard"));
        QCOMPARE(model.index(9, FleetModel::Address).data().toString(), QStringLiteral("192.0.2.19"));
        fleet.reset();
        QVERIFY(!model.index(9, 0).data().isValid());
    }

    void aPictureStaysUntilItIsRefreshed()
    {
        Fleet fleet;
        FleetModel model(fleet);
        const auto key = [&] { return model.index(5, 0).data(Qt::DecorationRole).value<QImage>().cacheKey(); };
        const auto picture = [&] { return model.index(5, 0).data(Qt::DecorationRole).value<QImage>(); };
        const qint64 first = key();
        QCOMPARE(key(), first);
        const QImage online = picture();
        QCOMPARE(online.size(), QSize(320, 180));
        model.refreshPicture(5);
        QVERIFY(key() != first);
        fleet.setOnline(5, false);
        QVERIFY(picture() != online);
        QVERIFY(picture().allGray());
    }

    // The search
    void severalWordsHideTheRowsThatDoNotMatch()
    {
        Desk desk;
        QCOMPARE(desk.shown().size(), Fleet::s_count);
        QCOMPARE(desk.count(), QStringLiteral("64 devices"));
        desk.click(desk.search());
        QTest::keyClicks(desk.search(), QStringLiteral("yARd  7"));
        // "Yard 7", and those of the yard with a 7 in their address
        QVector<int> expected;
        for (const Camera& camera : desk.fleet.cameras()) {
            if (camera.place == QLatin1String("Yard")
                && (camera.name.contains(QLatin1Char('7')) || camera.address.contains(QLatin1Char('7')))) {
                expected << camera.id;
            }
        }
        QVERIFY(expected.size() >= 2);
        QCOMPARE(desk.shown(), expected);
        QCOMPARE(desk.count(), QStringLiteral("%1 of 64 devices").arg(expected.size()));
        // The list is as high as what it shows.
        int height = 0;
        for (int i = 0; i < desk.list()->count(); ++i) {
            height += desk.list()->isRowHidden(i) ? 0 : desk.list()->sizeHintForRow(i);
        }
        QCOMPARE(desk.list()->height(), height);
        QTest::keyClick(desk.search(), Qt::Key_A, Qt::ControlModifier);
        QTest::keyClick(desk.search(), Qt::Key_Delete);
        QCOMPARE(desk.shown().size(), Fleet::s_count);
    }

    void aSearchFindsAnAddressAndNothing()
    {
        Desk desk;
        desk.search()->setText(QStringLiteral("2.73"));
        QCOMPARE(desk.shown(), QVector<int>{63});
        QVERIFY(!find<QLabel>(desk.panel, "deviceNothing")->isVisible());
        desk.search()->setText(QStringLiteral("gate roof"));
        QVERIFY(desk.shown().isEmpty());
        QVERIFY(find<QLabel>(desk.panel, "deviceNothing")->isVisible());
        desk.search()->setText(QStringLiteral("   "));
        QCOMPARE(desk.shown().size(), Fleet::s_count);
        QCOMPARE(desk.count(), QStringLiteral("64 devices"));
    }

    void theSearchFollowsANewName()
    {
        Desk desk;
        desk.search()->setText(QStringLiteral("harbour"));
        QVERIFY(desk.shown().isEmpty());
        desk.fleet.rename(17, QStringLiteral("Harbour"));
        QTRY_COMPARE(desk.shown(), QVector<int>{17});
        QCOMPARE(desk.shownName(17), QStringLiteral("Harbour"));
        desk.fleet.rename(17, QStringLiteral("Quay"));
        QTRY_VERIFY(desk.shown().isEmpty());
    }

    // Choosing
    void aClickChoosesADevice()
    {
        Desk desk;
        QSignalSpy chosen(desk.panel, &DevicePanel::cameraChosen);
        desk.click(desk.row(2));
        QCOMPARE(chosen.count(), 1);
        QCOMPARE(chosen.first().first().toInt(), 2);
        QTest::keyClick(desk.list(), Qt::Key_Down);
        QTest::keyClick(desk.list(), Qt::Key_Return);
        QCOMPARE(chosen.count(), 2);
        QCOMPARE(chosen.last().first().toInt(), 3);
        desk.edit()->click();
        QCoreApplication::processEvents();
        desk.click(desk.row(4), QPoint(desk.row(4)->width() - 40, 3));
        QTest::keyClick(desk.list(), Qt::Key_Return);
        QCOMPARE(chosen.count(), 2);
    }

    void keysBringARowIntoSight()
    {
        Desk desk;
        auto* const area = find<QScrollArea>(desk.panel, "deviceArea");
        desk.list()->setFocus();
        QCOMPARE(area->verticalScrollBar()->value(), 0);
        QTest::keyClick(desk.list(), Qt::Key_End);
        QCOMPARE(desk.list()->currentRow(), Fleet::s_count - 1);
        QVERIFY(area->verticalScrollBar()->value() > area->verticalScrollBar()->maximum() - 60);
    }

    void theWheelScrollsTheArea()
    {
        Desk desk;
        auto* const area = find<QScrollArea>(desk.panel, "deviceArea");
        QWidget* const under = desk.list()->viewport();
        QWheelEvent event(QPointF(20, 20), under->mapToGlobal(QPoint(20, 20)), QPoint(), QPoint(0, -240), Qt::NoButton,
            Qt::NoModifier, Qt::NoScrollPhase, false);
        QSpontaneKeyEvent::setSpontaneous(&event); // others do not go on to the parent
        QVERIFY(qApp->notify(under, &event));
        QVERIFY(area->verticalScrollBar()->value() > 0);
    }

    void theDotFollowsTheNetwork()
    {
        Desk desk;
        auto* const dot = find<QLabel>(desk.row(6), "deviceDot");
        QCOMPARE(dot->property("online"), QVariant(true));
        desk.fleet.setOnline(6, false);
        QCOMPARE(dot->property("online"), QVariant(false));
        QCOMPARE(dot->toolTip(), QStringLiteral("Offline"));
        desk.fleet.setOnline(6, true);
        QCOMPARE(dot->property("online"), QVariant(true));
    }

    void theBadgeFollowsTheEvents()
    {
        Desk desk;
        auto* const badge = find<QWidget>(desk.row(1), "deviceEvents");
        QVERIFY(!badge->isVisible());
        desk.fleet.setEvents(1, 100);
        QVERIFY(badge->isVisible());
        QVERIFY(badge->width() > badge->height());
        desk.fleet.setEvents(1, 0);
        QVERIFY(!badge->isVisible());
    }

    // Rights
    void onlyThoseWithTheRightEdit()
    {
        Desk desk(false);
        QVERIFY(!desk.edit()->isVisible());
        desk.session.setRole(Session::Role::Administrator);
        QVERIFY(desk.edit()->isVisible());
        desk.click(desk.edit());
        QVERIFY(desk.list()->editMode());
        QCOMPARE(desk.edit()->text(), QStringLiteral("Done"));
        desk.session.setRole(Session::Role::User);
        QVERIFY(!desk.list()->editMode());
        QVERIFY(!desk.edit()->isVisible());
        desk.session.setRole(Session::Role::Administrator);
        QVERIFY(!desk.list()->editMode());
        QCOMPARE(desk.edit()->text(), QStringLiteral("Edit"));
        desk.session.logOut();
        QVERIFY(!desk.edit()->isVisible());
    }

    // Names
    void aTypedNameReachesTheFleet()
    {
        Desk desk;
        desk.click(desk.edit());
        QCoreApplication::processEvents();
        QVERIFY(desk.field(1)->isVisible());
        QSignalSpy renamed(&desk.fleet, &Fleet::renamed);
        desk.click(desk.field(1));
        QVERIFY(desk.field(1)->hasFocus());
        QTest::keyClick(desk.field(1), Qt::Key_A, Qt::ControlModifier);
        QTest::keyClicks(desk.field(1), QStringLiteral("  North  dock "));
        QCOMPARE(renamed.count(), 0);
        QTest::keyClick(desk.field(1), Qt::Key_Return);
        QCOMPARE(renamed.count(), 1);
        QCOMPARE(desk.fleet.camera(1)->name, QStringLiteral("North dock"));
        QCOMPARE(desk.field(1)->text(), QStringLiteral("North dock"));
        QCOMPARE(desk.shownName(1), QStringLiteral("North dock"));
        // The last one goes with the mode.
        desk.click(desk.field(2));
        QTest::keyClicks(desk.field(2), QStringLiteral("!"));
        desk.edit()->setChecked(false);
        QCOMPARE(renamed.count(), 2);
        QVERIFY(desk.fleet.camera(2)->name.contains(QLatin1Char('!')));
        QVERIFY(!desk.field(2)->isVisible());
    }

    void anEmptyNameIsDropped()
    {
        Desk desk;
        desk.edit()->click();
        QCoreApplication::processEvents();
        desk.click(desk.field(0));
        QTest::keyClick(desk.field(0), Qt::Key_A, Qt::ControlModifier);
        QTest::keyClick(desk.field(0), Qt::Key_Space);
        QTest::keyClick(desk.field(0), Qt::Key_Return);
        QCOMPARE(desk.fleet.camera(0)->name, QStringLiteral("Gate 1"));
        QCOMPARE(desk.field(0)->text(), QStringLiteral("Gate 1"));
    }

    void aNameChangedElsewhereDoesNotDisturbTyping()
    {
        Desk desk;
        desk.edit()->click();
        QCoreApplication::processEvents();
        desk.click(desk.field(1));
        QTest::keyClicks(desk.field(1), QStringLiteral("x"));
        const QString typed = desk.field(1)->text();
        desk.fleet.rename(1, QStringLiteral("Elsewhere"));
        desk.fleet.rename(2, QStringLiteral("Other"));
        QCOMPARE(desk.field(1)->text(), typed);
        QCOMPARE(desk.field(2)->text(), QStringLiteral("Other"));
        QTest::keyClick(desk.field(1), Qt::Key_Return);
        QCOMPARE(desk.fleet.camera(1)->name, typed);
    }

    // Deleting
    void theSignAndTheButtonDelete()
    {
        Desk desk;
        desk.click(desk.edit());
        QCoreApplication::processEvents();
        auto* const sign = desk.row(1)->findChild<vx::iOSListWidgetDeleteIcon*>();
        auto* const button = find<QPushButton>(desk.row(1), "deleteButton");
        desk.click(sign);
        QTRY_VERIFY(button->isVisible());
        QVERIFY(desk.fleet.camera(1));
        QCoreApplication::processEvents();
        QVERIFY(desk.list()->rect().right() >= button->mapTo(desk.list(), button->rect().topRight()).x());
        desk.click(button);
        QTRY_VERIFY(!desk.fleet.camera(1));
        QTRY_COMPARE(desk.order(), desk.fleetOrder());
        QCOMPARE(desk.order().size(), Fleet::s_count - 1);
        QTRY_COMPARE(desk.count(), QStringLiteral("63 devices"));
        QTRY_COMPARE(desk.list()->height(), desk.list()->sizeHint().height());
    }

    void aDeviceDeletedElsewhereGoesWhileItsNameIsTyped()
    {
        Desk desk;
        desk.edit()->click();
        QCoreApplication::processEvents();
        desk.click(desk.field(1));
        QTest::keyClicks(desk.field(1), QStringLiteral("new"));
        QSignalSpy renamed(&desk.fleet, &Fleet::renamed);
        desk.fleet.remove(1);
        QTRY_COMPARE(desk.order(), desk.fleetOrder());
        QVERIFY(!desk.list()->device(1));
        QVERIFY(desk.list()->editMode());
        QCOMPARE(renamed.count(), 0);
        // All at once
        while (!desk.fleet.cameras().isEmpty()) {
            desk.fleet.remove(desk.fleet.cameras().first().id);
        }
        QTRY_COMPARE(desk.list()->count(), 0);
        QTRY_COMPARE(desk.count(), QStringLiteral("0 devices"));
    }

    void thePanelIsDeletedWhileANameIsTyped()
    {
        Desk desk;
        desk.edit()->click();
        QCoreApplication::processEvents();
        desk.click(desk.field(1));
        QTest::keyClicks(desk.field(1), QStringLiteral("new"));
        QSignalSpy renamed(&desk.fleet, &Fleet::renamed);
        delete desk.panel;
        QCoreApplication::processEvents();
        QCOMPARE(renamed.count(), 0);
        desk.fleet.rename(1, QStringLiteral("nobody listens"));
        desk.fleet.move(0, 4);
    }

    void theFleetMayGoFirst()
    {
        std::unique_ptr<Fleet> fleet(new Fleet);
        std::unique_ptr<Session> session(new Session);
        session->logIn(QStringLiteral("admin"), QStringLiteral("camera2!"));
        QWidget window;
        auto* const panel = new DevicePanel(*fleet, *session, &window);
        auto* const wall = new ThumbnailWall(*fleet, &window);
        panel->setGeometry(0, 0, 300, 400);
        wall->setGeometry(300, 0, 400, 400);
        window.resize(700, 400);
        window.show();
        find<QPushButton>(panel, "deviceEditButton")->setChecked(true);
        QCoreApplication::processEvents();
        auto* const field = find<QLineEdit>(panel, "deviceNameEdit");
        field->setFocus();
        QTest::keyClicks(field, QStringLiteral("new"));
        fleet->move(0, 3);
        session.reset();
        fleet.reset();
        QTest::keyClick(field, Qt::Key_Return);
        find<QLineEdit>(panel, "deviceSearch")->setText(QStringLiteral("yard"));
        find<QLineEdit>(wall, "thumbnailSearch")->setText(QStringLiteral("yard"));
        QCoreApplication::processEvents();
    }

    // The order (drags: tst_devicedrag)
    void theListFollowsAnotherOrder()
    {
        Desk desk;
        desk.list()->setCurrentRow(5);
        desk.fleet.move(5, 0);
        desk.fleet.move(63, 1);
        QTRY_COMPARE(desk.order(), desk.fleetOrder());
        QCOMPARE(desk.list()->deviceAt(desk.list()->currentRow())->id(), 5);
        for (int id : desk.order()) {
            QVERIFY(desk.row(id));
        }
        desk.search()->setText(QStringLiteral("roof"));
        desk.fleet.move(7, 30);
        QTRY_COMPARE(desk.order(), desk.fleetOrder());
        QCOMPARE(desk.shown(), withName(desk.fleet, QStringLiteral("Roof")));
    }

    void theEditModeSurvivesAnotherOrder()
    {
        Desk desk;
        desk.edit()->click();
        desk.fleet.move(5, 0);
        QTRY_COMPARE(desk.order(), desk.fleetOrder());
        QVERIFY(desk.field(5)->isVisible());
        desk.edit()->click();
        QVERIFY(!desk.field(5)->isVisible());
    }

    void rowsMoveOnlyWhileAllAreShown()
    {
        Desk desk;
        QVERIFY(!desk.list()->deviceAt(0)->movable());
        desk.edit()->click();
        QVERIFY(desk.list()->deviceAt(0)->movable());
        desk.search()->setText(QStringLiteral("gate"));
        QVERIFY(!desk.list()->deviceAt(0)->movable());
        desk.search()->clear();
        QVERIFY(desk.list()->deviceAt(0)->movable());
        desk.edit()->click();
        QVERIFY(!desk.list()->deviceAt(0)->movable());
    }

    void rowsFollowANarrowerPanel()
    {
        Desk desk;
        const auto fits = [&] { return desk.row(0)->width() == desk.list()->viewport()->width(); };
        QTRY_VERIFY(fits());
        desk.edit()->click();
        QTRY_VERIFY(fits());
        desk.window.resize(290, 420);
        QTRY_VERIFY(fits());
    }

    // Languages
    void theLanguageChangesWithoutLosingAnything()
    {
        Desk desk;
        Wall wall;
        desk.edit()->click();
        desk.search()->setText(QStringLiteral("gate"));
        wall.fleet.setOnline(1, false);
        QCOMPARE(wall.caption(1), QStringLiteral("Yard 1 (offline)"));
        {
            const auto translator = german();
            QCOMPARE(desk.edit()->text(), QStringLiteral("Fertig"));
            QCOMPARE(desk.search()->placeholderText(), QStringLiteral("Geräte suchen"));
            QCOMPARE(desk.count(), QStringLiteral("%1 von 64 Geräten").arg(desk.shown().size()));
            QCOMPARE(find<QPushButton>(desk.row(0), "deleteButton")->text(), QStringLiteral("Löschen"));
            QCOMPARE(desk.search()->text(), QStringLiteral("gate"));
            QVERIFY(desk.list()->editMode());
            QCOMPARE(wall.caption(1), QStringLiteral("Yard 1 (getrennt)"));
            QCOMPARE(find<QLabel>(wall.wall, "thumbnailCount")->text(), QStringLiteral("64 Kameras"));
        }
        QCoreApplication::sendPostedEvents();
        QCOMPARE(desk.edit()->text(), QStringLiteral("Done"));
    }

    // The wall
    void theColumnsFollowTheWidth()
    {
        Wall wall(780);
        QCOMPARE(wall.cells()->columnCount(), (wall.table()->viewport()->width() - 12) / 170);
        QCOMPARE(wall.cells()->columnCount(), 4);
        wall.wall->resize(400, 420);
        QCOMPARE(wall.cells()->columnCount(), 2);
        QCOMPARE(wall.cells()->rowCount(), 32);
        wall.wall->resize(60, 420);
        QCOMPARE(wall.cells()->columnCount(), 1);
        QCOMPARE(wall.shown().size(), Fleet::s_count);
        // No picture lies under the edge.
        wall.wall->resize(780, 420);
        QVERIFY(wall.table()->visualRect(wall.cells()->index(0, 3)).right() < wall.table()->viewport()->width());
    }

    void thePicturesFollowTheSearch()
    {
        Wall wall;
        auto* const count = find<QLabel>(wall.wall, "thumbnailCount");
        QCOMPARE(count->text(), QStringLiteral("64 cameras"));
        QTest::keyClicks(wall.search(), QStringLiteral("roof"));
        QCOMPARE(wall.shown(), withName(wall.fleet, QStringLiteral("Roof")));
        QCOMPARE(count->text(), QStringLiteral("8 of 64 cameras"));
        QTest::keyClicks(wall.search(), QStringLiteral(" gate"));
        QVERIFY(wall.shown().isEmpty());
        QVERIFY(find<QLabel>(wall.wall, "thumbnailNothing")->isVisible());
        wall.search()->clear();
        QCOMPARE(wall.shown().size(), Fleet::s_count);
        QVERIFY(!find<QLabel>(wall.wall, "thumbnailNothing")->isVisible());
    }

    void thePicturesFollowTheFleet()
    {
        Wall wall;
        wall.table()->setCurrentIndex(wall.cells()->indexOf(6));
        wall.fleet.move(6, 0);
        QCOMPARE(wall.shown().first(), 6);
        QCOMPARE(wall.cells()->idAt(wall.table()->currentIndex()), 6);
        wall.fleet.remove(6);
        QCOMPARE(wall.shown().size(), Fleet::s_count - 1);
        wall.fleet.rename(0, QStringLiteral("Harbour"));
        QCOMPARE(wall.caption(0), QStringLiteral("Harbour"));
        wall.search()->setText(QStringLiteral("harbour"));
        QCOMPARE(wall.shown(), QVector<int>{0});
        wall.fleet.rename(0, QStringLiteral("Quay"));
        QVERIFY(wall.shown().isEmpty());
        wall.fleet.rename(0, QStringLiteral("Harbour"));
        QCOMPARE(wall.shown(), QVector<int>{0});
    }

    void aDoubleClickChoosesAPicture()
    {
        Wall wall;
        QSignalSpy chosen(wall.wall, &ThumbnailWall::cameraChosen);
        QWidget* const viewport = wall.table()->viewport();
        {
            zelkovtest::Pointer pointer(viewport);
            const QPoint at = wall.table()->visualRect(wall.cells()->indexOf(5)).center();
            pointer.click(at);
            QCOMPARE(chosen.count(), 0);
            pointer.click(at);
        }
        QCOMPARE(chosen.count(), 1);
        QCOMPARE(chosen.first().first().toInt(), 5);
        QTest::keyClick(wall.table(), Qt::Key_Right);
        QTest::keyClick(wall.table(), Qt::Key_Return);
        QCOMPARE(chosen.count(), 2);
        QCOMPARE(chosen.last().first().toInt(), 6);
    }

    void placesWithoutACameraAreNotChosen()
    {
        Wall wall;
        wall.search()->setText(QStringLiteral("2.73"));
        QCOMPARE(wall.shown(), QVector<int>{63});
        wall.search()->clear();
        wall.fleet.remove(63);
        const QModelIndex last = wall.cells()->index(15, 3);
        QVERIFY(last.isValid());
        QCOMPARE(wall.cells()->idAt(last), -1);
        QVERIFY(!wall.cells()->flags(last).testFlag(Qt::ItemIsSelectable));
        QVERIFY(!last.data().isValid());
    }

    void onlyAShownWallRefreshesItsPictures()
    {
        Wall wall;
        // The pictures in sight, one after the other; the model tells of each.
        wall.table()->viewport()->grab();
        QSignalSpy changed(wall.cells(), &QAbstractItemModel::dataChanged);
        QVERIFY(changed.wait());
        wall.wall->hide();
        QCoreApplication::processEvents();
        changed.clear();
        QTest::qWait(700);
        QCOMPARE(changed.count(), 0);
    }
};

ZELKOV_TEST_MAIN(TestDevices)
#include "tst_devices.moc"

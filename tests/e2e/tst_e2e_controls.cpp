// SPDX-License-Identifier: MIT
// A real pointer and real keys on dial, phone-style list, password form and path field.
#include "controls/DialButton.h"
#include "controls/FilepathEdit.h"
#include "controls/PasswordCheckWidget.h"
#include "controls/iOSListWidget.h"
#include "controls/iOSListWidgetDeleteIcon.h"
#include "controls/iOSListWidgetItem.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QElapsedTimer>
#include <QtCore/QFile>
#include <QtCore/QMimeData>
#include <QtCore/QProcess>
#include <QtCore/QTemporaryDir>
#include <QtCore/QUrl>
#include <QtGui/QDrag>
#include <QtGui/QMouseEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QPushButton>

namespace
{
using vx::iOSListWidget;
using vx::iOSListWidgetItem;
using vx::PasswordCheckWidget;

// A file as it lies in a file manager: a drag takes it along.
class FileSign : public QWidget
{
public:
    FileSign(const QString& path, QWidget* parent)
        : QWidget(parent)
        , m_path(path)
    {
    }

protected:
    void mousePressEvent(QMouseEvent* event) override { event->accept(); }
    void mouseMoveEvent(QMouseEvent*) override
    {
        auto* const files = new QMimeData;
        files->setUrls({QUrl::fromLocalFile(m_path)});
        auto* const drag = new QDrag(this);
        drag->setMimeData(files);
        drag->exec(Qt::CopyAction);
    }

private:
    QString m_path;
};

class DeviceList : public iOSListWidget
{
public:
    explicit DeviceList(QWidget* parent)
        : iOSListWidget(parent, QStringLiteral("devices"))
    {
        setFrameShape(QFrame::NoFrame);
        for (const char* name : {"gate", "yard", "hall", "roof"}) {
            auto* const label = new QLabel(QLatin1String(name));
            label->setMargin(10);
            auto* const row = new iOSListWidgetItem(this, label, QStringLiteral("device"));
            row->setData(Qt::UserRole, QLatin1String(name));
        }
    }

    QStringList names() const
    {
        QStringList result;
        for (int row = 0; row < count(); ++row) {
            result << item(row)->data(Qt::UserRole).toString();
        }
        return result;
    }

    QPoint middleOf(int row) const { return viewport()->mapToGlobal(visualItemRect(item(row)).center()); }
};
}

class TestE2eControls : public zelkovtest::TestCase
{
    Q_OBJECT

    // Runs xdotool while the program goes on.
    static void pointer(const QStringList& arguments)
    {
        QProcess tool;
        tool.start(QStringLiteral("xdotool"), arguments);
        QTRY_VERIFY_WITH_TIMEOUT(tool.state() == QProcess::NotRunning, 20000);
        QCOMPARE(tool.exitCode(), 0);
    }

    static QStringList words(const char* text) { return QString::fromLatin1(text).split(QLatin1Char(' ')); }

    static QStringList to(const QPoint& global)
    {
        return {QStringLiteral("mousemove"), QString::number(global.x()), QString::number(global.y()),
            QStringLiteral("sleep"), QStringLiteral("0.05")};
    }

    static QStringList toMiddle(const QWidget* widget) { return to(widget->mapToGlobal(widget->rect().center())); }

    // With stops on the way for the other side to answer.
    static QStringList way(const QPoint& from, const QPoint& onto)
    {
        QStringList steps;
        for (int i = 1; i <= 12; ++i) {
            steps << to(from + (onto - from) * i / 12);
        }
        return steps;
    }

    static void drag(const QPoint& from, const QPoint& onto)
    {
        pointer(to(from) + words("sleep 0.1 mousedown 1 sleep 0.1") + way(from, onto)
            + words("sleep 0.2 mouseup 1 sleep 0.2"));
    }

    static void show(QWidget& window)
    {
        window.setGeometry(120, 100, 480, 320);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        // The window manager moves the window once more after it is shown.
        QPoint last;
        QElapsedTimer unchanged;
        unchanged.start();
        QVERIFY(QTest::qWaitFor(
            [&] {
                const QPoint now = window.mapToGlobal(QPoint());
                if (now != last) {
                    last = now;
                    unchanged.restart();
                }
                return unchanged.elapsed() > 300;
            },
            10000));
    }

private Q_SLOTS:
    void aDialTurnsWithThePointerAndSpringsBack()
    {
        QWidget window;
        auto* const dial = new vx::DialButton(0, &window);
        dial->setRange(-100, 100);
        dial->setValue(0);
        dial->setReboundEnabled(true);
        dial->setGeometry(40, 40, 120, 120);
        QStringList said;
        connect(dial, &vx::DialButton::toggled, this, [&](bool on) { said << QStringLiteral("toggled %1").arg(on); });
        connect(dial, &vx::DialButton::pressed, this, [&] { said << QStringLiteral("pressed"); });
        connect(dial, &vx::DialButton::released, this, [&] { said << QStringLiteral("released"); });
        connect(dial, &vx::DialButton::reboundPerformed, this,
            [&](int value) { said << QStringLiteral("rebound %1").arg(value); });
        show(window);
        const QPoint from = dial->mapToGlobal(dial->rect().center());
        pointer(to(from) + words("mousedown 1 sleep 0.1") + way(from, from + QPoint(90, 0)) + words("sleep 0.1"));
        // Three widths are the whole range; QDial rounds to the nearest place.
        QTRY_VERIFY2(qAbs(dial->value() - 50) <= 1, qPrintable(QString::number(dial->value())));
        QVERIFY(dial->isDown());
        pointer(words("mouseup 1"));
        QTRY_COMPARE(dial->value(), 0);
        QTRY_COMPARE(said,
            QStringList({QStringLiteral("toggled 1"), QStringLiteral("pressed"), QStringLiteral("toggled 0"),
                QStringLiteral("released"), QStringLiteral("rebound 0")}));
        said.clear();
        pointer(to(from) + words("click 1"));
        QTRY_COMPARE(said,
            QStringList({QStringLiteral("toggled 1"), QStringLiteral("pressed"), QStringLiteral("toggled 0"),
                QStringLiteral("released")}));
        QCOMPARE(dial->value(), 0);
    }

    void aRowIsDeletedByItsSignAndItsButton()
    {
        QWidget window;
        auto* const list = new DeviceList(&window);
        list->setGeometry(20, 20, 320, 240);
        list->setEditMode(true);
        QStringList removed;
        connect(list, &iOSListWidget::itemRemoved, this, [&](const iOSListWidget::TListWidgetItemPointer& item) {
            removed << item->data(Qt::UserRole).toString();
        });
        show(window);
        QWidget* const row = list->itemWidget(list->item(1));
        auto* const button = row->findChild<QPushButton*>(QStringLiteral("deleteButton"));
        QVERIFY(!button->isVisible());
        pointer(toMiddle(row->findChild<vx::iOSListWidgetDeleteIcon*>()) + words("click 1"));
        QTRY_VERIFY(button->isVisible());
        QCOMPARE(list->count(), 4);
        QTest::qWait(300); // until the row is laid out and the sign has turned
        pointer(toMiddle(button) + words("click 1"));
        QTRY_COMPARE(removed, QStringList(QStringLiteral("yard")));
        QCOMPARE(list->names(),
            QStringList({QStringLiteral("gate"), QStringLiteral("hall"), QStringLiteral("roof")}));
    }

    void aDragPutsARowInAnotherPlace()
    {
        QWidget window;
        auto* const list = new DeviceList(&window);
        list->setGeometry(20, 20, 320, 240);
        list->setEditMode(true);
        QStringList said;
        connect(list, &iOSListWidget::itemMoved, this,
            [&](int from, int onto) { said << QStringLiteral("moved %1 %2").arg(from).arg(onto); });
        connect(list, &iOSListWidget::dataMoved, this, [&](const QVariant& from, const QVariant& onto) {
            said << QStringLiteral("data %1 %2").arg(from.toString(), onto.toString());
        });
        show(window);
        const int height = list->visualItemRect(list->item(0)).height();
        // Onto the lower edge of the third row.
        drag(list->middleOf(0), list->middleOf(2) + QPoint(10, height / 2 - 1));
        QTRY_COMPARE(list->names(),
            QStringList({QStringLiteral("yard"), QStringLiteral("hall"), QStringLiteral("gate"),
                QStringLiteral("roof")}));
        QCOMPARE(said.size(), 2);
        QVERIFY2(said.at(0).startsWith(QLatin1String("moved 0 ")), qPrintable(said.at(0)));
        QVERIFY2(said.at(1).startsWith(QLatin1String("data gate ")), qPrintable(said.at(1)));
        // The widgets of the row have come along.
        QTRY_VERIFY(list->itemWidget(list->item(2)));
        QTRY_VERIFY(list->itemWidget(list->item(2))->isVisible());
        auto* const label = qobject_cast<QLabel*>(list->getIOSItem(2)->itemWidget());
        QVERIFY(label);
        QCOMPARE(label->text(), QStringLiteral("gate"));
        QVERIFY(list->itemWidget(list->item(2))->isAncestorOf(label));
    }

    void aPasswordIsTypedTwice()
    {
        QWidget window;
        auto* const form = new PasswordCheckWidget(false,
            PasswordCheckWidget::esrMinimumLength | PasswordCheckWidget::esrUpperAndLowerCase
                | PasswordCheckWidget::esrDigitAndLetter | PasswordCheckWidget::esrPasswordsMatch,
            &window);
        form->setGeometry(20, 20, 400, 80);
        QVector<bool> verdicts;
        connect(form, &PasswordCheckWidget::passwordChanged, this,
            [&](const QString&, bool met) { verdicts << met; });
        show(window);
        window.activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&window));
        const auto display = [form](const char* name) { return form->property(name).toInt(); };
        pointer(toMiddle(form->firstLineEdit()) + words("click 1 sleep 0.1 type --delay 30 Camera2026"));
        QTRY_COMPARE(form->password(), QStringLiteral("Camera2026"));
        QTRY_COMPARE(display("secureStateDisplay"), int(PasswordCheckWidget::essSecure));
        QCOMPARE(display("passwordsMatchDisplay"), int(PasswordCheckWidget::epmNone));
        pointer(words("key Tab type --delay 30 Camera202"));
        QTRY_COMPARE(form->secondLineEdit()->text(), QStringLiteral("Camera202"));
        QTRY_COMPARE(display("passwordsMatchDisplay"), int(PasswordCheckWidget::epmDiffer));
        QVERIFY(!verdicts.contains(true));
        pointer(words("key 6"));
        QTRY_COMPARE(display("passwordsMatchDisplay"), int(PasswordCheckWidget::epmMatch));
        QVERIFY(form->allRequirementsMet());
        QCOMPARE(verdicts.size(), 20);
        QVERIFY(verdicts.constLast());
    }

    void aDroppedFileGivesItsFolder()
    {
        QTemporaryDir folder;
        QFile file(folder.filePath(QStringLiteral("clip.mkv")));
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.close();
        QWidget window;
        auto* const sign = new FileSign(file.fileName(), &window);
        sign->setGeometry(20, 20, 60, 60);
        auto* const edit = new vx::FilepathEdit(QStringLiteral("/"), &window);
        edit->setGeometry(20, 160, 400, 30);
        show(window);
        drag(sign->mapToGlobal(sign->rect().center()), edit->mapToGlobal(edit->rect().center()));
        QTRY_COMPARE(edit->text(), folder.path());
    }
};

ZELKOV_TEST_MAIN(TestE2eControls)
#include "tst_e2e_controls.moc"

// SPDX-License-Identifier: MIT
// The line edit for a directory.
#include "controls/FilepathEdit.h"
#include "support/SignalRecorder.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QDir>
#include <QtCore/QMimeData>
#include <QtCore/QTemporaryDir>
#include <QtCore/QTimer>
#include <QtCore/QUrl>
#include <QtGui/QDragEnterEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>
#include <QtWidgets/QFileDialog>
#include <QtWidgets/QPushButton>

namespace
{
bool enterWith(QWidget* edit, const QMimeData& data)
{
    QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    enter.ignore();
    QCoreApplication::sendEvent(edit, &enter);
    return enter.isAccepted();
}

bool dropWith(QWidget* edit, const QMimeData& data)
{
    QDropEvent drop(QPointF(5, 5), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    drop.ignore();
    QCoreApplication::sendEvent(edit, &drop);
    return drop.isAccepted();
}

// Closes the directory dialog as soon as it is there.
void whenTheDialogIsThere(QObject* context, std::function<void(QFileDialog*)> act)
{
    auto* const timer = new QTimer(context);
    QObject::connect(timer, &QTimer::timeout, context, [timer, act] {
        for (QWidget* const window : QApplication::topLevelWidgets()) {
            auto* const dialog = qobject_cast<QFileDialog*>(window);
            if (dialog && dialog->isVisible()) {
                timer->stop();
                act(dialog);
                return;
            }
        }
    });
    timer->start(5);
}
}

class TestFilepathEdit : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itHasAName()
    {
        vx::FilepathEdit edit;
        QCOMPARE(edit.objectName(), QStringLiteral("filepathedit"));
        QVERIFY(edit.acceptDrops());
        QCOMPARE(edit.textMargins(), QMargins(0, 0, 20, 0));
        QCOMPARE(vx::FilepathEdit(QStringLiteral("/tmp")).text(), QStringLiteral("/tmp"));
    }

    void theModeIsKeptForClients()
    {
        vx::FilepathEdit edit;
        QVERIFY(!edit.urlMode());
        edit.setUrlMode(true);
        QVERIFY(edit.urlMode());
    }

    void aDroppedFileGivesItsDirectory()
    {
        vx::FilepathEdit edit;
        QMimeData data;
        data.setUrls({QUrl::fromLocalFile(QStringLiteral("/video/export/gate.avi")),
            QUrl::fromLocalFile(QStringLiteral("/other/gate.avi"))});
        QVERIFY(enterWith(&edit, data));
        QVERIFY(dropWith(&edit, data));
        QCOMPARE(edit.text(), QStringLiteral("/video/export"));
    }

    void aDroppedDirectoryGivesItsParent()
    {
        vx::FilepathEdit edit;
        QMimeData data;
        data.setUrls({QUrl::fromLocalFile(QStringLiteral("/video/export"))});
        QVERIFY(enterWith(&edit, data));
        QVERIFY(dropWith(&edit, data));
        QCOMPARE(edit.text(), QStringLiteral("/video"));
    }

    void plainTextIsNoDrop()
    {
        vx::FilepathEdit edit(QStringLiteral("/video"));
        QMimeData data;
        data.setText(QStringLiteral("word"));
        QVERIFY(!enterWith(&edit, data));
        QMimeData file;
        file.setUrls({QUrl::fromLocalFile(QStringLiteral("/video/export/gate.avi"))});
        QVERIFY(enterWith(&edit, file)); // no drop arrives without
        QVERIFY(!dropWith(&edit, data));
        QCOMPARE(edit.text(), QStringLiteral("/video"));
    }

    void theButtonStandsAtTheRightInEveryDirection()
    {
        for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            vx::FilepathEdit edit;
            edit.setLayoutDirection(direction);
            edit.resize(200, 30);
            edit.show();
            auto* const button = edit.findChild<QPushButton*>();
            QCOMPARE(button->geometry(), QRect(180, 5, 20, 20));
            QVERIFY(button->isFlat());
            QVERIFY(button->hasMouseTracking());
        }
    }

    void aCancelledDialogLeavesTheTextAloneAndIsReported()
    {
        QTemporaryDir directory;
        vx::FilepathEdit edit(directory.path());
        edit.show();
        zelkovtest::SignalRecorder recorder(&edit);
        QString opened;
        whenTheDialogIsThere(&edit, [&](QFileDialog* dialog) {
            opened = dialog->directory().absolutePath();
            dialog->reject();
        });
        QTest::mouseClick(edit.findChild<QPushButton*>(), Qt::LeftButton);
        QCOMPARE(recorder.names(), (QStringList{QStringLiteral("fileChooserOpened"), QStringLiteral("fileChooserClosed")}));
        QCOMPARE(edit.text(), directory.path());
        QCOMPARE(QDir(opened).canonicalPath(), QDir(directory.path()).canonicalPath());
    }

    void aChosenDirectoryIsTakenOver()
    {
        QTemporaryDir directory;
        QVERIFY(QDir(directory.path()).mkdir(QStringLiteral("deep")));
        const QString deep = directory.path() + QLatin1String("/deep");
        vx::FilepathEdit edit(directory.path());
        edit.show();
        QString textWhenClosed;
        connect(&edit, &vx::FilepathEdit::fileChooserClosed, &edit, [&] { textWhenClosed = edit.text(); });
        whenTheDialogIsThere(&edit, [&](QFileDialog* dialog) {
            dialog->selectFile(deep);
            QMetaObject::invokeMethod(dialog, "accept");
        });
        QTest::mouseClick(edit.findChild<QPushButton*>(), Qt::LeftButton);
        QCOMPARE(textWhenClosed, directory.path()); // the text comes after the signal
        QCOMPARE(QDir(edit.text()).canonicalPath(), QDir(deep).canonicalPath());
    }

    void theEditMayBeDeletedWhileTheDialogIsOpen()
    {
        QPointer<vx::FilepathEdit> edit(new vx::FilepathEdit(QStringLiteral("/")));
        edit->show();
        whenTheDialogIsThere(qApp, [edit](QFileDialog*) { delete edit.data(); });
        QTest::mouseClick(edit->findChild<QPushButton*>(), Qt::LeftButton);
        QVERIFY(!edit);
    }
};

ZELKOV_TEST_MAIN(TestFilepathEdit)
#include "tst_filepathedit.moc"

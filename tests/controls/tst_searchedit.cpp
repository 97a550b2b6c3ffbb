// SPDX-License-Identifier: MIT
// The line edit with a magnifier and a clear button.
#include "controls/SearchEdit.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QPixmap>
#include <QtTest/QtTest>
#include <QtWidgets/QLabel>
#include <QtWidgets/QPushButton>

class TestSearchEdit : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theClearButtonIsThereFromTheFirstCharacterToTheLast()
    {
        vx::SearchEdit edit;
        edit.show();
        auto* const clear = edit.findChild<QPushButton*>();
        QVERIFY(clear->isHidden());
        QTest::keyClicks(&edit, QStringLiteral("ab"));
        QVERIFY(!clear->isHidden());
        QTest::keyClick(&edit, Qt::Key_Backspace);
        QVERIFY(!clear->isHidden());
        QTest::keyClick(&edit, Qt::Key_Backspace);
        QVERIFY(clear->isHidden());
    }

    void theClearButtonIsThereForAFirstText()
    {
        vx::SearchEdit edit(QStringLiteral("gate"));
        QCOMPARE(edit.text(), QStringLiteral("gate"));
        QVERIFY(!edit.findChild<QPushButton*>()->isHidden());
        QVERIFY(vx::SearchEdit(QString()).findChild<QPushButton*>()->isHidden());
    }

    void theClearButtonClears()
    {
        vx::SearchEdit edit(QStringLiteral("gate"));
        edit.resize(200, 30);
        edit.show();
        QTest::mouseClick(edit.findChild<QPushButton*>(), Qt::LeftButton);
        QVERIFY(edit.text().isEmpty());
        QVERIFY(edit.findChild<QPushButton*>()->isHidden());
    }

    void thePicturesKeepTheirSidesInEveryDirection()
    {
        for (const Qt::LayoutDirection direction : {Qt::LeftToRight, Qt::RightToLeft}) {
            vx::SearchEdit edit;
            edit.setLayoutDirection(direction);
            edit.resize(200, 30);
            edit.show();
            QCOMPARE(edit.findChild<QLabel*>()->geometry(), QRect(0, 5, 20, 20));
            QCOMPARE(edit.findChild<QPushButton*>()->geometry(), QRect(180, 5, 20, 20));
            QCOMPARE(edit.textMargins(), QMargins(20, 0, 20, 0));
        }
    }

    void theChildrenAreSetUp()
    {
        vx::SearchEdit edit;
        QVERIFY(edit.findChild<QLabel*>()->hasScaledContents());
        QVERIFY(edit.findChild<QLabel*>()->hasMouseTracking());
        QVERIFY(edit.findChild<QPushButton*>()->hasMouseTracking());
        QVERIFY(edit.findChild<QPushButton*>()->isFlat());
    }

    void thePicturesCanBeReplaced()
    {
        QTemporaryDir directory;
        QPixmap picture(8, 8);
        picture.fill(Qt::red);
        const QString path = directory.path() + QLatin1String("/red.png");
        QVERIFY(picture.save(path));
        vx::SearchEdit edit;
        edit.setLoopIcon(path);
        edit.setClearIcon(path);
        QCOMPARE(edit.findChild<QLabel*>()->pixmap(Qt::ReturnByValue).toImage().pixelColor(4, 4), QColor(Qt::red));
        QCOMPARE(edit.findChild<QPushButton*>()->icon().pixmap(8, 8).toImage().pixelColor(4, 4), QColor(Qt::red));
    }
};

ZELKOV_TEST_MAIN(TestSearchEdit)
#include "tst_searchedit.moc"

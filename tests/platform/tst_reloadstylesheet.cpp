// SPDX-License-Identifier: MIT
// A new object name takes its style-sheet rules at once.
#include "TestCase.h"
#include "TestMain.h"
#include "ZelkovUtils/ReloadStyleSheet.h"

#include <QtTest/QtTest>
#include <QtWidgets/QLabel>

class TestReloadStyleSheet : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theRulesOfTheNewNameHold()
    {
        QWidget window;
        window.setStyleSheet(QStringLiteral("#Calm { color: #00ff00 } #Alarm { color: #ff0000 }"));
        QLabel label(&window);
        label.setObjectName(QStringLiteral("Calm"));
        label.ensurePolished();
        QCOMPARE(label.palette().color(QPalette::WindowText), QColor(0, 255, 0));

        vx::reloadStyleSheet(&label, QStringLiteral("Alarm"));
        QCOMPARE(label.objectName(), QStringLiteral("Alarm"));
        QCOMPARE(label.palette().color(QPalette::WindowText), QColor(255, 0, 0));

        vx::reloadStyleSheet(&label, QString());
        QCOMPARE(label.objectName(), QString());
        QVERIFY(label.palette().color(QPalette::WindowText) != QColor(255, 0, 0));
    }

    void withoutAStyleSheetOnlyTheNameChanges()
    {
        QWidget widget;
        vx::reloadStyleSheet(&widget, QStringLiteral("Name"));
        QCOMPARE(widget.objectName(), QStringLiteral("Name"));
    }

    void nullIsIgnored() { vx::reloadStyleSheet(nullptr, QStringLiteral("Name")); }
};

ZELKOV_TEST_MAIN(TestReloadStyleSheet)
#include "tst_reloadstylesheet.moc"

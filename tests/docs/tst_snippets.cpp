// SPDX-License-Identifier: MIT
// The code on the pages of docs/ runs: each page's pieces once, offscreen, without a warning and without leaving a
// widget behind.
#include <QtCore/QCoreApplication>
#include <QtCore/QEvent>
#include <QtTest/QtTest>

#include "Snippets.h"
#include "TestCase.h"
#include "TestMain.h"
#include "popover/Manager.h"

class TestSnippets : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void thePieceOfAPageRuns_data()
    {
        QTest::addColumn<int>("index");
        for (int i = 0; i < snippets::pages().size(); ++i) {
            QTest::newRow(snippets::pages().at(i).name) << i;
        }
    }

    void thePieceOfAPageRuns()
    {
        QFETCH(int, index);
        snippets::pages().at(index).run();
        vx::PopoverWidget::Manager::deleteInstance();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY2(unexpectedWarnings().isEmpty(), qPrintable(unexpectedWarnings().join(QLatin1Char('\n'))));
        QVERIFY2(leftovers().isEmpty(), qPrintable(leftovers().join(QLatin1Char('\n'))));
    }
};

ZELKOV_TEST_MAIN(TestSnippets)
#include "tst_snippets.moc"

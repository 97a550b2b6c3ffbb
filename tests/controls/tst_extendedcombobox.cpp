// SPDX-License-Identifier: MIT
// The combo box that leaves the wheel alone.
#include "controls/ExtendedComboBox.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtGui/QWheelEvent>
#include <QtTest/QtTest>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>

namespace
{
struct Form
{
    QScrollArea area;
    vx::ExtendedComboBox* combo;

    Form()
    {
        auto* const content = new QWidget;
        content->resize(180, 2000);
        combo = new vx::ExtendedComboBox(content);
        combo->addItems({QStringLiteral("one"), QStringLiteral("two"), QStringLiteral("three")});
        combo->setCurrentIndex(1);
        combo->setGeometry(10, 10, 100, 28);
        area.setWidget(content);
        area.resize(200, 150);
        area.show();
        combo->setFocus();
    }

    // Events made by hand go to no parent by themselves.
    QWidget* wheel()
    {
        for (QWidget* at = combo; at; at = at->parentWidget()) {
            QWheelEvent event(QPointF(5, 5), at->mapToGlobal(QPoint(5, 5)), QPoint(), QPoint(0, -120), Qt::NoButton,
                Qt::NoModifier, Qt::NoScrollPhase, false);
            event.ignore();
            QCoreApplication::sendEvent(at, &event);
            if (event.isAccepted()) {
                return at;
            }
        }
        return nullptr;
    }
};
}

class TestExtendedComboBox : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theWheelScrollsTheAreaAround()
    {
        Form form;
        QVERIFY(form.combo->ignoreWheelEvents());
        QCOMPARE(form.wheel(), form.area.viewport());
        QCOMPARE(form.combo->currentIndex(), 1);
        QVERIFY(form.area.verticalScrollBar()->value() > 0);
    }

    void theWheelIsSwallowedWhereItIsNotIgnored()
    {
        Form form;
        form.combo->setIgnoreWheelEvents(false);
        QVERIFY(!form.combo->ignoreWheelEvents());
        QCOMPARE(form.wheel(), form.combo);
        QCOMPARE(form.combo->currentIndex(), 1);
        QCOMPARE(form.area.verticalScrollBar()->value(), 0);
    }
};

ZELKOV_TEST_MAIN(TestExtendedComboBox)
#include "tst_extendedcombobox.moc"

// SPDX-License-Identifier: MIT
// The form of a counting corridor.
#include "controls/VxCountingLinesGroupBox.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtTest/QtTest>
#include <QtWidgets/QGridLayout>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QSpinBox>
#include <QtWidgets/QVBoxLayout>

class TestCountingLines : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theFrameIsSetUp()
    {
        vx::VxCountingLinesGroupBox box;
        QCOMPARE(box.objectName(), QStringLiteral("CountingLinesGroupBox"));
        QCOMPARE(box.title(), QStringLiteral("Counting Corridors"));
        QVERIFY(box.isFlat());
        QCOMPARE(box.font().weight(), 75);
        QCOMPARE(box.size(), QSize(333, 349)); // the minimum rules
        QCOMPARE(box.minimumWidth(), 329);
        QCOMPARE(box.minimumHeight(), 349);
        QCOMPARE(box.maximumHeight(), 349);
    }

    void theLabelsSayWhatTheyAreFor_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<QString>("text");
        QTest::addColumn<int>("alignment");
        const int right = int(Qt::AlignRight | Qt::AlignVCenter);
        const int left = int(Qt::AlignLeft | Qt::AlignVCenter);
        QTest::newRow("label_8") << "label_8" << "x" << right;
        QTest::newRow("label_22") << "label_22" << "y" << right;
        QTest::newRow("label_23") << "label_23" << "x" << right;
        QTest::newRow("label_24") << "label_24" << "y" << right;
        QTest::newRow("label") << "label" << "Starting point:" << left;
        QTest::newRow("label_3") << "label_3" << "End point:" << left;
        QTest::newRow("label_2") << "label_2" << "ID" << left;
        QTest::newRow("label_17") << "label_17" << "Name" << left;
        QTest::newRow("label_18") << "label_18" << "Title \"East\"" << left;
        QTest::newRow("label_25") << "label_25" << "Title \"West\"" << left;
    }
    void theLabelsSayWhatTheyAreFor()
    {
        QFETCH(QString, name);
        vx::VxCountingLinesGroupBox box;
        auto* const label = box.findChild<QLabel*>(name);
        QVERIFY(label);
        QTEST(label->text(), "text");
        QTEST(int(label->alignment()), "alignment");
        QCOMPARE(label->font().weight(), 50);
    }

    void theSpinBoxesStartAtTheLowerRightCorner_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("last");
        QTest::newRow("editX1_2") << "editX1_2" << 1280;
        QTest::newRow("editY1_2") << "editY1_2" << 960;
        QTest::newRow("editX2_2") << "editX2_2" << 1280;
        QTest::newRow("editY2_2") << "editY2_2" << 960;
    }
    void theSpinBoxesStartAtTheLowerRightCorner()
    {
        QFETCH(QString, name);
        QFETCH(int, last);
        vx::VxCountingLinesGroupBox box;
        auto* const edit = box.findChild<QSpinBox*>(name);
        QVERIFY(edit);
        QCOMPARE(edit->value(), last);
        QCOMPARE(edit->maximum(), last);
        QCOMPARE(edit->singleStep(), 10);
        QCOMPARE(edit->alignment(), Qt::AlignRight | Qt::AlignVCenter);
        QCOMPARE(edit->maximumWidth(), 16777215);
        QCOMPARE(edit->minimumHeight(), edit->maximumHeight());
    }

    void theGroupsAndLayoutsHaveTheirNames()
    {
        vx::VxCountingLinesGroupBox box;
        auto* const coordinates = box.findChild<QGroupBox*>(QStringLiteral("coordGroupBox_2"));
        QVERIFY(coordinates);
        QCOMPARE(coordinates->title(), QStringLiteral("Coordinates"));
        QVERIFY(coordinates->isFlat());
        QVERIFY(coordinates->alignment() & Qt::AlignHCenter);
        auto* const parameters = box.findChild<QGroupBox*>(QStringLiteral("paramGroupBox_2"));
        QVERIFY(parameters);
        QCOMPARE(parameters->title(), QStringLiteral("Additional Parameters"));
        auto* const host = box.findChild<QWidget*>(QStringLiteral("layoutWidget"));
        QVERIFY(host);
        QCOMPARE(host->parentWidget(), &box);
        QCOMPARE(host->findChild<QVBoxLayout*>(QStringLiteral("verticalLayout"))->contentsMargins(), QMargins());
        QVERIFY(box.findChild<QGridLayout*>(QStringLiteral("gridLayout_2")));
    }

    void theSidesHaveNames()
    {
        vx::VxCountingLinesGroupBox box;
        QCOMPARE(box.rightName(), QStringLiteral("East"));
        QCOMPARE(box.leftName(), QStringLiteral("West"));
        box.setRightName(QStringLiteral("Street"));
        box.setLeftName(QStringLiteral("Yard"));
        QCOMPARE(box.findChild<QLineEdit*>(QStringLiteral("lineEastEdit_2"))->text(), QStringLiteral("Street"));
        QCOMPARE(box.findChild<QLineEdit*>(QStringLiteral("lineWestEdit_2"))->text(), QStringLiteral("Yard"));
        QCOMPARE(box.rightName(), QStringLiteral("Street"));
        QCOMPARE(box.leftName(), QStringLiteral("Yard"));
    }

    void valuesGoInAndOut()
    {
        vx::VxCountingLinesGroupBox box;
        box.setStartingPoint(QPoint(11, 22));
        box.setEndPoint(QPoint(33, 44));
        box.setLineName(QStringLiteral("Gate"));
        QCOMPARE(box.startingPoint(), QPoint(11, 22));
        QCOMPARE(box.endPoint(), QPoint(33, 44));
        QCOMPARE(box.findChild<QSpinBox*>(QStringLiteral("editX1_2"))->value(), 11);
        QCOMPARE(box.findChild<QSpinBox*>(QStringLiteral("editY2_2"))->value(), 44);
        QCOMPARE(box.lineName(), QStringLiteral("Gate"));
        QCOMPARE(box.findChild<QLineEdit*>(QStringLiteral("lineNameEdit_2"))->text(), QStringLiteral("Gate"));
    }

    void theIdentifierIsANumberInTheField()
    {
        vx::VxCountingLinesGroupBox box;
        auto* const edit = box.findChild<QLineEdit*>(QStringLiteral("lineIdEdit_2"));
        box.setId(12);
        QCOMPARE(edit->text(), QStringLiteral("12"));
        QCOMPARE(box.id(), 12);
        edit->setText(QStringLiteral("x1"));
        QCOMPARE(box.id(), 0);
        QCOMPARE(edit->maximumWidth(), 40);
        QCOMPARE(edit->maxLength(), 3);
    }

    void theUserCannotChangeTheIdentifier()
    {
        vx::VxCountingLinesGroupBox box;
        box.setId(7);
        auto* const edit = box.findChild<QLineEdit*>(QStringLiteral("lineIdEdit_2"));
        QVERIFY(edit->isReadOnly());
        QTest::keyClicks(edit, QStringLiteral("99"));
        QCOMPARE(box.id(), 7);
    }

    void theRangeLimitsBothPoints()
    {
        vx::VxCountingLinesGroupBox box;
        box.setRange(QRect(0, 0, 641, 481));
        QCOMPARE(box.startingPoint(), QPoint(640, 480));
        QCOMPARE(box.endPoint(), QPoint(640, 480));
        box.setRange(QRect(5, 6, 10, 10));
        box.setStartingPoint(QPoint(0, 0));
        QCOMPARE(box.startingPoint(), QPoint(5, 6));
    }

    void theFormFillsTheBox()
    {
        vx::VxCountingLinesGroupBox box;
        box.resize(500, 349);
        box.show();
        QTRY_COMPARE(box.findChild<QWidget*>(QStringLiteral("layoutWidget"))->geometry(), box.contentsRect());
    }
};

ZELKOV_TEST_MAIN(TestCountingLines)
#include "tst_countinglines.moc"

// SPDX-License-Identifier: MIT
// The sliders of fixed orientation, and value ranges as the keys of a map.
#include "foundation/ValueRange.h"
#include "sliders/HSlider.h"
#include "sliders/VSlider.h"
#include "support/TestCase.h"
#include "support/TestMain.h"

#include <QtCore/QMap>
#include <QtTest/QtTest>

class TestPlainSliders : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aHorizontalSliderIsMadeFromItsParentAlone();
    void aVerticalSliderIsMadeFromItsParentAlone();
    void styleSheetsKnowThemAsQSlider();
    void aMapOfRangesIsOrderedByFirstThenBySecond();
    void rangesThatDifferAreDifferentKeys();
};

void TestPlainSliders::aHorizontalSliderIsMadeFromItsParentAlone()
{
    QWidget parent;
    const auto* slider = new vx::HSlider(&parent);
    QCOMPARE(slider->orientation(), Qt::Horizontal);
    QCOMPARE(slider->parentWidget(), &parent);
    QCOMPARE(slider->maximum(), QSlider(Qt::Horizontal).maximum());
    vx::HSlider alone;
    QVERIFY(alone.parentWidget() == nullptr);
}

void TestPlainSliders::aVerticalSliderIsMadeFromItsParentAlone()
{
    QWidget parent;
    const auto* slider = new vx::VSlider(&parent);
    QCOMPARE(slider->orientation(), Qt::Vertical);
    QCOMPARE(slider->parentWidget(), &parent);
    vx::VSlider alone;
    QCOMPARE(alone.orientation(), Qt::Vertical);
}

void TestPlainSliders::styleSheetsKnowThemAsQSlider()
{
    const vx::HSlider horizontal;
    const vx::VSlider vertical;
    QCOMPARE(horizontal.metaObject(), &QSlider::staticMetaObject);
    QCOMPARE(vertical.metaObject(), &QSlider::staticMetaObject);
}

void TestPlainSliders::aMapOfRangesIsOrderedByFirstThenBySecond()
{
    QMap<vx::ValueRange, int> map;
    map.insert(vx::ValueRange(5, 9), 3);
    map.insert(vx::ValueRange(5, 6), 2);
    map.insert(vx::ValueRange(4, 100), 1);
    map.insert(vx::ValueRange(-3, -9), 0);
    QCOMPARE(map.values(), (QList<int> {0, 1, 2, 3}));
}

void TestPlainSliders::rangesThatDifferAreDifferentKeys()
{
    QMap<vx::ValueRange, int> map;
    map.insert(vx::ValueRange(7), 1);
    QVERIFY(map.contains(vx::ValueRange(7, 7)));
    QVERIFY(!map.contains(vx::ValueRange(7, 8)));
    QVERIFY(!map.contains(vx::ValueRange(6, 7)));
    QVERIFY(!map.contains(vx::ValueRange()));
}

ZELKOV_TEST_MAIN(TestPlainSliders)
#include "tst_plainsliders.moc"

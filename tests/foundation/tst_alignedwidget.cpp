// SPDX-License-Identifier: MIT
// One child in the middle.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/AlignedWidget.h"

#include <QtTest/QtTest>
#include <QtWidgets/QHBoxLayout>

namespace
{
class Box : public QWidget
{
public:
    using QWidget::QWidget;
    QSize sizeHint() const override { return {40, 20}; }
};
}

class TestAlignedWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theChildStandsInTheCentreInItsPreferredSize_data()
    {
        QTest::addColumn<QSize>("size");
        QTest::addColumn<QRect>("expected");
        QTest::newRow("large") << QSize(200, 100) << QRect(80, 40, 40, 20);
        QTest::newRow("wide") << QSize(400, 20) << QRect(180, 0, 40, 20);
        QTest::newRow("exact") << QSize(40, 20) << QRect(0, 0, 40, 20);
        QTest::newRow("odd rest") << QSize(41, 21) << QRect(0, 0, 40, 20);
    }
    void theChildStandsInTheCentreInItsPreferredSize()
    {
        QFETCH(QSize, size);
        QFETCH(QRect, expected);
        auto* const box = new Box;
        vx::AlignedWidget aligned(box, nullptr);
        aligned.resize(size);
        aligned.show();
        QCOMPARE(box->geometry(), expected);
        aligned.resize(size + QSize(100, 100));
        QCoreApplication::sendPostedEvents();
        QCOMPARE(box->geometry(), expected.translated(50, 50));
    }

    void theLayoutIsARowWithoutMargins()
    {
        vx::AlignedWidget aligned(new QWidget, nullptr);
        const auto* const layout = qobject_cast<QHBoxLayout*>(aligned.layout());
        QVERIFY(layout != nullptr);
        QCOMPARE(layout->contentsMargins(), QMargins());
        QCOMPARE(layout->alignment(), Qt::Alignment(Qt::AlignCenter));
        QCOMPARE(layout->count(), 1);
    }

    void theChildBelongsToIt()
    {
        QWidget parent;
        QPointer<QWidget> child = new QWidget;
        auto* const aligned = new vx::AlignedWidget(child, &parent);
        QCOMPARE(aligned->parentWidget(), &parent);
        QCOMPARE(child->parentWidget(), aligned);
        QCOMPARE(aligned->qchild(), child.data());
        delete aligned;
        QVERIFY(child.isNull());
    }

    void withoutAChildItIsEmptyAndSilent()
    {
        vx::AlignedWidget aligned(nullptr, nullptr);
        QVERIFY(aligned.qchild() == nullptr);
        QVERIFY(aligned.layout() != nullptr);
        aligned.show();
    }

    void aDeletedChildReadsAsNull()
    {
        auto* const child = new QWidget;
        vx::AlignedWidget aligned(child, nullptr);
        delete child;
        QVERIFY(aligned.qchild() == nullptr);
        aligned.show();
    }

    void anAncestorIsNotTakenAsChild()
    {
        QWidget parent;
        auto* const aligned = new vx::AlignedWidget(&parent, &parent);
        QVERIFY(aligned->qchild() == nullptr);
        QCOMPARE(aligned->parentWidget(), &parent);
    }

    void theQueryIsVirtual()
    {
        class Other : public vx::AlignedWidget
        {
        public:
            using vx::AlignedWidget::AlignedWidget;
            QWidget* qchild() const override { return const_cast<Other*>(this); }
        };
        Other other(new QWidget, nullptr);
        const vx::AlignedWidget& base = other;
        QCOMPARE(base.qchild(), static_cast<QWidget*>(&other));
    }
};

ZELKOV_TEST_MAIN(TestAlignedWidget)
#include "tst_alignedwidget.moc"

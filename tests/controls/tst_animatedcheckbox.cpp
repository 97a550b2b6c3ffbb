// SPDX-License-Identifier: MIT
// The switch with three frames.
#include "Pointer.h"
#include "TestCase.h"
#include "TestMain.h"
#include "controls/AnimatedCheckBox.h"

#include <QtCore/QPropertyAnimation>
#include <QtGui/QPainter>
#include <QtTest/QtTest>

namespace
{
class OpenAnimated : public AnimatedCheckBox
{
public:
    using AnimatedCheckBox::AnimatedCheckBox;
    using AnimatedCheckBox::checkStateSet;
    using AnimatedCheckBox::controlIconAnimationDuration;
};
}

class TestAnimatedCheckBox : public zelkovtest::TestCase
{
    Q_OBJECT

    QTemporaryDir m_folder;
    QString m_file;

    static QPointF position(const AnimatedCheckBox& box) { return box.property("iconPosition").toPointF(); }

private Q_SLOTS:
    void initTestCase()
    {
        QPixmap frames(91, 20);
        frames.fill(Qt::black);
        QPainter painter(&frames);
        painter.fillRect(0, 0, 30, 20, Qt::red);
        painter.fillRect(30, 0, 30, 20, Qt::green);
        painter.fillRect(60, 0, 31, 20, Qt::blue);
        painter.end();
        m_file = m_folder.filePath(QStringLiteral("frames.png"));
        QVERIFY(frames.save(m_file));
    }

    void itStartsAtTheThirdFrame()
    {
        OpenAnimated box(nullptr, true, m_file);
        QCOMPARE(position(box), QPointF(-60, 0));
        QCOMPARE(*box.controlIconAnimationDuration(), 10);
        QCOMPARE(box.sizeHint(), QSize(30, 20));
        QVERIFY(box.isChecked());
    }

    void eachStateHasItsPlace()
    {
        QWidget window;
        window.resize(200, 100);
        AnimatedCheckBox box(&window, false, m_file);
        box.setGeometry(10, 10, 30, 20);
        QCOMPARE(position(box), QPointF(-60, 0));
        box.setVisible(true);
        QCOMPARE(position(box), QPointF(-30, 0));
        window.show();
        box.setChecked(true);
        QCOMPARE(position(box), QPointF(0, 0));
        box.setChecked(false);
        QCOMPARE(position(box), QPointF(-30, 0));
        box.setCheckState(Qt::PartiallyChecked);
        QCOMPARE(position(box), QPointF(-30, 0));
        box.setVisible(true);
        QCOMPARE(position(box), QPointF(-60, 0));
    }

    void aPartialStateMovesNothing()
    {
        OpenAnimated box(nullptr, false, m_file);
        box.setCheckState(Qt::PartiallyChecked);
        const QPointF before = position(box);
        box.checkStateSet();
        QCOMPARE(position(box), before);
    }

    void itDrawsTheFrameOfTheState_data()
    {
        QTest::addColumn<int>("state");
        QTest::addColumn<QColor>("colour");
        QTest::newRow("checked") << int(Qt::Checked) << QColor(Qt::red);
        QTest::newRow("unchecked") << int(Qt::Unchecked) << QColor(Qt::green);
        QTest::newRow("partially") << int(Qt::PartiallyChecked) << QColor(Qt::blue);
    }
    void itDrawsTheFrameOfTheState()
    {
        QFETCH(int, state);
        QFETCH(QColor, colour);
        QWidget window;
        window.resize(100, 60);
        AnimatedCheckBox box(&window, false, m_file);
        box.setGeometry(0, 0, 50, 40);
        box.setCheckState(Qt::CheckState(state));
        box.setVisible(true);
        window.show();
        QImage picture(50, 40, QImage::Format_RGB32);
        picture.fill(Qt::white);
        box.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());
        QCOMPARE(picture.pixelColor(1, 1), colour);
        QCOMPARE(picture.pixelColor(28, 18), colour);
        QCOMPARE(picture.pixelColor(30, 10), QColor(Qt::white));
        QCOMPARE(picture.pixelColor(10, 20), QColor(Qt::white));
    }

    void aClickIsFast()
    {
        QWidget window;
        window.resize(200, 100);
        AnimatedCheckBox box(&window, false, m_file);
        box.setGeometry(10, 10, 30, 20);
        box.setVisible(true);
        window.show();
        zelkovtest::Pointer pointer(&window);
        pointer.click(QPoint(20, 20));
        QVERIFY(box.isChecked());
        // 30 pixels, twice, of a strip of 91.
        QCOMPARE(box.findChild<QPropertyAnimation*>()->duration(), 6);
        QTRY_COMPARE(position(box), QPointF(0, 0));
    }

    void withoutAPictureItHasNoSize()
    {
        QWidget window;
        window.resize(100, 60);
        AnimatedCheckBox box(&window);
        QCOMPARE(box.sizeHint(), QSize(0, 0));
        window.show();
        box.grab();
        zelkovtest::Pointer pointer(&window);
        box.setChecked(true);
        QVERIFY(box.isChecked());
    }
};

ZELKOV_TEST_MAIN(TestAnimatedCheckBox)
#include "tst_animatedcheckbox.moc"

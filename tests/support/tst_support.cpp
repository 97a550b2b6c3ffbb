// SPDX-License-Identifier: MIT
// The tools that all other tests stand on: a check that never fires would make them all worthless.
#include <QtTest/QtTest>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QApplication>

#include "Pointer.h"
#include "SignalRecorder.h"
#include "TestCase.h"
#include "TestMain.h"

class Talker : public QObject
{
    Q_OBJECT
Q_SIGNALS:
    void first(int number, const QString& text);
    void second();

public:
    void talk()
    {
        Q_EMIT second();
        Q_EMIT first(7, QStringLiteral("seven"));
        Q_EMIT second();
    }
};

class MovesWidget : public QWidget
{
public:
    QVector<QPair<QEvent::Type, ulong>> seen;

protected:
    bool event(QEvent* event) override
    {
        if (event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseMove
            || event->type() == QEvent::MouseButtonRelease || event->type() == QEvent::MouseButtonDblClick) {
            seen.append({event->type(), static_cast<QMouseEvent*>(event)->timestamp()});
            event->accept();
            return true;
        }
        return QWidget::event(event);
    }
};

class TestSupport : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aWarningIsSeen()
    {
        qWarning("planted");
        QCOMPARE(unexpectedWarnings(), QStringList(QStringLiteral("planted")));
        forgetWarnings();
    }

    void anAnnouncedWarningIsForgiven()
    {
        expectWarning(QRegularExpression(QStringLiteral("^planted$")));
        qWarning("planted");
        QVERIFY(unexpectedWarnings().isEmpty());
    }

    void aWidgetThatOutlivesTheTestIsSeen()
    {
        auto* left = new QPushButton(QStringLiteral("left"));
        left->setObjectName(QStringLiteral("left"));
        QCOMPARE(leftovers(), QStringList(QStringLiteral("widget QPushButton \"left\"")));
        delete left;
        QVERIFY(leftovers().isEmpty());
    }

    void theRecorderListsSignalsInOrderWithArguments()
    {
        Talker talker;
        zelkovtest::SignalRecorder recorder(&talker);
        talker.talk();
        QCOMPARE(recorder.names(), QStringList({QStringLiteral("second"), QStringLiteral("first"), QStringLiteral("second")}));
        QCOMPARE(recorder.entries().at(1).arguments, QVariantList({7, QStringLiteral("seven")}));
        QCOMPARE(recorder.count(QStringLiteral("second")), 2);
    }

    void thePointerDeliversDragMovesWithItsOwnTimes()
    {
        QWidget host;
        host.resize(200, 200);
        MovesWidget pad;
        pad.setParent(&host);
        pad.setGeometry(50, 50, 100, 100);
        host.show();
        QVERIFY(QTest::qWaitForWindowExposed(&host));
        zelkovtest::Pointer pointer(&pad, 5000);
        pointer.move({10, 10});
        pointer.press(Qt::LeftButton, 100);
        pointer.move({40, 40}, 30);
        pointer.release(Qt::LeftButton, 20);
        const QVector<QPair<QEvent::Type, ulong>> expected{{QEvent::MouseButtonPress, 5110},
            {QEvent::MouseMove, 5140}, {QEvent::MouseButtonRelease, 5160}};
        QCOMPARE(pad.seen, expected);
    }
};

ZELKOV_TEST_MAIN(TestSupport)
#include "tst_support.moc"

// SPDX-License-Identifier: MIT
// Connections by signature text: blanks, bad input, silence.
#include "CoreQt/Connect.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QPoint>
#include <QtTest/QtTest>

// Not registered with the meta-type system.
struct Secret
{
    int value = 0;
};

class Sender : public QObject
{
    Q_OBJECT

public:
    void send(int number, const QPoint& point) { Q_EMIT sent(number, point); }
    void sendPlain() { Q_EMIT plain(); }

Q_SIGNALS:
    void sent(int number, const QPoint& point);
    void plain();
    void secret(const Secret& value);
};

class Receiver : public QObject
{
    Q_OBJECT

public:
    int calls = 0;
    QPoint point;

public Q_SLOTS:
    void onSent(int, const QPoint& p)
    {
        ++calls;
        point = p;
    }
    void onNumber(int) { ++calls; }
    void onPlain() { ++calls; }
    void onText(const QString&) { ++calls; }
    void onSecret(const Secret&) { ++calls; }

Q_SIGNALS:
    void forwarded();
};

class TestConnect : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void signatureTextsConnect_data()
    {
        QTest::addColumn<QByteArray>("signal");
        QTest::addColumn<QByteArray>("slot");
        QTest::newRow("normal") << QByteArray("2sent(int,QPoint)") << QByteArray("1onSent(int,QPoint)");
        QTest::newRow("blanks") << QByteArray("2 sent( int , const QPoint & )")
                                << QByteArray("1onSent(int ,const QPoint& ) ");
        QTest::newRow("fewer arguments") << QByteArray("2sent(int, QPoint)") << QByteArray("1onNumber( int )");
        QTest::newRow("no arguments") << QByteArray("2sent(int, const QPoint&)") << QByteArray("1onPlain( )");
    }
    void signatureTextsConnect()
    {
        QFETCH(QByteArray, signal);
        QFETCH(QByteArray, slot);
        Sender sender;
        Receiver receiver;
        QVERIFY(vx::connect(&sender, signal.constData(), &receiver, slot.constData()));
        sender.send(1, QPoint(2, 3));
        QCOMPARE(receiver.calls, 1);
        QVERIFY(vx::disconnect(&sender, signal.constData(), &receiver, slot.constData()));
        sender.send(1, QPoint(2, 3));
        QCOMPARE(receiver.calls, 1);
        QVERIFY(!vx::disconnect(&sender, signal.constData(), &receiver, slot.constData()));
    }

    void badInputConnectsNothingAndPrintsNothing_data()
    {
        QTest::addColumn<QByteArray>("signal");
        QTest::addColumn<QByteArray>("slot");
        QTest::newRow("unknown signal") << QByteArray("2nothing()") << QByteArray("1onPlain()");
        QTest::newRow("unknown slot") << QByteArray("2plain()") << QByteArray("1nothing()");
        QTest::newRow("no codes") << QByteArray("plain()") << QByteArray("onPlain()");
        QTest::newRow("slot as signal") << QByteArray("1deleteLater()") << QByteArray("1onPlain()");
        QTest::newRow("signal coded as slot") << QByteArray("1plain()") << QByteArray("1onPlain()");
        QTest::newRow("wrong argument") << QByteArray("2sent(int,QPoint)") << QByteArray("1onText(QString)");
        QTest::newRow("too many arguments") << QByteArray("2plain()") << QByteArray("1onNumber(int)");
        QTest::newRow("empty") << QByteArray("") << QByteArray("");
        QTest::newRow("codes only") << QByteArray("2") << QByteArray("1");
        QTest::newRow("no brackets") << QByteArray("2plain") << QByteArray("1onPlain");
        QTest::newRow("rubbish") << QByteArray("2)(,") << QByteArray("1<<>(");
    }
    void badInputConnectsNothingAndPrintsNothing()
    {
        QFETCH(QByteArray, signal);
        QFETCH(QByteArray, slot);
        Sender sender;
        Receiver receiver;
        QVERIFY(!vx::connect(&sender, signal.constData(), &receiver, slot.constData()));
        QVERIFY(!vx::disconnect(&sender, signal.constData(), &receiver, slot.constData()));
        sender.send(1, {});
        sender.sendPlain();
        QCOMPARE(receiver.calls, 0);
    }

    void nullIsRefusedInSilence()
    {
        Sender sender;
        Receiver receiver;
        QVERIFY(!vx::connect(nullptr, "2plain()", &receiver, "1onPlain()"));
        QVERIFY(!vx::connect(&sender, nullptr, &receiver, "1onPlain()"));
        QVERIFY(!vx::connect(&sender, "2plain()", nullptr, "1onPlain()"));
        QVERIFY(!vx::connect(&sender, "2plain()", &receiver, nullptr));
        QVERIFY(!vx::disconnect(nullptr, "2plain()", &receiver, "1onPlain()"));
        QVERIFY(!vx::disconnect(&sender, "2plain()", nullptr, "1onPlain()"));
    }

    void disconnectTakesNullAsAny()
    {
        Sender sender;
        Receiver receiver;
        const auto connectBoth = [&] {
            return vx::connect(&sender, "2plain()", &receiver, "1onPlain()")
                && vx::connect(&sender, "2sent(int,QPoint)", &receiver, "1onPlain()");
        };
        QVERIFY(connectBoth());
        QVERIFY(vx::disconnect(&sender, nullptr, &receiver, nullptr));
        sender.sendPlain();
        sender.send(1, {});
        QCOMPARE(receiver.calls, 0);

        QVERIFY(connectBoth());
        QVERIFY(vx::disconnect(&sender, "2plain()", nullptr, nullptr));
        sender.sendPlain();
        QCOMPARE(receiver.calls, 0);
        sender.send(1, {});
        QCOMPARE(receiver.calls, 1);
    }

    void aSignalCanBeForwarded()
    {
        Sender sender;
        Receiver receiver;
        QSignalSpy spy(&receiver, &Receiver::forwarded);
        QVERIFY(vx::connect(&sender, "2plain()", &receiver, "2forwarded( )"));
        sender.sendPlain();
        QCOMPARE(spy.count(), 1);
    }

    void theConnectionTypeIsTaken()
    {
        Sender sender;
        Receiver receiver;
        QVERIFY(vx::connect(&sender, "2sent(int, const QPoint& )", &receiver, "1onSent(int, const QPoint& )",
            Qt::QueuedConnection));
        sender.send(1, QPoint(5, 6));
        QCOMPARE(receiver.calls, 0);
        QCoreApplication::processEvents();
        QCOMPARE(receiver.calls, 1);
        QCOMPARE(receiver.point, QPoint(5, 6));
    }

    void aUniqueConnectionIsMadeOnce()
    {
        Sender sender;
        Receiver receiver;
        QVERIFY(vx::connect(&sender, "2plain()", &receiver, "1onPlain()", Qt::UniqueConnection));
        QVERIFY(!vx::connect(&sender, "2plain()", &receiver, "1onPlain()", Qt::UniqueConnection));
        sender.sendPlain();
        QCOMPARE(receiver.calls, 1);
    }

    void whatCannotBeQueuedIsRefusedInSilence()
    {
        Sender sender;
        Receiver receiver;
        QVERIFY(!vx::connect(&sender, "2secret(Secret)", &receiver, "1onSecret(Secret)", Qt::QueuedConnection));
        QVERIFY(vx::connect(&sender, "2secret(Secret)", &receiver, "1onSecret(Secret)"));
    }
};

ZELKOV_TEST_MAIN(TestConnect)
#include "tst_connect.moc"

// SPDX-License-Identifier: MIT
// Deferred slot calls: what is stored, what is copied, what a call with it does.
#include "CoreQt/QtSlot.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QMap>
#include <QtCore/QPoint>
#include <QtCore/QVariant>
#include <QtTest/QtTest>

#include <memory>

class Handle;  // never defined

struct Reading
{
    int value = 0;
};

Q_DECLARE_METATYPE(Reading)

struct Stranger
{
    int value = 0;
};

class Target : public QObject
{
    Q_OBJECT

public:
    QString log;

public Q_SLOTS:
    void onDragged(int value, const QPoint& point)
    {
        log = QStringLiteral("%1 at %2,%3").arg(value).arg(point.x()).arg(point.y());
    }
    void onText(const QString& text) { log = text; }
    void onReading(const Reading& reading) { log = QString::number(reading.value); }
    void onVariant(const QVariant& value) { log = QString::fromLatin1(value.typeName()); }
    void onTen(int a, int b, int c, int d, int e, int f, int g, int h, int i, int j)
    {
        log.clear();
        for (const int value : {a, b, c, d, e, f, g, h, i, j}) {
            log += QString::number(value) + QLatin1Char(' ');
        }
    }
};

class TestQtSlot : public zelkovtest::TestCase
{
    Q_OBJECT

    static bool invoke(const vx::QtSlot& slot)
    {
        return QMetaObject::invokeMethod(slot.receiver(), slot.slotName(), slot.connectionType(), slot.parameter(0),
            slot.parameter(1), slot.parameter(2), slot.parameter(3), slot.parameter(4), slot.parameter(5),
            slot.parameter(6), slot.parameter(7), slot.parameter(8), slot.parameter(9));
    }

private Q_SLOTS:
    void anEmptySlotCallsNothing()
    {
        const vx::QtSlot slot;
        QVERIFY(slot.receiver() == nullptr);
        QCOMPARE(slot.slotName(), "");
        QCOMPARE(slot.connectionType(), Qt::AutoConnection);
        for (int i = 0; i < vx::QtSlot::s_ParameterCount; ++i) {
            QVERIFY(slot.parameter(i).name() == nullptr);
        }
        QVERIFY(!invoke(slot));
    }

    void theConstructorStoresAllThree()
    {
        const Target target;
        const vx::QtSlot slot(&target, "onText", Qt::QueuedConnection);
        QCOMPARE(slot.receiver(), const_cast<Target*>(&target));
        QCOMPARE(slot.slotName(), "onText");
        QCOMPARE(slot.connectionType(), Qt::QueuedConnection);
    }

    void theReceiverReadsAsNullOnceGone()
    {
        auto target = std::make_unique<Target>();
        vx::QtSlot slot(target.get(), "onText");
        target.reset();
        QVERIFY(slot.receiver() == nullptr);
        QVERIFY(!invoke(slot));
    }

    void parametersOutliveTheCallersArguments()
    {
        Target target;
        vx::QtSlot slot(&target, "onDragged");
        {
            auto value = std::make_unique<int>(7);
            auto point = std::make_unique<QPoint>(3, 4);
            slot.setParameter(0, Q_ARG(int, *value));
            slot.setParameter(1, Q_ARG(QPoint, *point));
            *value = -1;
            *point = QPoint(-1, -1);
        }
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("7 at 3,4"));
    }

    void theTypeNameIsCopiedToo()
    {
        Target target;
        vx::QtSlot slot(&target, "onText");
        {
            QByteArray name("QString");
            const QString text = QStringLiteral("hello");
            slot.setParameter(0, QGenericArgument(name.constData(), &text));
            name.fill('x');
        }
        QCOMPARE(slot.parameter(0).name(), "QString");
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("hello"));
    }

    void allTenParametersReachTheSlotInOrder()
    {
        Target target;
        vx::QtSlot slot(&target, "onTen", Qt::DirectConnection);
        for (int i = 9; i >= 0; --i) {
            slot.setParameter(i, Q_ARG(int, i * i));
        }
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("0 1 4 9 16 25 36 49 64 81 "));
    }

    void copiesAreIndependent()
    {
        Target target;
        vx::QtSlot original(&target, "onText");
        original.setParameter(0, Q_ARG(QString, QStringLiteral("one")));
        const vx::QtSlot copy(original);
        vx::QtSlot assigned;
        assigned = original;
        QVERIFY(copy.parameter(0).data() != original.parameter(0).data());
        QVERIFY(assigned.parameter(0).data() != original.parameter(0).data());

        *static_cast<QString*>(original.parameter(0).data()) = QStringLiteral("written to by a slot");
        original.setParameter(1, Q_ARG(int, 1));
        QVERIFY(invoke(copy));
        QCOMPARE(target.log, QStringLiteral("one"));
        QVERIFY(invoke(assigned));
        QCOMPARE(target.log, QStringLiteral("one"));
        QVERIFY(copy.parameter(1).name() == nullptr);
    }

    void copiesOutliveTheOriginal()
    {
        Target target;
        QMap<int, vx::QtSlot> map;
        {
            vx::QtSlot slot(&target, "onText");
            slot.setParameter(0, Q_ARG(QString, QStringLiteral("kept")));
            map.insert(1, slot);
        }
        QVERIFY(invoke(map.value(1)));
        QCOMPARE(target.log, QStringLiteral("kept"));
    }

    void assigningToItselfChangesNothing()
    {
        Target target;
        vx::QtSlot slot(&target, "onText");
        slot.setParameter(0, Q_ARG(QString, QStringLiteral("same")));
        const vx::QtSlot& alias = slot;
        slot = alias;
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("same"));
    }

    void aNewParameterReplacesTheOldOne()
    {
        Target target;
        vx::QtSlot slot(&target, "onText");
        slot.setParameter(0, Q_ARG(int, 5));
        slot.setParameter(0, Q_ARG(QString, QStringLiteral("text")));
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("text"));
    }

    void anEmptyArgumentClearsTheParameter()
    {
        vx::QtSlot slot;
        slot.setParameter(4, Q_ARG(int, 5));
        QCOMPARE(slot.parameter(4).name(), "int");
        slot.setParameter(4, QGenericArgument());
        QVERIFY(slot.parameter(4).name() == nullptr);
    }

    void indexesOutsideZeroToNineAreIgnored()
    {
        vx::QtSlot slot;
        for (const int index : {-1, 10, 1000, -2147483647}) {
            slot.setParameter(index, Q_ARG(int, 5));
            QVERIFY(slot.parameter(index).name() == nullptr);
            QVERIFY(slot.parameter(index).data() == nullptr);
        }
        slot.setParameter(9, Q_ARG(int, 5));
        QCOMPARE(*static_cast<int*>(slot.parameter(9).data()), 5);
    }

    void aTypeThatOnlyTheSlotKnowsIsLookedUpThere()
    {
        QCOMPARE(QMetaType::type("Reading"), int(QMetaType::UnknownType));
        Target target;
        vx::QtSlot slot(&target, "onReading", Qt::DirectConnection);
        {
            const Reading reading{42};
            slot.setParameter(0, Q_ARG(Reading, reading));
        }
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("42"));
    }

    void whatCannotBeCopiedLeavesTheParameterEmpty()
    {
        Target target;
        vx::QtSlot slot(&target, "onReading");
        slot.setParameter(0, Q_ARG(Stranger, Stranger()));
        QVERIFY(slot.parameter(0).name() == nullptr);
    }

    void ofPointersTheAddressIsCopied()
    {
        int place = 0;
        auto* handle = reinterpret_cast<Handle*>(&place);
        vx::QtSlot slot;
        {
            Handle* argument = handle;
            slot.setParameter(0, Q_ARG(Handle*, argument));
            argument = nullptr;
        }
        const vx::QtSlot copy(slot);
        QCOMPARE(*static_cast<Handle**>(copy.parameter(0).data()), handle);
    }

    void aVariantStaysAVariant()
    {
        Target target;
        vx::QtSlot slot(&target, "onVariant");
        slot.setParameter(0, Q_ARG(QVariant, QVariant(QPoint(1, 2))));
        QVERIFY(invoke(slot));
        QCOMPARE(target.log, QStringLiteral("QPoint"));
    }

    void theConnectionTypeIsTheCallers()
    {
        Target target;
        vx::QtSlot slot(&target, "onText", Qt::QueuedConnection);
        slot.setParameter(0, Q_ARG(QString, QStringLiteral("late")));
        QVERIFY(invoke(slot));
        QVERIFY(target.log.isEmpty());
        QCoreApplication::processEvents();
        QCOMPARE(target.log, QStringLiteral("late"));
    }
};

ZELKOV_TEST_MAIN(TestQtSlot)
#include "tst_qtslot.moc"

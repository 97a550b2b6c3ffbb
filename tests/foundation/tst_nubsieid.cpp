// SPDX-License-Identifier: MIT
// The meta-type name is there from the start.
#include "TestCase.h"
#include "TestMain.h"
#include "foundation/NubsieID.h"

#include <QtCore/QMetaType>
#include <QtTest/QtTest>

namespace
{
// Asked before main() and before anything of the library was called.
[[maybe_unused]] const int s_atLoad = QMetaType::type("vx::NubsieID");
}

class TestNubsieID : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void theNameIsRegisteredWhenTheLibraryIsLoaded()
    {
        QCOMPARE(QMetaType::type("vx::NubsieID"), int(QMetaType::Int));
#ifndef ZELKOV_WIDGETS_STATIC_DEFINE
        QCOMPARE(s_atLoad, int(QMetaType::Int));
#endif
    }

    void theIdIsThatOfInt() { QCOMPARE(vx::nubsieIDMetaType(), int(QMetaType::Int)); }
};

ZELKOV_TEST_MAIN(TestNubsieID)
#include "tst_nubsieid.moc"

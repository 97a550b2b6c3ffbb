// SPDX-License-Identifier: MIT
// The security interface: a client can implement it, and its queries keep their order.
#include "TestCase.h"
#include "TestMain.h"
#include "ZelkovUtils/ISecurityManager.h"

#include <QtTest/QtTest>

#include <cstring>
#include <memory>

namespace
{
class Guard : public vx::ISecurityManager
{
public:
    explicit Guard(bool* destroyed)
        : m_destroyed(destroyed)
    {
    }
    ~Guard() override { *m_destroyed = true; }
    bool isRightRefused(const QString& right, bool, bool, bool) override { return right == QLatin1String("export"); }
    bool isAdministrator(bool first, bool) override { return first; }

private:
    bool* m_destroyed;
};

#if defined(__GXX_ABI_VERSION) && defined(__x86_64__)
// Where a virtual function stands in the table: the first word of a member pointer is its byte offset + 1.
template<typename Function>
qintptr slotOf(Function function)
{
    qintptr word = 0;
    std::memcpy(&word, &function, sizeof word);
    return (word - 1) / static_cast<qintptr>(sizeof(void*));
}
#endif
}

class TestISecurityManager : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void aClientsManagerAnswersThroughTheInterface()
    {
        bool destroyed = false;
        {
            const std::shared_ptr<vx::ISecurityManager> manager = std::make_shared<Guard>(&destroyed);
            QVERIFY(manager->isRightRefused(QStringLiteral("export"), true, false, false));
            QVERIFY(!manager->isRightRefused(QStringLiteral("view"), true, false, false));
            QVERIFY(manager->isAdministrator(true, false));
            QVERIFY(!manager->isAdministrator(false, false));
        }
        QVERIFY(destroyed);
    }

    void theRightQueryStandsDirectlyBeforeTheAdministratorQuery()
    {
#if defined(__GXX_ABI_VERSION) && defined(__x86_64__)
        QCOMPARE(slotOf(&vx::ISecurityManager::isRightRefused) + 1, slotOf(&vx::ISecurityManager::isAdministrator));
#else
        QSKIP("The layout of member pointers is not known here.");
#endif
    }
};

ZELKOV_TEST_MAIN(TestISecurityManager)
#include "tst_isecuritymanager.moc"

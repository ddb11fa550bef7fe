// SPDX-License-Identifier: MIT
#include "fakehandler.h"
#include "logcapture.h"

#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentRequest>
#include <HmiCore/IntentActionRequest>

#include <QTest>

#include <functional>
#include <memory>
#include <optional>

using namespace HmiCore;

namespace {

constexpr int intent = HmiIntentManager::UserType + 1;
constexpr int unhandled = HmiIntentManager::UserType + 2;

class CountingProvider : public IntentActionDataProvider
{
public:
    CountingProvider()
        : IntentActionDataProvider(nullptr)
    {
    }
    QList<QVariant> intentData() override
    {
        // The provider may use the manager.
        return {++asked, HmiIntentManager::instance()->canPerformAction(intent)};
    }
    int asked = 0;
};

} // namespace

class IntentRequestsTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    FakeHandler first{QStringLiteral("first"), {intent}};
    FakeHandler second{QStringLiteral("second"), {intent}};

private Q_SLOTS:
    void initTestCase()
    {
        HmiIntentManager::instance()->registerIntentHandler(&first);
        HmiIntentManager::instance()->registerIntentHandler(&second);
    }
    void init()
    {
        log.emplace();
        first.requests.clear();
        second.requests.clear();
    }
    void cleanup() { log.reset(); }

    void sendsAllItWasGiven()
    {
        const HmiIntentRequest request(intent, {1, 2}, true, true, QStringLiteral("spoken"));
        QVERIFY(request());
        QCOMPARE(second.requests.size(), 1);
        QCOMPARE(first.requests.size(), 0); // exclusive
        QCOMPARE(second.requests.constLast().data, QList<QVariant>({1, 2}));
        QVERIFY(second.requests.constLast().vrEvent);
        QCOMPARE(second.requests.constLast().vrEventData, QVariant(QStringLiteral("spoken")));
    }

    void theShortFormHasNoDataAndIsNotExclusive()
    {
        const HmiIntentRequest request(intent, true, 5);
        QVERIFY(request());
        QCOMPARE(first.requests.size(), 1);
        QCOMPARE(second.requests.size(), 1);
        QVERIFY(first.requests.constLast().data.isEmpty());
        QCOMPARE(first.requests.constLast().vrEventData, QVariant(5));
    }

    void everyCallIsARequest()
    {
        const HmiIntentRequest request(intent, false, QVariant());
        const std::function<bool()> copy = request;
        QVERIFY(request());
        QVERIFY(copy());
        QCOMPARE(first.requests.size(), 2);
    }

    void tellsThatNobodyDidIt()
    {
        QVERIFY(!HmiIntentRequest(unhandled, false, QVariant())());
        QCOMPARE(log->take(QStringLiteral("kest.hmicore"), QtWarningMsg).size(), 1);
    }

    void theProviderIsAskedEachTime()
    {
        CountingProvider provider;
        const IntentActionRequest request(intent, &provider);
        request();
        request();
        QCOMPARE(provider.asked, 2);
        QCOMPARE(first.requests.at(0).data, QList<QVariant>({1, true}));
        QCOMPARE(first.requests.at(1).data, QList<QVariant>({2, true}));
        QCOMPARE(second.requests.size(), 2); // never exclusive
        QVERIFY(!first.requests.at(0).vrEvent);
        QVERIFY(!first.requests.at(0).vrEventData.isValid());
    }

    void withoutAProviderThereIsNoData()
    {
        auto provider = std::make_unique<CountingProvider>();
        const IntentActionRequest request(intent, provider.get());
        const std::function<void()> copy = request;
        provider.reset();
        request();
        copy();
        IntentActionRequest(intent, nullptr)();
        QCOMPARE(first.requests.size(), 3);
        for (const FakeHandler::Request& made : qAsConst(first.requests))
            QVERIFY(made.data.isEmpty());
    }
};

QTEST_GUILESS_MAIN(IntentRequestsTest)
#include "tst_intentrequests.moc"

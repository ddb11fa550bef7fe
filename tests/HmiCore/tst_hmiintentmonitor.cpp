// SPDX-License-Identifier: MIT
#include "fakehandler.h"
#include "logcapture.h"

#include <HmiCore/HmiIntentMonitor>

#include <QMetaMethod>
#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

using namespace HmiCore;

namespace {
constexpr int intent = 7;
constexpr int otherIntent = 8;
} // namespace

class HmiIntentMonitorTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::unique_ptr<FakeHandler> a;
    std::unique_ptr<FakeHandler> b;

    std::unique_ptr<HmiIntentMonitor> monitorBoth()
    {
        return std::make_unique<HmiIntentMonitor>(intent, QList<QPointer<HmiIntentHandler>>{a.get(), b.get()}, nullptr);
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        a = std::make_unique<FakeHandler>(QStringLiteral("A"), QList<int>{intent, otherIntent});
        b = std::make_unique<FakeHandler>(QStringLiteral("B"), QList<int>{intent});
    }
    void cleanup() { log.reset(); }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiIntentMonitor::staticMetaObject;
        const QMetaProperty enabled = meta.property(meta.indexOfProperty("enabled"));
        QVERIFY(!enabled.isWritable());
        QCOMPARE(enabled.notifySignal().methodSignature(), QByteArray("enabledChanged(bool)"));
        const QMetaMethod slot = meta.method(meta.indexOfSlot("actionStatusChanged(int,bool)"));
        QVERIFY(slot.isValid());
        QCOMPARE(slot.access(), QMetaMethod::Private);
    }

    void oneAbleHandlerIsEnough()
    {
        a->enabled = false;
        QVERIFY(monitorBoth()->enabled());
        b->enabled = false;
        QVERIFY(!monitorBoth()->enabled());
    }

    void goneHandlersArePassedOver()
    {
        const HmiIntentMonitor monitor(intent, {nullptr, a.get()}, nullptr);
        QVERIFY(monitor.enabled());
        const HmiIntentMonitor nobody(intent, {nullptr}, nullptr);
        QVERIFY(!nobody.enabled());
    }

    void onlyTheFirstAndTheLastAreTold()
    {
        const auto monitor = monitorBoth();
        QSignalSpy changes(monitor.get(), &HmiIntentMonitor::enabledChanged);
        a->setEnabled(intent, true);
        QCOMPARE(changes.size(), 0);
        a->setEnabled(intent, false);
        QCOMPARE(changes.size(), 0);
        QVERIFY(monitor->enabled());
        b->setEnabled(intent, false);
        QCOMPARE(changes.size(), 1);
        QCOMPARE(changes.takeFirst().at(0).toBool(), false);
        QVERIFY(!monitor->enabled());
        b->setEnabled(intent, false);
        QCOMPARE(changes.size(), 0);
        a->setEnabled(intent, true);
        QCOMPARE(changes.size(), 1);
        QCOMPARE(changes.takeFirst().at(0).toBool(), true);
        b->setEnabled(intent, true);
        b->setEnabled(intent, true);
        QCOMPARE(changes.size(), 0);
    }

    void otherIntentsDoNotCount()
    {
        const HmiIntentMonitor monitor(intent, {a.get()}, nullptr);
        QSignalSpy changes(&monitor, &HmiIntentMonitor::enabledChanged);
        a->setEnabled(otherIntent, false);
        QCOMPARE(changes.size(), 0);
        QVERIFY(monitor.enabled());
    }

    void otherSendersDoNotCount()
    {
        HmiIntentMonitor monitor(intent, {a.get()}, nullptr);
        QSignalSpy changes(&monitor, &HmiIntentMonitor::enabledChanged);
        QVERIFY(QMetaObject::invokeMethod(&monitor, "actionStatusChanged", Q_ARG(int, intent), Q_ARG(bool, false)));
        QCOMPARE(changes.size(), 0);
        QVERIFY(monitor.enabled());
    }

    /// Registered twice, it has two places among the handlers, of which one change clears both.
    void aHandlerThatIsThereTwiceIsDisabledAtOnce()
    {
        const HmiIntentMonitor monitor(intent, {a.get(), a.get()}, nullptr);
        QSignalSpy changes(&monitor, &HmiIntentMonitor::enabledChanged);
        a->setEnabled(intent, false);
        QCOMPARE(changes.size(), 1);
        QVERIFY(!monitor.enabled());
    }

    void aHandlerThatGoesCannotPerformAnyMore()
    {
        const auto monitor = monitorBoth();
        QSignalSpy changes(monitor.get(), &HmiIntentMonitor::enabledChanged);
        a.reset();
        QCOMPARE(changes.size(), 0);
        b.reset();
        QCOMPARE(changes.size(), 1);
        QVERIFY(!monitor->enabled());
    }
};

QTEST_GUILESS_MAIN(HmiIntentMonitorTest)
#include "tst_hmiintentmonitor.moc"

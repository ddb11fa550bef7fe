// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/MediaAudioSource>
#include <AL2HMIBridge/MessageReceivePriorityQueueThread>
#include <AL2HMIBridge/MessageReceiveThread>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/TouchInputReceiverThread>

#include <HmiVehicle/embeddedvehicle.h>

#include <QDir>
#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <unistd.h>

using namespace AL2HMIBridge;
using HmiVehicle::EmbeddedVehicle;
using HmiVehicle::Vehicle;

/// The vehicle and the bridge in one process, over socket pairs.
class EmbeddedVehicleTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<EmbeddedVehicle> m_vehicle;
    std::unique_ptr<QObject> m_owner;
    TouchInputReceiverThread* m_touch = nullptr;

    static bool allConnected()
    {
        const BridgeConnection* const connection = BridgeConnection::instance();
        return connection->synchronised() && connection->channelConnected(BridgeEndpoint::Priority)
               && connection->channelConnected(BridgeEndpoint::Touch);
    }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        BridgeTester::resetState();
        Vehicle::Options options;
        options.frozen = true;
        m_vehicle = std::make_unique<EmbeddedVehicle>(options);
        m_vehicle->start();
        BridgeEndpoint::setConnector([vehicle = m_vehicle.get()](BridgeEndpoint::Channel channel) {
            return vehicle->connectChannel(BridgeEndpoint::channelName(channel));
        });
        m_owner = std::make_unique<QObject>();
        MessageReceiveThread::createInstance(m_owner.get())->begin();
        MessageReceivePriorityQueueThread::createInstance(m_owner.get())->begin();
        m_touch = new TouchInputReceiverThread(m_owner.get());
        m_touch->begin();
        QTRY_VERIFY(allConnected());
    }

    void cleanup()
    {
        m_owner.reset();
        BridgeEndpoint::setConnector({});
        m_vehicle.reset();
        m_log.reset();
    }

    void snapshotFillsTheSources()
    {
        QCOMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioFM);
        QCOMPARE(FMTunerSource::instance()->stationList().size(), 10);
        QCOMPARE(FMTunerSource::instance()->presets().size(), 10);
        QCOMPARE(MediaAudioSource::instance()->library().size(), 16);
        QCOMPARE(PhoneSource::instance()->contacts().at(3).toMap().value(QStringLiteral("name")).toString(),
                 QStringLiteral("Dana Whitfield"));
    }

    void callComesBackAsState()
    {
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioMedia, -1);
        QTRY_COMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioMedia);
        QTRY_VERIFY(MediaAudioSource::instance()->playing());
        GlobalSource::instance()->setAudioSource(GlobalSource::AudioFM, -1);
        QTRY_COMPARE(GlobalSource::instance()->mainAudioSource(), GlobalSource::AudioFM);
        GlobalSource::instance()->sendShortSeekUp();
        QTRY_COMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("Klassik Atrium"));
        FMTunerSource::instance()->recallPreset(TunerSource::ModeFM, 4);
        QTRY_COMPARE(FMTunerSource::instance()->activePreset(), 4);
    }

    void everyStateOfTheVehicleIsAcceptedByTheBridge()
    {
        QCOMPARE(m_log->unexpected(), QStringList()); // the snapshot had all of it, and nothing was refused
        QCOMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("Radio Meridian"));
    }

    void keysAndTouchesOfTheVehicleArrive()
    {
        QSignalSpy keys(KeySource::instance(), &KeySource::keyEvent);
        QSignalSpy touched(m_touch, &TouchInputReceiverThread::passThroughViewTouched);
        m_vehicle->run([](Vehicle& vehicle) {
            vehicle.keyEvent(22, 2);
            vehicle.touchBehindHmi();
        });
        QTRY_COMPARE(keys.size(), 1);
        QTRY_COMPARE(touched.size(), 1);
        QCOMPARE(keys.constFirst(), QVariantList({22, 2}));
    }

    void restartedVehicleIsFoundAgain()
    {
        GlobalSource::instance()->setVolume(33);
        QTRY_COMPARE(GlobalSource::instance()->volume(), 33);
        for (int round = 0; round < 5; ++round) {
            m_vehicle->stop();
            QTRY_VERIFY(!BridgeConnection::instance()->connected());
            QVERIFY(!m_vehicle->isRunning());
            m_vehicle->start();
            QTRY_VERIFY_WITH_TIMEOUT(allConnected(), 15000);
        }
        QCOMPARE(GlobalSource::instance()->volume(), 12);
        QCOMPARE(FMTunerSource::instance()->stationName(), QStringLiteral("Radio Meridian"));
    }

    void stoppedVehicleGivesNoConnection()
    {
        m_vehicle->stop();
        QCOMPARE(m_vehicle->connectChannel(QStringLiteral("messages")), -1);
        m_vehicle->start();
        QCOMPARE(m_vehicle->connectChannel(QStringLiteral("sideways")), -1);
    }

    void startAndStopLeaveNoDescriptorBehind()
    {
        m_owner.reset();
        const auto count = [] {
            return QDir(QStringLiteral("/proc/self/fd"))
                .entryList(QDir::NoDotAndDotDot | QDir::AllEntries | QDir::System)
                .size();
        };
        m_vehicle->stop();
        const auto before = count();
        for (int i = 0; i < 50; ++i) {
            m_vehicle->start();
            ::close(m_vehicle->connectChannel(QStringLiteral("messages")));
            m_vehicle->stop();
        }
        QCOMPARE(count(), before);
    }
};

QTEST_GUILESS_MAIN(EmbeddedVehicleTest)
#include "tst_embeddedvehicle.moc"

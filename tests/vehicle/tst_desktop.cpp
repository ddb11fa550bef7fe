// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/desktopplayer.h>
#include <HmiVehicle/modemphone.h>
#include <HmiVehicle/vehicleservice.h>

#include <QDBusArgument>
#include <QDBusConnection>
#include <QDBusContext>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using namespace HmiVehicle;

/// A modem or call as it stands in a list on the bus.
struct ListedObject
{
    QDBusObjectPath path;
    QVariantMap properties;
};
Q_DECLARE_METATYPE(ListedObject)
Q_DECLARE_METATYPE(QList<ListedObject>)

QDBusArgument& operator<<(QDBusArgument& argument, const ListedObject& object)
{
    argument.beginStructure();
    argument << object.path << object.properties;
    argument.endStructure();
    return argument;
}

const QDBusArgument& operator>>(const QDBusArgument& argument, ListedObject& object)
{
    argument.beginStructure();
    argument >> object.path >> object.properties;
    argument.endStructure();
    return argument;
}

/// A player on the bus that only does what it is told.
class FakePlayer : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.mpris.MediaPlayer2.Player")
    Q_PROPERTY(QString PlaybackStatus MEMBER m_status)
    Q_PROPERTY(QVariantMap Metadata MEMBER m_metadata)
    Q_PROPERTY(qlonglong Position MEMBER m_position)

public:
    QString m_status = QStringLiteral("Paused");
    QVariantMap m_metadata{
        {QStringLiteral("mpris:trackid"), QVariant::fromValue(QDBusObjectPath("/track/1"))},
        {QStringLiteral("mpris:length"), qlonglong(200) * 1000000},
        {QStringLiteral("xesam:title"), QStringLiteral("Second Sun")},
        {QStringLiteral("xesam:artist"), QStringList{QStringLiteral("Mira Vale"), QStringLiteral("Colline")}},
        {QStringLiteral("xesam:album"), QStringLiteral("Orbits")}};
    qlonglong m_position = 30 * 1000000;
    QStringList m_calls;

public Q_SLOTS:
    void Play() { m_calls.append(QStringLiteral("Play")); }
    void Pause() { m_calls.append(QStringLiteral("Pause")); }
    void Next() { m_calls.append(QStringLiteral("Next")); }
    void Previous() { m_calls.append(QStringLiteral("Previous")); }
    void SetPosition(const QDBusObjectPath& track, qlonglong position)
    {
        m_calls.append(QStringLiteral("SetPosition %1 %2").arg(track.path()).arg(position));
    }
};

class FakeManager : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.ofono.Manager")

public:
    QStringList m_interfaces{QStringLiteral("org.ofono.VoiceCallManager")};

public Q_SLOTS:
    QList<ListedObject> GetModems()
    {
        return {{QDBusObjectPath("/modem"), {{QStringLiteral("Interfaces"), m_interfaces}}}};
    }
};

class FakeCalls : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.ofono.VoiceCallManager")

public:
    QList<ListedObject> m_present;
    QStringList m_calls;

public Q_SLOTS:
    QList<ListedObject> GetCalls() { return m_present; }
    QDBusObjectPath Dial(const QString& number, const QString& hideCaller)
    {
        m_calls.append(QStringLiteral("Dial %1 '%2'").arg(number, hideCaller));
        return QDBusObjectPath("/modem/call1");
    }
};

class FakeCall : public QObject
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.ofono.VoiceCall")

public:
    QStringList m_calls;

public Q_SLOTS:
    void Answer() { m_calls.append(QStringLiteral("Answer")); }
    void Hangup() { m_calls.append(QStringLiteral("Hangup")); }
};

/// A real player and a real modem, as far as the bus can tell; the bus is private.
class DesktopTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    QTemporaryDir m_directory;
    QProcess m_daemon;
    QString m_address;
    std::unique_ptr<VehicleService> m_service;

    QDBusConnection vehicleBus() { return QDBusConnection(QStringLiteral("vehicle")); }
    QDBusConnection deviceBus() { return QDBusConnection(QStringLiteral("device")); }

    QJsonValue value(const char* source, const char* field) const
    {
        return m_service->vehicle().state(QString::fromLatin1(source)).value(QLatin1String(field));
    }
    QString media(const char* field) const { return value("MediaAudioSource", field).toString(); }
    bool phone(const char* field) const { return value("PhoneSource", field).toBool(); }

    void call(const char* source, const char* name, const QJsonArray& arguments = {})
    {
        const QJsonObject line{{QStringLiteral("source"), QString::fromLatin1(source)},
                               {QStringLiteral("call"), QString::fromLatin1(name)},
                               {QStringLiteral("args"), arguments}};
        QCOMPARE(m_service->vehicle().receive(Channel::Messages, QJsonDocument(line).toJson(QJsonDocument::Compact)),
                 QString());
    }

    void tell(const QString& path, const QString& interface, const QString& name, const QVariantList& arguments)
    {
        QDBusMessage message = QDBusMessage::createSignal(path, interface, name);
        message.setArguments(arguments);
        QVERIFY(deviceBus().send(message));
    }

    void playerChanged(const QVariantMap& changed)
    {
        tell(QStringLiteral("/org/mpris/MediaPlayer2"), QStringLiteral("org.freedesktop.DBus.Properties"),
             QStringLiteral("PropertiesChanged"),
             {QStringLiteral("org.mpris.MediaPlayer2.Player"), changed, QStringList()});
    }

    void plugIn(FakePlayer& player)
    {
        QVERIFY(deviceBus().registerObject(QStringLiteral("/org/mpris/MediaPlayer2"), &player,
                                           QDBusConnection::ExportAllSlots | QDBusConnection::ExportAllProperties));
        QVERIFY(deviceBus().registerService(QStringLiteral("org.mpris.MediaPlayer2.fake")));
    }

    void plugIn(FakeManager& manager, FakeCalls& calls, FakeCall& oneCall)
    {
        QVERIFY(deviceBus().registerObject(QStringLiteral("/"), &manager, QDBusConnection::ExportAllSlots));
        QVERIFY(deviceBus().registerObject(QStringLiteral("/modem"), &calls, QDBusConnection::ExportAllSlots));
        QVERIFY(deviceBus().registerObject(QStringLiteral("/modem/call1"), &oneCall, QDBusConnection::ExportAllSlots));
        QVERIFY(deviceBus().registerService(QStringLiteral("org.ofono")));
    }

    void callAdded(const QVariantMap& properties)
    {
        tell(QStringLiteral("/modem"), QStringLiteral("org.ofono.VoiceCallManager"), QStringLiteral("CallAdded"),
             {QVariant::fromValue(QDBusObjectPath("/modem/call1")), properties});
    }

    void callChanged(const QString& name, const QVariant& value)
    {
        tell(QStringLiteral("/modem/call1"), QStringLiteral("org.ofono.VoiceCall"), QStringLiteral("PropertyChanged"),
             {name, QVariant::fromValue(QDBusVariant(value))});
    }

    void callRemoved()
    {
        tell(QStringLiteral("/modem"), QStringLiteral("org.ofono.VoiceCallManager"), QStringLiteral("CallRemoved"),
             {QVariant::fromValue(QDBusObjectPath("/modem/call1"))});
    }

private Q_SLOTS:
    void initTestCase()
    {
        qDBusRegisterMetaType<ListedObject>();
        qDBusRegisterMetaType<QList<ListedObject>>();
        QFile configuration(m_directory.filePath(QStringLiteral("bus.conf")));
        QVERIFY(configuration.open(QIODevice::WriteOnly));
        configuration.write("<busconfig><type>session</type><listen>unix:dir=" + m_directory.path().toLocal8Bit()
                            + "</listen><policy context=\"default\"><allow send_destination=\"*\" eavesdrop=\"true\"/>"
                              "<allow eavesdrop=\"true\"/><allow own=\"*\"/></policy></busconfig>");
        configuration.close();
        m_daemon.start(QStringLiteral("dbus-daemon"), {QStringLiteral("--nofork"), QStringLiteral("--print-address=1"),
                                                       QStringLiteral("--config-file=") + configuration.fileName()});
        QVERIFY2(QTest::qWaitFor([this] { return m_daemon.canReadLine(); }, 20000), "dbus-daemon does not start");
        m_address = QString::fromLatin1(m_daemon.readLine().trimmed());
    }

    void cleanupTestCase()
    {
        m_daemon.terminate();
        QVERIFY(m_daemon.waitForFinished());
    }

    void init()
    {
        m_log = std::make_unique<LogCapture>();
        QVERIFY(QDBusConnection::connectToBus(m_address, QStringLiteral("vehicle")).isConnected());
        QVERIFY(QDBusConnection::connectToBus(m_address, QStringLiteral("device")).isConnected());
        Vehicle::Options options;
        options.speed = 0;
        m_service = std::make_unique<VehicleService>(options);
    }

    void cleanup()
    {
        QDBusConnection::disconnectFromBus(QStringLiteral("vehicle"));
        QDBusConnection::disconnectFromBus(QStringLiteral("device"));
        m_service.reset();
        m_log.reset();
    }

    void aPlayerIsShownWhoeverCameFirst_data()
    {
        QTest::addColumn<bool>("playerFirst");
        QTest::newRow("player") << true;
        QTest::newRow("vehicle") << false;
    }

    void aPlayerIsShownWhoeverCameFirst()
    {
        QFETCH(bool, playerFirst);
        FakePlayer player;
        if (playerFirst)
            plugIn(player);
        DesktopPlayer desktop(vehicleBus(), *m_service);
        if (!playerFirst) {
            QCOMPARE(media("title"), QStringLiteral("Neon Rain"));
            plugIn(player);
        }
        QTRY_COMPARE(media("title"), QStringLiteral("Second Sun"));
        QCOMPARE(desktop.player(), QStringLiteral("org.mpris.MediaPlayer2.fake"));
        QCOMPARE(media("artist"), QStringLiteral("Mira Vale, Colline"));
        QCOMPARE(media("album"), QStringLiteral("Orbits"));
        QCOMPARE(value("MediaAudioSource", "duration"), QJsonValue(200));
        QCOMPARE(value("MediaAudioSource", "position"), QJsonValue(30));
        QCOMPARE(value("MediaAudioSource", "playing"), QJsonValue(false));
        QVERIFY(value("MediaAudioSource", "library").toArray().isEmpty());
    }

    void aPlayerIsControlled()
    {
        FakePlayer player;
        plugIn(player);
        const DesktopPlayer desktop(vehicleBus(), *m_service);
        QTRY_COMPARE(media("title"), QStringLiteral("Second Sun"));
        call("GlobalSource", "setAudioSource", {16, -1});
        QTRY_COMPARE(player.m_calls, QStringList({QStringLiteral("Play")}));
        playerChanged({{QStringLiteral("PlaybackStatus"), QStringLiteral("Playing")}});
        QTRY_COMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
        call("MediaAudioSource", "next");
        call("GlobalSource", "sendShortSeekDown");
        call("MediaAudioSource", "seekTo", {500});
        call("MediaAudioSource", "togglePlayPause");
        call("MediaAudioSource", "playTrack", {3});
        const QStringList expected{QStringLiteral("Play"), QStringLiteral("Next"), QStringLiteral("Previous"),
                                   QStringLiteral("SetPosition /track/1 200000000"), QStringLiteral("Pause")};
        QTRY_COMPARE(player.m_calls, expected);
        QCOMPARE(value("MediaAudioSource", "position"), QJsonValue(200));
    }

    void itsPositionIsAskedForWhileItPlays()
    {
        FakePlayer player;
        player.m_status = QStringLiteral("Playing");
        plugIn(player);
        const DesktopPlayer desktop(vehicleBus(), *m_service);
        QTRY_COMPARE(value("MediaAudioSource", "position"), QJsonValue(30));
        player.m_position = 31 * 1000000;
        QTRY_COMPARE(value("MediaAudioSource", "position"), QJsonValue(31));
    }

    void whatAPlayerSaysIsBounded()
    {
        FakePlayer player;
        plugIn(player);
        const DesktopPlayer desktop(vehicleBus(), *m_service);
        QTRY_COMPARE(media("title"), QStringLiteral("Second Sun"));
        playerChanged({{QStringLiteral("Metadata"),
                        QVariantMap{{QStringLiteral("xesam:title"), QString(100000, QLatin1Char('x'))},
                                    {QStringLiteral("xesam:artist"), 5},
                                    {QStringLiteral("mpris:length"), QStringLiteral("long")},
                                    {QStringLiteral("xesam:album"), QStringLiteral("a")}}},
                       {QStringLiteral("Position"), -5.0}});
        QTRY_COMPARE(media("title"), QString(256, QLatin1Char('x')));
        QCOMPARE(value("MediaAudioSource", "duration"), QJsonValue(0));
        QCOMPARE(value("MediaAudioSource", "position"), QJsonValue(0));
        playerChanged({{QStringLiteral("Metadata"), QStringLiteral("nonsense")}});
        QTRY_COMPARE(media("title"), QString());
        playerChanged({{QStringLiteral("Position"), qlonglong(9223372036854775807)}});
        QTRY_COMPARE(value("MediaAudioSource", "position"), QJsonValue(1000000));
    }

    void theLibraryIsBackWhenThePlayerLeaves()
    {
        FakePlayer player;
        player.m_status = QStringLiteral("Playing");
        plugIn(player);
        const DesktopPlayer desktop(vehicleBus(), *m_service);
        QTRY_COMPARE(value("MediaAudioSource", "playing"), QJsonValue(true));
        QVERIFY(deviceBus().unregisterService(QStringLiteral("org.mpris.MediaPlayer2.fake")));
        QTRY_COMPARE(media("title"), QStringLiteral("Neon Rain"));
        QCOMPARE(desktop.player(), QString());
        QVERIFY(!value("MediaAudioSource", "library").toArray().isEmpty());
        call("MediaAudioSource", "next");
        QCOMPARE(media("title"), QStringLiteral("Corner Shop Serenade"));
        QVERIFY(deviceBus().registerService(QStringLiteral("org.mpris.MediaPlayer2.fake")));
        QTRY_COMPARE(media("title"), QStringLiteral("Second Sun"));
    }

    void aCallComesInAndIsTaken()
    {
        FakeManager manager;
        FakeCalls calls;
        FakeCall oneCall;
        plugIn(manager, calls, oneCall);
        const ModemPhone modem(vehicleBus(), *m_service);
        QTRY_COMPARE(modem.modem(), QStringLiteral("/modem"));
        callAdded({{QStringLiteral("State"), QStringLiteral("incoming")},
                   {QStringLiteral("LineIdentification"), QStringLiteral("+1 555 0100")}});
        QTRY_VERIFY(phone("incomingCall"));
        QCOMPARE(value("PhoneSource", "callerName").toString(),
                 QStringLiteral("Dana Whitfield")); // the phone book knows
        call("PhoneSource", "acceptCall");
        QTRY_COMPARE(oneCall.m_calls, QStringList({QStringLiteral("Answer")}));
        QVERIFY(!phone("callConnected"));
        callChanged(QStringLiteral("State"), QStringLiteral("active"));
        QTRY_VERIFY(phone("callConnected"));
        m_service->vehicle().advance(3000);
        QCOMPARE(value("PhoneSource", "callDuration"), QJsonValue(3));
        call("GlobalSource", "sendShortEndKey");
        QTRY_COMPARE(oneCall.m_calls, QStringList({QStringLiteral("Answer"), QStringLiteral("Hangup")}));
        callChanged(QStringLiteral("State"), QStringLiteral("disconnected"));
        callRemoved();
        QTRY_VERIFY(!phone("callConnected"));
    }

    void aNumberIsDialled()
    {
        FakeManager manager;
        FakeCalls calls;
        FakeCall oneCall;
        plugIn(manager, calls, oneCall);
        const ModemPhone modem(vehicleBus(), *m_service);
        QTRY_COMPARE(modem.modem(), QStringLiteral("/modem"));
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0123")});
        QTRY_COMPARE(calls.m_calls, QStringList({QStringLiteral("Dial +1 555 0123 ''")}));
        QVERIFY(!phone("dialling")); // not before the modem does
        callAdded({{QStringLiteral("State"), QStringLiteral("dialing")},
                   {QStringLiteral("LineIdentification"), QString(100000, QLatin1Char('1'))},
                   {QStringLiteral("Name"), QStringLiteral("Office")}});
        QTRY_VERIFY(phone("dialling"));
        QTRY_COMPARE(value("PhoneSource", "callerName").toString(), QStringLiteral("Office"));
        QCOMPARE(value("PhoneSource", "callerNumber").toString().size(), 64);
        callRemoved();
        QTRY_VERIFY(!phone("dialling"));
    }

    void aModemThatLeavesTakesItsCallAlong()
    {
        FakeManager manager;
        FakeCalls calls;
        FakeCall oneCall;
        calls.m_present = {{QDBusObjectPath("/modem/call1"), {{QStringLiteral("State"), QStringLiteral("active")}}}};
        plugIn(manager, calls, oneCall);
        const ModemPhone modem(vehicleBus(), *m_service);
        QTRY_VERIFY(phone("callConnected"));
        QVERIFY(deviceBus().unregisterService(QStringLiteral("org.ofono")));
        QTRY_VERIFY(!phone("callConnected"));
        QCOMPARE(modem.modem(), QString());
        call("PhoneSource", "dial", {QStringLiteral("+1 555 0123")});
        QVERIFY(phone("dialling")); // an invented call again
    }

    void aModemCanCallLater()
    {
        FakeManager manager;
        FakeCalls calls;
        FakeCall oneCall;
        manager.m_interfaces.clear();
        plugIn(manager, calls, oneCall);
        const ModemPhone modem(vehicleBus(), *m_service);
        const auto interfacesAre = [this](const QStringList& interfaces) {
            tell(QStringLiteral("/modem"), QStringLiteral("org.ofono.Modem"), QStringLiteral("PropertyChanged"),
                 {QStringLiteral("Interfaces"), QVariant::fromValue(QDBusVariant(interfaces))});
        };
        QVERIFY(QTest::qWaitFor([&] {
            interfacesAre({QStringLiteral("org.ofono.VoiceCallManager")});
            return !modem.modem().isEmpty();
        }));
        interfacesAre({});
        QTRY_COMPARE(modem.modem(), QString());
    }
};

QTEST_GUILESS_MAIN(DesktopTest)
#include "tst_desktop.moc"

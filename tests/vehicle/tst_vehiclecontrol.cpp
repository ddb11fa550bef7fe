// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/controlclient.h>
#include <HmiVehicle/vehiclecontrol.h>
#include <HmiVehicle/vehicledirectory.h>
#include <HmiVehicle/vehicleservice.h>

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <memory>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace HmiVehicle;

/// Scripts, panels and keyboards that reach the vehicle over the control socket.
class VehicleControlTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<QTemporaryDir> m_path;
    std::unique_ptr<VehicleService> m_service;
    std::unique_ptr<VehicleControl> m_control;
    std::unique_ptr<VehicleDirectory> m_directory;
    QStringList m_keys;

    void serve(double speed)
    {
        m_directory.reset();
        m_control.reset();
        Vehicle::Options options;
        options.speed = speed;
        m_service = std::make_unique<VehicleService>(options);
        m_control = std::make_unique<VehicleControl>(*m_service);
        m_directory = std::make_unique<VehicleDirectory>();
        connect(m_directory.get(), &VehicleDirectory::connected, m_service.get(), &VehicleService::addConnection);
        connect(m_directory.get(), &VehicleDirectory::controlConnected, m_control.get(),
                &VehicleControl::addConnection);
        connect(m_service.get(), &VehicleService::keySent, this,
                [this](int key, int state) { m_keys.append(QStringLiteral("%1:%2").arg(key).arg(state)); });
        QVERIFY(m_directory->listen(m_path->path()));
    }

    /// The answer to a command: "" when done, with the value if there is one.
    static QString ask(ControlClient& client, const QStringList& words, int timeout = -1)
    {
        QSignalSpy replied(&client, &ControlClient::replied);
        const int number = client.send(words, timeout);
        if (!number || !QTest::qWaitFor([&] { return replied.size() == 1 || !client.isOpen(); }, 20000)
            || replied.isEmpty() || replied.constFirst().at(0).toInt() != number)
            return QStringLiteral("no answer");
        const QString problem = replied.constFirst().at(1).toString();
        return problem.isEmpty() ? replied.constFirst().at(2).toJsonValue().toVariant().toString() : problem;
    }

    static QStringList words(const char* text) { return QString::fromUtf8(text).split(QLatin1Char('|')); }

    /// An HMI that calls, and answers fences if it is asked to.
    int connectHmi(Channel channel)
    {
        int pair[2];
        if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, pair) != 0)
            return -1;
        m_service->addConnection(channel, pair[0]);
        write(pair[1], "{\"protocol\":1,\"peer\":\"hmi\"}\n");
        const int before = m_service->hmiCount(channel);
        return QTest::qWaitFor([&] { return m_service->hmiCount(channel) > before; }) ? pair[1] : -1;
    }

    static bool write(int socket, const QByteArray& bytes)
    {
        return ::send(socket, bytes.constData(), size_t(bytes.size()), MSG_NOSIGNAL) == bytes.size();
    }

    static bool callFrom(int hmi, const char* call)
    {
        return write(hmi, QByteArray("{\"source\":\"GlobalSource\",\"call\":\"") + call + "\",\"args\":[]}\n");
    }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_path = std::make_unique<QTemporaryDir>();
        m_keys.clear();
        serve(0);
    }

    void cleanup()
    {
        m_directory.reset();
        m_control.reset();
        m_service.reset();
        m_log.reset();
    }

    void aKeyboardPressesAndReleases()
    {
        ControlClient keyboard;
        QVERIFY2(keyboard.open(m_path->path()), qPrintable(keyboard.errorString()));
        QVERIFY(keyboard.press(89));
        QTRY_COMPARE(m_keys, QStringList({QStringLiteral("89:0")}));
        m_service->vehicle().advance(800);
        QVERIFY(keyboard.release(89));
        QVERIFY(keyboard.turn(54, 1));
        QTRY_COMPARE(m_keys.size(), 6);
        QCOMPARE(m_keys.mid(1), QStringList({QStringLiteral("89:3"), QStringLiteral("89:4"), QStringLiteral("54:0"),
                                             QStringLiteral("54:1"), QStringLiteral("54:2")}));
    }

    void keysOfALostClientComeUp()
    {
        auto keyboard = std::make_unique<ControlClient>();
        QVERIFY(keyboard->open(m_path->path()));
        keyboard->press(6);
        keyboard->press(7);
        QTRY_COMPARE(m_keys.size(), 2);
        ControlClient other;
        QVERIFY(other.open(m_path->path()));
        QCOMPARE(ask(other, words("release|6")), QStringLiteral("the key is down, or somebody else holds it"));
        QCOMPARE(ask(other, words("press|6")), QStringLiteral("the key is down, or somebody else holds it"));
        keyboard.reset();
        QTRY_COMPARE(m_keys.size(), 4);
        QCOMPARE(m_keys.mid(2), QStringList({QStringLiteral("6:2"), QStringLiteral("7:2")}));
    }

    void aKeyboardFindsARestartedVehicle()
    {
        ControlClient keyboard;
        QSignalSpy lost(&keyboard, &ControlClient::lost);
        QVERIFY(keyboard.open(m_path->path()));
        QVERIFY(keyboard.press(6));
        m_directory.reset();
        m_control.reset();
        QTRY_COMPARE(lost.size(), 1);
        QVERIFY(!keyboard.press(6));
        QCOMPARE(keyboard.errorString(), m_path->path() + QStringLiteral(": no vehicle serves it"));
        m_keys.clear();
        serve(0);
        QVERIFY(keyboard.press(6));
        QTRY_COMPARE(m_keys, QStringList({QStringLiteral("6:0")}));
    }

    void aDirectoryThatIsNotOursAloneIsRefused()
    {
        QCOMPARE(::chmod(QFile::encodeName(m_path->path()).constData(), 0755), 0);
        ControlClient client;
        QVERIFY(!client.open(m_path->path()));
        QVERIFY(client.errorString().endsWith(
            QStringLiteral("other users may enter it; it must be this user's and of mode 0700")));
        QVERIFY(!client.open(QStringLiteral("/nowhere")));
        QCOMPARE(client.errorString(), QStringLiteral("/nowhere: no vehicle serves it"));
        QCOMPARE(client.send(words("get|GlobalSource.volume")), 0);
    }

    void statesAreSetAndRead()
    {
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QCOMPARE(ask(client, words("set|GlobalSource.volume|30")), QString());
        QCOMPARE(ask(client, words("get|GlobalSource.volume")), QStringLiteral("30"));
        QCOMPARE(ask(client, words("set|GlobalSource.volume|41")), QStringLiteral("GlobalSource.volume: out of range"));
        QCOMPARE(ask(client, words("expect|GlobalSource.volume == 30")), QString());
        QCOMPARE(ask(client, words("expect|GlobalSource.volume > 30"), 10),
                 QStringLiteral("expected GlobalSource.volume > 30, it is 30"));
    }

    void aStateIsWaitedFor()
    {
        ControlClient client;
        ControlClient other;
        QVERIFY(client.open(m_path->path()) && other.open(m_path->path()));
        QSignalSpy replied(&client, &ControlClient::replied);
        client.send(words("expect|GlobalSource.volume == 31"));
        QCOMPARE(ask(other, words("set|GlobalSource.volume|31")), QString());
        QTRY_COMPARE(replied.size(), 1);
        QCOMPARE(replied.constFirst().at(1).toString(), QString());
    }

    void aLongPressTakesTheVehiclesTime_data()
    {
        QTest::addColumn<double>("speed");
        QTest::newRow("on command only") << 0.0;
        QTest::newRow("fast") << 100.0;
    }

    void aLongPressTakesTheVehiclesTime()
    {
        QFETCH(double, speed);
        serve(speed);
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QCOMPARE(ask(client, words("key|seek_up|long")), QString());
        QCOMPARE(m_keys, QStringList({QStringLiteral("7:0"), QStringLiteral("7:3"), QStringLiteral("7:4")}));
        QCOMPARE(ask(client, words("key|seek_up|long|700")), QString());
        QCOMPARE(m_keys.mid(3), QStringList({QStringLiteral("7:0"), QStringLiteral("7:2")}));
    }

    void callsAreExpectedInOrder()
    {
        const int hmi = connectHmi(Channel::Messages);
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QSignalSpy called(m_service.get(), &VehicleService::called);
        QVERIFY(callFrom(hmi, "sendShortSeekUp") && callFrom(hmi, "systemVolumeSync")
                && callFrom(hmi, "sendShortSeekDown"));
        QTRY_COMPARE(called.size(), 3);
        QCOMPARE(ask(client, words("expect|GlobalSource.sendShortSeekUp()")), QString());
        QCOMPARE(ask(client, words("expect|GlobalSource.sendShortSeekUp()"), 10),
                 QStringLiteral("expected GlobalSource.sendShortSeekUp(), came GlobalSource.systemVolumeSync(), "
                                "GlobalSource.sendShortSeekDown()"));
        QCOMPARE(ask(client, words("expect|GlobalSource.sendShortSeekDown()")), QString());
        QCOMPARE(ask(client, words("expect|GlobalSource.systemVolumeSync()"), 10),
                 QStringLiteral("expected GlobalSource.systemVolumeSync(), came nothing"));
        QCOMPARE(ask(client, words("expect|none"), 10),
                 QStringLiteral("expected no further call, came GlobalSource.systemVolumeSync()"));
        QCOMPARE(ask(client, words("expect|none"), 10), QString());
        ::close(hmi);
    }

    void aCallIsWaitedFor()
    {
        const int hmi = connectHmi(Channel::Messages);
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QSignalSpy replied(&client, &ControlClient::replied);
        client.send(words("expect|GlobalSource.requestBeepSound()"));
        client.send(words("expect|none"), 10);
        QCOMPARE(ask(client, words("fly")),
                 QStringLiteral("there is no command 'fly'")); // refused at once, before its turn
        QCOMPARE(replied.size(), 1);
        QVERIFY(callFrom(hmi, "requestBeepSound"));
        QTRY_COMPARE(replied.size(), 3);
        QCOMPARE(replied.at(1).at(1).toString(), QString());
        QCOMPARE(replied.at(2).at(1).toString(), QString());
        ::close(hmi);
    }

    void anHmiIsWaitedFor()
    {
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QCOMPARE(ask(client, words("expect|hmi"), 10), QStringLiteral("expected an HMI, none is connected"));
        const int messages = connectHmi(Channel::Messages);
        const int priority = connectHmi(Channel::Priority);
        QCOMPARE(ask(client, words("expect|hmi"), 10),
                 QStringLiteral("expected an HMI, one is there but answers nothing"));
        QSignalSpy replied(&client, &ControlClient::replied);
        client.send(words("expect|hmi"), 20000);
        QByteArray received;
        QVERIFY(QTest::qWaitFor(
            [&] { // answers every fence on whichever channel
                for (const int socket : {messages, priority}) {
                    char buffer[65536];
                    const auto count = ::recv(socket, buffer, sizeof buffer, 0);
                    received.append(buffer, int(qMax<qint64>(count, 0)));
                }
                for (int at; (at = int(received.indexOf("{\"args\":["))) >= 0; received.remove(0, at + 9)) {
                    const QByteArray number = received.mid(at + 9, received.indexOf(']', at) - at - 9);
                    if (received.mid(at, 60).contains("\"event\":\"fence\""))
                        write(messages,
                              "{\"source\":\"DeveloperSource\",\"call\":\"fenceReached\",\"args\":[" + number + "]}\n");
                }
                return replied.size() == 1;
            },
            20000));
        QCOMPARE(replied.constFirst().at(1).toString(), QString());
        ::close(messages);
        ::close(priority);
    }

    void strangersAreCut_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("warning");
        const QByteArray greeting("{\"protocol\":1,\"peer\":\"control\"}\n");
        QTest::newRow("an HMI") << QByteArray("{\"protocol\":1,\"peer\":\"hmi\"}\n")
                                << QStringLiteral("Control left: it does not greet as a control of protocol 1");
        QTest::newRow("no command") << greeting + "hello\n" << QStringLiteral("Control left: it sends no commands");
        QTest::newRow("no words") << greeting + "{\"id\":1,\"command\":[1]}\n"
                                  << QStringLiteral("Control left: it sends no commands");
        QTest::newRow("long line") << greeting + QByteArray(64 * 1024, 'x')
                                   << QStringLiteral("Control left: its line is too long");
        QTest::newRow("too much")
            << greeting
                   + QByteArray("{\"id\":1,\"command\":[\"expect\",\"GlobalSource.volume == 40\"]}\n").repeated(1001)
            << QStringLiteral("Control left: it does not wait for answers");
    }

    void strangersAreCut()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, warning);
        int pair[2];
        QCOMPARE(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, pair), 0);
        m_control->addConnection(pair[0]);
        for (int sent = 0; sent < bytes.size();) {
            const auto count = ::send(pair[1], bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL);
            sent += int(qMax<qint64>(count, 0));
            QCoreApplication::processEvents();
        }
        QVERIFY(QTest::qWaitFor([&] {
            pollfd descriptor{pair[1], POLLRDHUP, 0};
            return ::poll(&descriptor, 1, 0) == 1;
        }));
        QVERIFY(m_log->takeOne(QtWarningMsg, warning));
        ::close(pair[1]);
        ControlClient client;
        QVERIFY(client.open(m_path->path()));
        QCOMPARE(ask(client, words("get|GlobalSource.volume")), QStringLiteral("12"));
    }

    void notMoreThanSixteenClients()
    {
        std::vector<std::unique_ptr<ControlClient>> clients;
        for (int i = 0; i < 16; ++i) {
            clients.push_back(std::make_unique<ControlClient>());
            QVERIFY(clients.back()->open(m_path->path()));
            QCOMPARE(ask(*clients.back(), words("get|GlobalSource.volume")), QStringLiteral("12"));
        }
        ControlClient one;
        QSignalSpy lost(&one, &ControlClient::lost);
        one.open(m_path->path());
        QTRY_COMPARE(lost.size(), 1);
        clients.clear();
        QVERIFY(QTest::qWaitFor([&] {
            return one.open(m_path->path()) && ask(one, words("get|GlobalSource.volume")) == QStringLiteral("12");
        }));
    }
};

QTEST_GUILESS_MAIN(VehicleControlTest)
#include "tst_vehiclecontrol.moc"

// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/vehicledirectory.h>
#include <HmiVehicle/vehicleservice.h>

#include <QDir>
#include <QFile>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <memory>
#include <thread>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace HmiVehicle;

/// HMIs that come, go and misbehave.
class VehicleServiceTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<VehicleService> m_service;
    QList<int> m_ends;

    int connectHmi(Channel channel = Channel::Messages)
    {
        int pair[2];
        if (::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, pair) != 0)
            return -1;
        m_service->addConnection(channel, pair[0]);
        m_ends.append(pair[1]);
        return pair[1];
    }

    static bool write(int socket, const QByteArray& bytes)
    {
        return ::send(socket, bytes.constData(), size_t(bytes.size()), MSG_NOSIGNAL) == bytes.size();
    }

    static QByteArray readUntil(int socket, const QByteArray& end)
    {
        QByteArray all;
        const bool found = QTest::qWaitFor([&] {
            char buffer[65536];
            const auto count = ::recv(socket, buffer, sizeof buffer, 0);
            all.append(buffer, int(qMax<qint64>(count, 0)));
            return all.contains(end) || count == 0;
        });
        return found ? all : QByteArray();
    }

    static bool isCut(int socket)
    {
        return QTest::qWaitFor(
            [socket] {
                pollfd descriptor{socket, POLLRDHUP, 0};
                return ::poll(&descriptor, 1, 0) == 1;
            },
            10000);
    }

    int connectGreeted()
    {
        const int hmi = connectHmi();
        return write(hmi, "{\"protocol\":1,\"peer\":\"hmi\"}\n") && !readUntil(hmi, "\"complete\"}\n").isEmpty() ? hmi
                                                                                                                 : -1;
    }

    bool works(int hmi)
    {
        QSignalSpy called(m_service.get(), &VehicleService::called);
        return write(hmi, "{\"source\":\"GlobalSource\",\"call\":\"requestBeepSound\",\"args\":[]}\n")
               && QTest::qWaitFor([&] { return called.size() == 1; });
    }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        Vehicle::Options options;
        options.frozen = true;
        m_service = std::make_unique<VehicleService>(options);
    }

    void cleanup()
    {
        for (const int end : std::as_const(m_ends))
            ::close(end);
        m_ends.clear();
        m_service.reset();
        m_log.reset();
    }

    void greetsAndTellsEverything()
    {
        const int hmi = connectHmi();
        QVERIFY(write(hmi, "{\"protocol\":1,\"peer\":\"hmi\"}\n"));
        const QByteArray received = readUntil(hmi, "\"complete\"}\n");
        QVERIFY(received.startsWith("{\"protocol\":1,\"peer\":\"application-layer\"}\n"));
        QVERIFY(received.contains("\"source\":\"FMTunerSource\""));
        QVERIFY(received.endsWith("{\"snapshot\":\"complete\"}\n"));
    }

    void allHmisAreToldOfChanges()
    {
        const int first = connectGreeted();
        const int second = connectGreeted();
        QVERIFY(write(first, "{\"source\":\"GlobalSource\",\"call\":\"setVolume\",\"args\":[20]}\n"));
        QVERIFY(!readUntil(first, "\"volume\":20").isEmpty());
        QVERIFY(!readUntil(second, "\"volume\":20").isEmpty());
    }

    void strangersAreCut_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("warning");
        const QString wrong = QStringLiteral("HMI on messages left: it does not greet as an HMI of protocol 1");
        QTest::newRow("version") << QByteArray("{\"protocol\":2,\"peer\":\"hmi\"}\n") << wrong;
        QTest::newRow("garbage") << QByteArray("hello\n") << wrong;
        QTest::newRow("long line") << QByteArray(1024 * 1024, 'x')
                                   << QStringLiteral("HMI on messages left: its line is too long");
        QTest::newRow("silence") << QByteArray() << QStringLiteral("HMI on messages left: it does not greet");
    }

    void strangersAreCut()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, warning);
        const int good = connectGreeted();
        const int stranger = connectHmi();
        for (int sent = 0; sent < bytes.size();) {
            const auto count = ::send(stranger, bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL);
            sent += int(qMax<qint64>(count, 0));
            QCoreApplication::processEvents();
        }
        QVERIFY(isCut(stranger));
        QVERIFY(m_log->takeOne(QtWarningMsg, warning));
        QVERIFY(works(good));
    }

    void garbageAfterTheGreetingIsRefusedAndCountedOut()
    {
        const int hmi = connectGreeted();
        QVERIFY(write(hmi, QByteArray("x\n").repeated(1000)));
        QVERIFY(works(hmi));
        QCOMPARE(m_log->take(QStringLiteral("vehicle"), QtWarningMsg).size(), 20);
    }

    void aHalfClosedHmiIsCut()
    {
        const int hmi = connectGreeted();
        ::shutdown(hmi, SHUT_WR);
        QVERIFY(isCut(hmi));
        QVERIFY(works(connectGreeted()));
    }

    void anHmiThatDoesNotReadIsCutAndOthersAreServed()
    {
        const int stalled = connectGreeted();
        const int good = connectGreeted();
        for (int i = 0; i < 12000; ++i) {
            m_service->vehicle().setState(QStringLiteral("FMTunerSource"), QStringLiteral("radioText"),
                                          QString(1000, QLatin1Char(char('a' + i % 2))));
            char buffer[65536];
            while (::recv(good, buffer, sizeof buffer, 0) > 0)
                QCoreApplication::processEvents();
        }
        QVERIFY(isCut(stalled));
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("HMI on messages left: it does not read")));
        QVERIFY(works(good));
    }

    void aFloodOfKeysReachesAnHmiThatReadsInOrder()
    {
        constexpr int steps = 333334; // more than a million events
        const int hmi = connectHmi(Channel::Priority);
        QVERIFY(write(hmi, "{\"protocol\":1,\"peer\":\"hmi\"}\n"));
        QVERIFY(!readUntil(hmi, "\n").isEmpty());
        QSignalSpy greeted(m_service.get(), &VehicleService::keySent);
        QVERIFY(QTest::qWaitFor([&] {
            m_service->vehicle().keyEvent(1, 0);
            pollfd descriptor{hmi, POLLIN, 0};
            return ::poll(&descriptor, 1, 0) == 1;
        }));
        const QByteArray begin = readUntil(hmi, "\n");
        QVERIFY(!begin.isEmpty());
        qint64 received = 0;
        bool inOrder = true;
        std::thread reader([&] {
            QByteArray partial;
            char buffer[65536];
            while (received < 3 * steps) {
                pollfd descriptor{hmi, POLLIN, 0};
                if (::poll(&descriptor, 1, 20000) != 1)
                    return;
                const auto count = ::recv(hmi, buffer, sizeof buffer, 0);
                if (count <= 0)
                    return;
                partial.append(buffer, int(count));
                int from = 0;
                for (int end; (end = int(partial.indexOf('\n', from))) >= 0; from = end + 1) {
                    const QByteArray line = partial.mid(from, end - from);
                    if (line.contains("[1,0]"))
                        continue;
                    inOrder = inOrder && line.contains("[54," + QByteArray::number(received % 3) + ']');
                    ++received;
                }
                partial.remove(0, from);
            }
        });
        const KeyInput::Owner owner = KeyInput::newOwner();
        for (int i = 0; i < steps; ++i)
            if (!m_service->vehicle().keys().turn(54, 1, owner))
                break;
        QVERIFY(QTest::qWaitFor([&] { return m_service->waitingBytes() == 0; }, 20000));
        reader.join();
        QCOMPARE(received, 3LL * steps);
        QVERIFY(inOrder);
    }

    void thePanelHearsWhatHappens()
    {
        QSignalSpy states(m_service.get(), &VehicleService::stateChanged);
        QSignalSpy keys(m_service.get(), &VehicleService::keySent);
        QSignalSpy decisions(m_service.get(), &VehicleService::decisionReported);
        m_service->vehicle().setState(QStringLiteral("DeveloperSource"), QStringLiteral("decisionsWanted"), true);
        QCOMPARE(states.size(), 1);
        QCOMPARE(states.constFirst().constFirst().toString(), QStringLiteral("DeveloperSource"));
        m_service->vehicle().keyEvent(200, 9);
        QCOMPARE(keys, QList<QVariantList>({{200, 9}}));
        const int hmi = connectGreeted();
        QVERIFY(write(hmi, "{\"source\":\"DeveloperSource\",\"call\":\"reportDecision\",\"args\":[\"because\"]}\n"));
        QTRY_COMPARE(decisions, QList<QVariantList>({{QStringLiteral("because")}}));
    }

    void fencesAreSentWhereEventsAreAndTheirAnswerIsTold()
    {
        const int messages = connectGreeted();
        QSignalSpy reached(m_service.get(), &VehicleService::fenceReached);
        m_service->vehicle().sendFence(Channel::Messages, 7);
        QVERIFY(readUntil(messages, "\n").contains("\"event\":\"fence\",\"source\":\"DeveloperSource\""));
        QVERIFY(write(messages, "{\"source\":\"DeveloperSource\",\"call\":\"fenceReached\",\"args\":[7]}\n"));
        QTRY_COMPARE(reached, QList<QVariantList>({{7}}));
    }

    void notMoreThanEightOnAChannel()
    {
        for (int i = 0; i < 8; ++i)
            QVERIFY(connectGreeted() >= 0);
        QVERIFY(isCut(connectHmi()));
        ::shutdown(m_ends.takeFirst(), SHUT_RDWR);
        QVERIFY(QTest::qWaitFor([this] { return connectGreeted() >= 0; }));
    }

    void directoryIsMadeForThisUserOnlyAndCleanedUp()
    {
        const QTemporaryDir parent;
        const QString path = parent.filePath(QStringLiteral("a/b")).remove(QStringLiteral("a/"));
        {
            VehicleDirectory directory;
            QVERIFY2(directory.listen(path), qPrintable(directory.errorString()));
            struct stat status
            {};
            QCOMPARE(::stat(QFile::encodeName(path).constData(), &status), 0);
            QCOMPARE(status.st_mode & 0777, mode_t(0700));
            QCOMPARE(QDir(path).entryList(QDir::System | QDir::Files).size(), 4);

            VehicleDirectory second;
            QVERIFY(!second.listen(path));
            QCOMPARE(second.errorString(), path + QStringLiteral(": another vehicle serves it"));
        }
        QVERIFY(QDir(path).isEmpty(QDir::System | QDir::AllEntries | QDir::NoDotAndDotDot));
    }

    void directoryOpenToOthersIsRefused()
    {
        const QTemporaryDir parent;
        QCOMPARE(::chmod(QFile::encodeName(parent.path()).constData(), 0755), 0);
        VehicleDirectory directory;
        QVERIFY(!directory.listen(parent.path()));
        QCOMPARE(directory.errorString(),
                 parent.path() + QStringLiteral(": other users may enter it; it must be this user's and of mode 0700"));
    }
};

QTEST_GUILESS_MAIN(VehicleServiceTest)
#include "tst_vehicleservice.moc"

// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/evdevinput.h>
#include <HmiVehicle/vehicleservice.h>

#include <QFile>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include <fcntl.h>
#include <linux/input.h>
#include <memory>
#include <umockdev.h>
#include <unistd.h>

using namespace HmiVehicle;

/// Input devices that the operating system only seems to have; run in the wrapper of umockdev.
class EvdevInputTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<QTemporaryDir> m_directory;
    std::unique_ptr<VehicleService> m_service;
    UMockdevTestbed* m_testbed = nullptr;
    QStringList m_keys;

    static QString device() { return QStringLiteral("/dev/input/event7"); }

    static QByteArray bytes(int count, char value = '\0') { return QByteArray(count, value).toHex().toUpper(); }

    QString write(const char* name, const QByteArray& content)
    {
        QFile file(m_directory->filePath(QString::fromLatin1(name)));
        return file.open(QIODevice::WriteOnly) && file.write(content) == content.size() ? file.fileName() : QString();
    }

    /// What libevdev asks a device when it is opened: one that has all keys and some dials.
    static QByteArray capabilities()
    {
        QByteArray name = QByteArray("Panel").leftJustified(255, '\0').toHex().toUpper();
        QByteArray text = "@DEV /dev/input/event7\nEVIOCGVERSION 0 01000100\nEVIOCGID 0 0600010001000100\n"
                          "EVIOCGNAME 6 "
                          + name + "\nEVIOCGPHYS 1 " + bytes(255) + "\nEVIOCGUNIQ 1 " + bytes(255) + "\nEVIOCGPROP 8 "
                          + bytes(8) + "\nEVIOCGBIT(0) 8 0700000000000000\nEVIOCGBIT(1) 96 " + bytes(96, '\xff')
                          + "\nEVIOCGBIT(2) 8 FFFF000000000000\nEVIOCGBIT(21) 16 " + bytes(16) + "\nEVIOCGKEY 96 "
                          + bytes(96) + '\n';
        for (const char* const kind : {"EVIOCGBIT(3)", "EVIOCGBIT(4)", "EVIOCGBIT(5)", "EVIOCGBIT(17)", "EVIOCGBIT(18)",
                                       "EVIOCGLED", "EVIOCGSW"})
            text += QByteArray(kind) + " 8 " + bytes(8) + '\n';
        return text;
    }

    /// Each event: type, code, value; all come at once when the device is opened.
    void plugIn(const QList<QList<int>>& events)
    {
        QByteArray script;
        for (const QList<int>& event : events)
            script += QStringLiteral("E: 0.000001 %1 %2 %3\n")
                          .arg(event.at(0), 4, 16, QLatin1Char('0'))
                          .arg(event.at(1), 4, 16, QLatin1Char('0'))
                          .arg(event.at(2), 4, 10, QLatin1Char('0'))
                          .toLatin1();
        const char description[] = "P: /devices/virtual/input/input7/event7\nN: input/event7\n"
                                   "E: DEVNAME=/dev/input/event7\nE: SUBSYSTEM=input\nA: dev=13:71\n";
        QVERIFY(umockdev_testbed_add_from_string(m_testbed, description, nullptr));
        QVERIFY(umockdev_testbed_load_ioctl(m_testbed, "/dev/input/event7", qPrintable(write("ioctl", capabilities())),
                                            nullptr));
        if (!script.isEmpty())
            QVERIFY(umockdev_testbed_load_evemu_events(m_testbed, "/dev/input/event7",
                                                       qPrintable(write("events", script)), nullptr));
    }

    /// The event comes when the device is open already.
    bool happen(int type, int code, int value)
    {
        input_event events[2] = {};
        events[0].type = quint16(type);
        events[0].code = quint16(code);
        events[0].value = value;
        const int end = umockdev_testbed_get_dev_fd(m_testbed, "/dev/input/event7");
        return ::write(end, events, sizeof events) == sizeof events;
    }

    void pullOut()
    {
        const int nothing = ::open("/dev/null", O_RDWR | O_CLOEXEC);
        ::dup2(nothing, umockdev_testbed_get_dev_fd(m_testbed, "/dev/input/event7")); // hangs up on who has it open
        ::close(nothing);
    }

    KeyMap mapOf(const QByteArray& content)
    {
        KeyMap map;
        map.load(write("map.json", content));
        return map;
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY2(qEnvironmentVariable("LD_PRELOAD").contains(QLatin1String("umockdev")), "run it in umockdev-wrapper");
    }

    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_directory = std::make_unique<QTemporaryDir>();
        m_testbed = umockdev_testbed_new();
        Vehicle::Options options;
        options.speed = 0;
        m_service = std::make_unique<VehicleService>(options);
        m_keys.clear();
        connect(m_service.get(), &VehicleService::keySent, this,
                [this](int key, int state) { m_keys.append(QStringLiteral("%1:%2").arg(key).arg(state)); });
    }

    void cleanup()
    {
        m_service.reset();
        g_object_unref(m_testbed);
        m_log.reset();
    }

    void keysAndDialsBecomeHardKeys()
    {
        constexpr int key = 1;
        constexpr int dial = 2;
        plugIn({{key, 104, 1},
                {0, 0, 0},
                {key, 104, 2},
                {0, 0, 0},
                {key, 104, 0},
                {0, 0, 0},
                {key, 248, 1},
                {0, 0, 0},
                {dial, 7, 2},
                {0, 0, 0},
                {key, 30, 1},
                {0, 0, 0},
                {key, 113, 1},
                {0, 0, 0}});
        EvdevInput input(*m_service, device(), KeyMap::shipped());
        QVERIFY2(input.open(), qPrintable(input.errorString()));
        const QStringList expected{QStringLiteral("89:0"), QStringLiteral("89:2"), QStringLiteral("54:0"),
                                   QStringLiteral("54:1"), QStringLiteral("54:2"), QStringLiteral("54:0"),
                                   QStringLiteral("54:1"), QStringLiteral("54:2"), QStringLiteral("48:0")};
        QTRY_COMPARE(m_keys, expected);
    }

    void aDialGoesBothWays()
    {
        plugIn({{2, 8, 1}, {0, 0, 0}});
        EvdevInput input(*m_service, device(), mapOf("{\"dials\": {\"REL_WHEEL\": 55}}"));
        QVERIFY(input.open());
        QTRY_COMPARE(m_keys, QStringList({QStringLiteral("55:0"), QStringLiteral("55:1"), QStringLiteral("55:2")}));
    }

    void whatWasDroppedIsMadeUpFor()
    {
        plugIn({{1, 104, 1}, {0, 0, 0}, {0, 3, 0}, {1, 109, 1}, {0, 0, 0}, {1, 113, 1}, {0, 0, 0}});
        EvdevInput input(*m_service, device(), KeyMap::shipped());
        QVERIFY(input.open());
        QTRY_VERIFY(m_keys.contains(QStringLiteral("48:0")) || m_keys.contains(QStringLiteral("89:2")));
        QCOMPARE(m_keys.mid(0, 2), QStringList({QStringLiteral("89:0"), QStringLiteral("89:2")})); // it is up by now
    }

    void keysOfALostDeviceComeUpAndItIsFoundAgain()
    {
        plugIn({});
        EvdevInput input(*m_service, device(), KeyMap::shipped());
        input.setRetryInterval(20);
        QVERIFY(input.open());
        QVERIFY(happen(1, 104, 1));
        QTRY_COMPARE(m_keys, QStringList({QStringLiteral("89:0")}));
        QSignalSpy lost(&input, &EvdevInput::lost);
        QSignalSpy found(&input, &EvdevInput::found);
        pullOut();
        QTRY_COMPARE(lost.size(), 1);
        QCOMPARE(m_keys, QStringList({QStringLiteral("89:0"), QStringLiteral("89:2")}));
        g_object_unref(m_testbed); // a device that was removed cannot be added again
        m_testbed = umockdev_testbed_new();
        plugIn({{1, 109, 1}, {0, 0, 0}});
        QTRY_COMPARE(found.size(), 1);
        QTRY_COMPARE(m_keys.last(), QStringLiteral("88:0"));
    }

    void whatIsNoInputDeviceIsRefused()
    {
        EvdevInput missing(*m_service, QStringLiteral("/dev/input/event99"), KeyMap::shipped());
        QVERIFY(!missing.open());
        QCOMPARE(missing.errorString(), QStringLiteral("/dev/input/event99: No such file or directory"));
        EvdevInput other(*m_service, QStringLiteral("/dev/null"), KeyMap::shipped());
        QVERIFY(!other.open());
        QVERIFY(other.errorString().startsWith(QStringLiteral("/dev/null: not an input device")));
    }

    void aWrongMapIsRefusedWithItsField_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("problem");
        const auto row = [](const char* content, const char* problem) {
            QTest::newRow(content) << QByteArray(content) << QString::fromLatin1(problem);
        };
        row("[]", ": no keys in it");
        row("{\"keys\": 1}", ": keys: not an object");
        row("{\"buttons\": {}}", ": buttons: only 'keys', 'dials' and 'note' are known");
        row("{\"keys\": {\"KEY_FLY\": 6}}", ": keys.KEY_FLY: an input device has no such code");
        row("{\"keys\": {\"REL_DIAL\": 6}}", ": keys.REL_DIAL: an input device has no such code");
        row("{\"keys\": {\"KEY_A\": \"horn\"}}", ": keys.KEY_A: 'horn' is neither the name nor the number of a key");
        row("{\"keys\": {\"KEY_A\": 65536}}", ": keys.KEY_A: '65536' is neither the name nor the number of a key");
        row("{\"dials\": {\"REL_DIAL\": \"mute\"}}", ": dials.REL_DIAL: 'mute' cannot be turned both ways");
    }

    void aWrongMapIsRefusedWithItsField()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, problem);
        KeyMap map = KeyMap::shipped();
        const QString file = write("map.json", content);
        QVERIFY(!map.load(file));
        QCOMPARE(map.errorString(), file + problem);
        QCOMPARE(map.keyFor(113), 48); // as before
        QVERIFY(!map.load(write("map.json", "{\n\"keys\":\n}")));
        QVERIFY2(map.errorString().startsWith(file + QStringLiteral(":3: ")), qPrintable(map.errorString()));
        QVERIFY(!map.load(m_directory->path()));
        QCOMPARE(map.errorString(), m_directory->path() + QStringLiteral(": not a file that can be read"));
    }
};

QTEST_GUILESS_MAIN(EvdevInputTest)
#include "tst_evdevinput.moc"

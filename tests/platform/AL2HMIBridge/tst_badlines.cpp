// SPDX-License-Identifier: MIT
#include "bridgefixture.h"

#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/PhoneSource>

#include <QSignalSpy>

using namespace AL2HMIBridge;

/// What a peer may send that is not right: one warning, no effect, and the connection goes on.
class BadLinesTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<BridgeFixture> m_bridge;
    PeerSocket m_messages;

    static void row(const char* name, const QByteArray& line, const char* problem)
    {
        QTest::newRow(name) << line << QString::fromUtf8(problem);
    }

private Q_SLOTS:
    void init()
    {
        m_bridge = std::make_unique<BridgeFixture>();
        m_bridge->startMessages();
        m_messages = m_bridge->peer.accept("messages");
        QVERIFY(m_messages.greetWithSnapshot());
        QVERIFY(m_bridge->sendMarker(m_messages));
    }

    void cleanup()
    {
        m_messages.close();
        m_bridge.reset();
    }

    void badLineIsRefusedWithOneWarning_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::addColumn<QString>("problem");
        row("empty line", "", "not JSON: ");
        row("garbage", "hello", "not JSON: ");
        row("half an object", "{\"source\":\"GlobalSource\"", "not JSON: ");
        row("two objects", "{}{}", "not JSON: ");
        row("array", "[1]", "not a JSON object");
        row("not UTF-8 in a text", "{\"source\":\"FMTunerSource\",\"state\":{\"radioText\":\"\xff\xfe\"}}",
            "not JSON: ");
        row("control bytes", "\x01\x02\x1b[31m", "not JSON: ");
        row("NaN", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":NaN}}", "not JSON: ");
        row("number beyond doubles", "{\"source\":\"GlobalSource\",\"state\":{\"outsideTemperature\":1e999}}", "");
        row("too deep", QByteArray(2000, '[') + QByteArray(2000, ']'), "not JSON: ");
        row("empty object", "{}", "\"source\" must be a text");
        row("source not a text", "{\"source\":1,\"state\":{}}", "\"source\" must be a text");
        row("unknown source", "{\"source\":\"BoatSource\",\"state\":{}}", "BoatSource: no such source");
        row("abstract source", "{\"source\":\"TunerSource\",\"state\":{}}", "TunerSource: no such source");
        row("long name", "{\"source\":\"" + QByteArray(5000, 'x') + "\",\"state\":{}}",
            "xxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxxx...: no such source");
        row("control characters in a name", "{\"source\":\"a\\n\\u001b[1mb\",\"state\":{}}", "a??[1mb: no such source");
        row("neither state nor event", "{\"source\":\"GlobalSource\"}", "GlobalSource: neither state nor event");
        row("a call upward", "{\"source\":\"GlobalSource\",\"call\":\"systemVolumeSync\",\"args\":[]}",
            "GlobalSource: neither state nor event");
        row("state not an object", "{\"source\":\"GlobalSource\",\"state\":[]}",
            "GlobalSource: \"state\" must be an object and stand alone beside the source");
        row("one key too many", "{\"source\":\"GlobalSource\",\"state\":{},\"more\":1}",
            "GlobalSource: \"state\" must be an object and stand alone beside the source");
        row("unknown state", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":3,\"bass\":1}}",
            "GlobalSource.bass: no such state");
        row("other tuner's state", "{\"source\":\"AMTunerSource\",\"state\":{\"stereo\":true}}",
            "AMTunerSource.stereo: no such state");
        row("text for an integer", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":\"3\"}}",
            "GlobalSource.volume: not an integer");
        row("fraction for an integer", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":3.5}}",
            "GlobalSource.volume: not an integer");
        row("null", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":null}}", "GlobalSource.volume: not an integer");
        row("below the range", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":-1}}",
            "GlobalSource.volume: -1 is out of range");
        row("above the range", "{\"source\":\"GlobalSource\",\"state\":{\"volume\":41}}",
            "GlobalSource.volume: 41 is out of range");
        row("beyond 32 bits", "{\"source\":\"GlobalSource\",\"state\":{\"destinationCountry\":2147483648}}",
            "GlobalSource.destinationCountry: 2147483648 is out of range");
        row("beyond 64 bits", "{\"source\":\"GlobalSource\",\"state\":{\"destinationCountry\":1e40}}",
            "GlobalSource.destinationCountry: 1e+40 is out of range");
        row("real out of range", "{\"source\":\"GlobalSource\",\"state\":{\"vehicleSpeed\":-0.5}}",
            "GlobalSource.vehicleSpeed: -0.5 is out of range");
        row("number for a truth value", "{\"source\":\"GlobalSource\",\"state\":{\"muted\":1}}",
            "GlobalSource.muted: not true or false");
        row("unknown enumerator", "{\"source\":\"CDSource\",\"state\":{\"cdStatus\":9}}",
            "CDSource.cdStatus: 9 is not in the enumeration");
        row("text too long",
            "{\"source\":\"PhoneSource\",\"state\":{\"callerNumber\":\"" + QByteArray(65, '1') + "\"}}",
            "PhoneSource.callerNumber: longer than 64");
        row("list too long",
            "{\"source\":\"GlobalSource\",\"state\":{\"supportedLanguages\":[" + QByteArray(64, '1').replace("1", "1,")
                + "1]}}",
            "GlobalSource.supportedLanguages: more than 64 entries");
        row("wrong entry", "{\"source\":\"GlobalSource\",\"state\":{\"supportedLanguages\":[1,\"2\"]}}",
            "GlobalSource.supportedLanguages: entry 1: not an integer");
        row("record not an object", "{\"source\":\"PhoneSource\",\"state\":{\"contacts\":[1]}}",
            "PhoneSource.contacts: entry 0: not an object");
        row("record lacks a field", "{\"source\":\"PhoneSource\",\"state\":{\"contacts\":[{\"name\":\"A\"}]}}",
            "PhoneSource.contacts: entry 0: not all and only the fields of Contact");
        row("record with another field",
            "{\"source\":\"PhoneSource\",\"state\":{\"contacts\":[{\"name\":\"A\",\"mail\":\"\"}]}}",
            "PhoneSource.contacts: entry 0: number is missing");
        row("record with a wrong field",
            "{\"source\":\"PhoneSource\",\"state\":{\"contacts\":[{\"name\":\"A\",\"number\":1}]}}",
            "PhoneSource.contacts: entry 0: number: not a text");
        row("key on the wrong channel", "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,0]}",
            "KeySource: belongs on \"priority\"");
        row("unknown event", "{\"source\":\"GlobalSource\",\"event\":\"honk\",\"args\":[]}",
            "GlobalSource.honk: no such event");
        row("second greeting", "{\"protocol\":1,\"peer\":\"application-layer\"}", "a second greeting");
        row("snapshot not begun", "{\"snapshot\":\"complete\"}", "no snapshot is under way");
        row("half a snapshot", "{\"snapshot\":\"half\"}", "\"snapshot\" must be \"complete\"");
    }

    void badLineIsRefusedWithOneWarning()
    {
        QFETCH(QByteArray, line);
        QFETCH(QString, problem);
        QVERIFY(m_messages.sendLine(line));
        QVERIFY(m_bridge->sendMarker(m_messages));
        const QStringList warnings = m_bridge->takeWarnings();
        QCOMPARE(warnings.size(), 1);
        const QString expected = QStringLiteral("Line refused on messages: ") + problem;
        if (problem.endsWith(QStringLiteral(": ")) || problem.isEmpty()) // the rest is Qt's wording
            QVERIFY2(warnings.constFirst().startsWith(expected), qPrintable(warnings.constFirst()));
        else
            QCOMPARE(warnings.constFirst(), expected);
        QVERIFY(warnings.constFirst().size() < 250);
        for (const QChar character : warnings.constFirst())
            QVERIFY(character.isPrint());
        QCOMPARE(GlobalSource::instance()->volume(), 0);
        QCOMPARE(PhoneSource::instance()->contacts().size(), 0);
        QVERIFY(BridgeFixture::connected());
    }

    void keyEventsAreCheckedLikeState_data()
    {
        QTest::addColumn<QByteArray>("line");
        QTest::addColumn<QString>("problem");
        row("unknown event", "{\"source\":\"KeySource\",\"event\":\"keyEvnt\",\"args\":[7,0]}",
            "KeySource.keyEvnt: no such event");
        row("too few", "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7]}",
            "KeySource.keyEvent: 1 arguments instead of 2");
        row("text", "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[7,\"0\"]}",
            "KeySource.keyEvent, keyState: not an integer");
        row("negative", "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[-7,0]}",
            "KeySource.keyEvent, keyId: -7 is out of range");
        row("no array", "{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":7}",
            "KeySource: an event must have a name and an array \"args\", and nothing else");
        row("state", "{\"source\":\"GlobalSource\",\"state\":{}}", "GlobalSource: belongs on \"messages\"");
        row("snapshot", "{\"snapshot\":\"complete\"}", "snapshots belong on \"messages\"");
    }

    void keyEventsAreCheckedLikeState()
    {
        QFETCH(QByteArray, line);
        QFETCH(QString, problem);
        m_bridge->startPriority();
        PeerSocket keys = m_bridge->peer.accept("priority");
        QVERIFY(keys.greet());
        QSignalSpy events(KeySource::instance(), &KeySource::keyEvent);
        QVERIFY(keys.sendLine(line));
        QVERIFY(keys.sendLine("{\"source\":\"KeySource\",\"event\":\"keyEvent\",\"args\":[8,2]}"));
        QTRY_COMPARE(events.size(), 1);
        QCOMPARE(events.takeFirst(), QVariantList({8, 2}));
        QCOMPARE(m_bridge->takeWarnings(), QStringList(QStringLiteral("Line refused on priority: ") + problem));
    }

    void lineOfExactlyTheLimitIsTaken()
    {
        const QByteArray start("{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}");
        const QByteArray line = start + QByteArray(1024 * 1024 - 2 - start.size(), ' ') + '}';
        QCOMPARE(line.size() + 1, 1024 * 1024);
        QVERIFY(m_messages.sendLine(line));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 7);
    }

    void longerLineIsRefusedOnceToItsEnd()
    {
        const QByteArray start("{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}");
        for (const int size : {1024 * 1024, 3 * 1024 * 1024}) {
            QVERIFY(m_messages.sendLine(start + QByteArray(size - 1 - start.size(), ' ') + '}'));
            QVERIFY(m_bridge->sendMarker(m_messages));
            QCOMPARE(m_bridge->takeWarnings(),
                     QStringList(QStringLiteral("Line refused on messages: longer than 1048576 bytes")));
            QCOMPARE(GlobalSource::instance()->volume(), 0);
        }
    }

    void halfALineAtTheEndIsRefused()
    {
        QVERIFY(m_messages.send("{\"source\":\"GlobalSource\",\"state\":{\"volume\":7}}"));
        m_messages.close();
        QTRY_VERIFY(!BridgeFixture::connected());
        QCOMPARE(GlobalSource::instance()->volume(), 0);
        QVERIFY(m_bridge->log.takeOne(
            QtWarningMsg, QStringLiteral("Line refused on messages: the peer hung up in the middle of a line")));
    }

    void messagesMayArriveInAnyPieces()
    {
        const QByteArray line("{\"source\":\"GlobalSource\",\"state\":{\"volume\":%1,\"clockText\":\"Öß€😀\"}}\n");
        for (int split = 0; split <= line.size(); ++split) {
            const int volume = split % 40 + 1;
            const QByteArray bytes = QByteArray(line).replace("%1", QByteArray::number(volume));
            QVERIFY(m_messages.send(bytes.left(split)));
            QVERIFY(m_messages.send(bytes.mid(split)));
            QTRY_COMPARE(GlobalSource::instance()->volume(), volume);
            QCOMPARE(GlobalSource::instance()->clockText(), QStringLiteral("Öß€😀"));
        }
        const QByteArray last = QByteArray(line).replace("%1", "40");
        for (const char byte : last)
            QVERIFY(m_messages.send(QByteArray(1, byte)));
        QTRY_COMPARE(GlobalSource::instance()->volume(), 40);
    }

    void aFloodOfBadLinesIsCountedNotLogged()
    {
        QVERIFY(m_messages.send(QByteArray("x\n").repeated(5000)));
        QVERIFY(m_bridge->sendMarker(m_messages));
        m_messages.close();
        QTRY_VERIFY(!BridgeFixture::connected());
        const QStringList warnings = m_bridge->takeWarnings();
        int counted = 0;
        for (const QString& warning : warnings)
            counted += warning.contains(QStringLiteral("more within a second"))
                           ? warning.section(QLatin1Char(' '), 4, 4).toInt()
                           : 1;
        QCOMPARE(counted, 5000);
        QVERIFY2(warnings.size() < 2500, qPrintable(QString::number(warnings.size())));
    }
};

QTEST_GUILESS_MAIN(BadLinesTest)
#include "tst_badlines.moc"

// SPDX-License-Identifier: MIT
#include "jsonfiles.h"
#include "logcapture.h"

#include <HmiCore/HmiValueMapper>
#include <HmiCore/ValueMappingProcessor>

#include <QQmlEngine>

#include <optional>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

class HmiValueMapperTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<Files> files;
    HmiValueMapper* mapper = nullptr;

    void load(const QByteArray& document)
    {
        files->write(text("values.json"), document);
        mapper->loadValueMapping(files->path(text("values.json")));
    }
    QVariant mapped(const char* name, int value) const { return mapper->mappedValue(text(name), value); }

private Q_SLOTS:
    void initTestCase() { mapper = HmiValueMapper::instance(); }
    void init()
    {
        log.emplace();
        files.emplace();
    }
    void cleanup() { log.reset(); }

    void thereIsOne()
    {
        QCOMPARE(HmiValueMapper::instance(), mapper);
        QCOMPARE(mapper->parent(), QCoreApplication::instance());
        QQmlEngine engine;
        QCOMPARE(HmiValueMapper::valueMapperProvider(&engine, &engine), mapper);
        QCOMPARE(QQmlEngine::objectOwnership(mapper), QQmlEngine::CppOwnership);
    }

    void mapsWhatIsListed()
    {
        load("[{\"valueName\":\"driveMode\",\"default\":\"Unknown\",\"values\":[{\"value\":0,\"mapping\":\"Normal\"},"
             "{\"value\":1,\"mapping\":\"Sport\"},{\"value\":-2,\"mapping\":{\"a\":[true]}}]},"
             "{\"valueName\":\"gearIcon\",\"values\":[{\"value\":0,\"mapping\":\"park.png\"}]}]");
        QCOMPARE(mapped("driveMode", 0), QVariant(text("Normal")));
        QCOMPARE(mapped("driveMode", 1), QVariant(text("Sport")));
        QCOMPARE(mapped("driveMode", 7), QVariant(text("Unknown")));
        QCOMPARE(mapped("driveMode", -2), QVariant(QVariantMap{{text("a"), QVariantList{true}}}));
        QCOMPARE(mapped("gearIcon", 0), QVariant(text("park.png")));
        QCOMPARE(mapped("gearIcon", 3), QVariant());
        QCOMPARE(mapped("other", 0), QVariant());
    }

    void theDefaultStandsForWhatHasNoMapping()
    {
        load("[{\"valueName\":\"a\",\"default\":1,\"values\":[{\"value\":4},{\"mapping\":\"lost\"}]},"
             "{\"valueName\":\"b\",\"default\":null}]");
        QCOMPARE(mapped("a", 4), QVariant(1.0));
        QCOMPARE(mapped("a", 0), QVariant(1.0));
        QVERIFY(mapped("b", 0).isValid() && mapped("b", 0).isNull());
    }

    void oddNumbersAreZero_data()
    {
        QTest::addColumn<QByteArray>("value");
        QTest::addColumn<int>("number");
        QTest::newRow("text") << QByteArray("\"1\"") << 0;
        QTest::newRow("fraction") << QByteArray("1.5") << 0;
        QTest::newRow("true") << QByteArray("true") << 0;
        QTest::newRow("null") << QByteArray("null") << 0;
        QTest::newRow("too large") << QByteArray("4294967296") << 0;
        QTest::newRow("integral") << QByteArray("3.0") << 3;
        QTest::newRow("negative") << QByteArray("-7") << -7;
    }
    void oddNumbersAreZero()
    {
        QFETCH(QByteArray, value);
        QFETCH(int, number);
        load("[{\"valueName\":\"a\",\"values\":[{\"value\":" + value + ",\"mapping\":\"x\"}]}]");
        QCOMPARE(mapped("a", number), QVariant(text("x")));
    }

    void theLastOfTwoReplacesTheList()
    {
        load(
            "[{\"valueName\":\"a\",\"default\":\"d\",\"values\":[{\"value\":1,\"mapping\":\"x\"},{\"value\":2,\"mapping\":\"y\"}]},"
            "{\"valueName\":\"a\",\"values\":[{\"value\":2,\"mapping\":\"z\"},{\"value\":2,\"mapping\":\"zz\"}]}]");
        QCOMPARE(mapped("a", 1), QVariant(text("d")));
        QCOMPARE(mapped("a", 2), QVariant(text("zz")));
        load("[{\"valueName\":\"a\",\"default\":\"d\",\"values\":[{\"value\":1,\"mapping\":\"x\"}]},"
             "{\"valueName\":\"a\",\"default\":\"e\",\"values\":[]}]");
        QCOMPARE(mapped("a", 1), QVariant(text("e")));
    }

    void anotherFileReplacesEverything()
    {
        load("[{\"valueName\":\"a\",\"default\":1}]");
        load("[{\"valueName\":\"b\",\"default\":2}]");
        QCOMPARE(mapped("a", 0), QVariant());
        QCOMPARE(mapped("b", 0), QVariant(2.0));
    }

    void badFiles_data() { addBadDocuments(); }
    void badFiles()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, special);
        QFETCH(int, outcome);
        load("[{\"valueName\":\"a\",\"default\":1}]");
        const QString name = text("bad.json");
        layDown(*files, name, content, special);
        mapper->loadValueMapping(files->path(name));
        const QStringList warnings = log->take(core, QtWarningMsg);
        const char* const starts[] = {"Value mapping config file does not exist: \"",
                                      "Can't read value mapping config file: \"",
                                      "Value mapping config file parse error: \""};
        QCOMPARE(warnings.size(), outcome < 3 ? 1 : 0);
        if (outcome < 3)
            QVERIFY2(warnings.constFirst().startsWith(text(starts[outcome])), qPrintable(warnings.constFirst()));
        QCOMPARE(mapped("a", 0), QVariant());
    }

    void tellsWhatItLoaded()
    {
        log.reset();
        log.emplace(text("kest.hmicore.debug=true"));
        load("[{\"valueName\":\"a\",\"default\":\"d\"}]");
        const QStringList lines = log->take(core, QtDebugMsg);
        QCOMPARE(lines.size(), 1);
        QVERIFY(lines.constFirst().startsWith(text("Value mapping configuration: ")));
        QVERIFY(log->records().isEmpty());
    }

    void theReaderGivesBothMaps()
    {
        files->write(text("v.json"), "[{\"valueName\":\"a\",\"default\":1,\"values\":[{\"value\":2,\"mapping\":3}]}]");
        const auto both = ValueMappingProcessor::parse(files->path(text("v.json")));
        QCOMPARE(both.first.value(text("a")).value(2), QVariant(3.0));
        QCOMPARE(both.second.value(text("a")), QVariant(1.0));
    }
};

QTEST_GUILESS_MAIN(HmiValueMapperTest)
#include "tst_hmivaluemapper.moc"

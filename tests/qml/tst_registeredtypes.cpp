// SPDX-License-Identifier: MIT
#include "registeredtypes.h"

#include <HmiCore/hmicore.h>

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

namespace {

enum Kind { Uncreatable, Singleton, Creatable };

const struct
{
    const char* module;
    const char* name;
    const char* type;
    Kind kind;
} contract[] = {
    {"HmiCore", "HmiHandwritingRecognizer", "HmiHandwritingRecognizer", Uncreatable},
    {"HmiCore", "HmiComplexKeyboardEngine", "HmiComplexKeyboardEngine", Uncreatable},
    {"HmiCore", "HmiTranslationManager", "HmiTranslationManager", Singleton},
    {"HmiCore", "HmiRegionPropertyStore", "HmiRegionPropertyStore", Singleton},
    {"HmiCore", "HmiMarketPropertyStore", "HmiMarketPropertyStore", Singleton},
    {"HmiCore", "HmiValueMapper", "HmiValueMapper", Singleton},
    {"HmiCore", "HardKeyController", "HardKeyController", Singleton},
    {"HmiIntents", "HmiIntentMonitor", "HmiIntentMonitor", Uncreatable},
    {"HmiIntents", "HmiIntents", "HmiIntentManager", Singleton},
    {"HmiOverrides", "HmiOverrides", "HmiActivationOverrideManager", Singleton},
    {"HmiCore", "HmiLanguagePropertyStore", "HmiLanguagePropertyStore", Singleton},
    {"HmiCore", "HmiHandwriting", "HmiHandwriting", Creatable},
    {"HmiCore", "HmiComplexKeyboard", "HmiComplexKeyboard", Creatable},
    {"HmiCore", "HmiLanguageBundleModel", "HmiLanguageBundleModel", Creatable},
};
constexpr int count = sizeof contract / sizeof contract[0];

QStringList modules()
{
    return {QStringLiteral("HmiCore"), QStringLiteral("HmiIntents"), QStringLiteral("HmiOverrides")};
}

} // namespace

/// What HmiCore::registerTypes() registers, in this order, and how that is described.
class RegisteredTypesTest : public QObject
{
    Q_OBJECT

    static QString description(const QString& module)
    {
        return QString::fromUtf8(typeDescription(registeredTypes({module})));
    }

private Q_SLOTS:
    void initTestCase()
    {
        QVERIFY(registeredTypes(modules()).isEmpty());
        HmiCore::registerTypes();
        QCOMPARE(registeredTypes(modules()).size(), count);
    }

    void eachIsAsPublished_data()
    {
        QTest::addColumn<int>("index");
        for (int i = 0; i < count; ++i)
            QTest::newRow(contract[i].name) << i;
    }

    void eachIsAsPublished()
    {
        QFETCH(int, index);
        const auto& expected = contract[index];
        const RegisteredType type = registeredTypes(modules()).at(index);
        QCOMPARE(type.module, QString::fromLatin1(expected.module));
        QCOMPARE(type.name, QString::fromLatin1(expected.name));
        QCOMPARE(QByteArray(type.metaObject->className()), "HmiCore::" + QByteArray(expected.type));
        QCOMPARE(type.majorVersion, 1);
        QCOMPARE(type.minorVersion, 0);
        QCOMPARE(type.isSingleton, expected.kind == Singleton);
        QCOMPARE(type.isCreatable, expected.kind == Creatable);
        const QString reason = QString::fromLatin1(expected.name) + QLatin1String(" is not creatable");
        QCOMPARE(type.whyNotCreatable, expected.kind == Uncreatable ? reason : QString());
    }

    void theDescriptionHasWhatQmlSees_data()
    {
        QTest::addColumn<QString>("module");
        QTest::addColumn<QString>("lines");
        const auto row = [](const char* name, const char* module, const char* lines) {
            QTest::newRow(name) << QString::fromLatin1(module) << QString::fromLatin1(lines);
        };
        row("creatable", "HmiCore",
            "        name: \"HmiCore::HmiHandwriting\"\n"
            "        accessSemantics: \"reference\"\n"
            "        prototype: \"QObject\"\n"
            "        exports: [\"HmiCore/HmiHandwriting 1.0\"]\n"
            "        exportMetaObjectRevisions: [256]\n"
            "        Enum {\n"
            "            name: \"Language\"\n"
            "            values: {\n"
            "                \"Invalid\": 0,\n"
            "                \"SimplifiedChinese\": 1,\n"
            "                \"TraditionalChinese\": 2,\n"
            "                \"Latin\": 3\n"
            "            }\n"
            "        }\n");
        row("uncreatable, and why", "HmiIntents", "isCreatable: false // HmiIntentMonitor is not creatable\n");
        row("singleton", "HmiIntents",
            "        exports: [\"HmiIntents/HmiIntents 1.0\"]\n"
            "        exportMetaObjectRevisions: [256]\n"
            "        isCreatable: false\n"
            "        isSingleton: true\n");
        row("read-only property that is a list", "HmiOverrides",
            "Property { name: \"nameOverrides\"; type: \"int\"; isList: true; isReadonly: true; notify: "
            "\"nameOverridesChanged\" }\n");
        row("property that is an object", "HmiCore",
            "Property { name: \"engine\"; type: \"HmiCore::HmiComplexKeyboardEngine\"; isPointer: true; isReadonly: "
            "true; notify: \"engineChanged\" }\n");
        row("property that is written", "HmiCore",
            "Property { name: \"bundleId\"; type: \"QString\"; notify: \"bundleIdChanged\" }\n");
        row("signal", "HmiIntents",
            "        Signal {\n"
            "            name: \"handlingFailed\"\n"
            "            Parameter { name: \"intent\"; type: \"int\" }\n"
            "            Parameter { name: \"error\"; type: \"QString\" }\n"
            "        }\n");
        row("method without its optional arguments", "HmiIntents",
            "        Method {\n"
            "            name: \"requestAction\"\n"
            "            type: \"bool\"\n"
            "            Parameter { name: \"intent\"; type: \"int\" }\n"
            "        }\n");
        row("base that is not registered", "HmiCore",
            "        name: \"HmiCore::HmiPropertyStore\"\n"
            "        accessSemantics: \"reference\"\n"
            "        prototype: \"QObject\"\n"
            "        isCreatable: false\n");
        row("base of Qt that Qt does not describe", "HmiCore",
            "        name: \"QSortFilterProxyModel\"\n"
            "        accessSemantics: \"reference\"\n"
            "        prototype: \"QAbstractProxyModel\"\n");
    }

    void theDescriptionHasWhatQmlSees()
    {
        QFETCH(QString, module);
        QFETCH(QString, lines);
        const QString all = description(module);
        QVERIFY2(all.contains(lines), qPrintable(all));
    }

    void theDescriptionHidesWhatIsPrivate()
    {
        QVERIFY(!description(QStringLiteral("HmiCore")).contains(QLatin1String("onHardKeyReceived")));
        QVERIFY(!description(QStringLiteral("HmiOverrides")).contains(QLatin1String("onNameOverrideChanged")));
        QVERIFY(!description(QStringLiteral("HmiOverrides")).contains(QLatin1String("HmiHandwriting")));
    }

    void eachModuleGetsItsFolder()
    {
        const QTemporaryDir folder;
        QString error;
        QVERIFY2(writeDescriptions(folder.path(), modules(), &error), qPrintable(error));
        for (const QString& module : modules()) {
            QFile list(folder.filePath(module + QLatin1String("/qmldir")));
            QVERIFY(list.open(QIODevice::ReadOnly));
            QVERIFY(list.readAll().startsWith("module " + module.toUtf8() + "\ntypeinfo plugins.qmltypes\n"));
            QFile types(folder.filePath(module + QLatin1String("/plugins.qmltypes")));
            QVERIFY(types.open(QIODevice::ReadOnly));
            QCOMPARE(QString::fromUtf8(types.readAll()), description(module));
        }
    }

    void failuresSayWhat()
    {
        const QTemporaryDir folder;
        QString error;
        QVERIFY(!writeDescriptions(folder.path(), {QStringLiteral("HmiNone")}, &error));
        QCOMPARE(error, QStringLiteral("no type of the module HmiNone is registered"));
        QFile file(folder.filePath(QStringLiteral("file")));
        QVERIFY(file.open(QIODevice::WriteOnly));
        QVERIFY(!writeDescriptions(file.fileName(), {QStringLiteral("HmiCore")}, &error));
        QCOMPARE(error, file.fileName() + QLatin1String("/HmiCore: the folder cannot be made"));
    }
};

QTEST_GUILESS_MAIN(RegisteredTypesTest)
#include "tst_registeredtypes.moc"

// SPDX-License-Identifier: MIT
#include "fakemodule.h"

#include <QMetaProperty>
#include <QQmlComponent>
#include <QQmlContext>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

using namespace HmiCore;

namespace {

/// Overrides only what it must.
class BareModule : public HmiModuleIntegration
{
public:
    BareModule()
        : HmiModuleIntegration(BackgroundModule, nullptr)
    {
    }
    QString moduleName() const override { return QStringLiteral("Phone"); }
    int modulePriority() const override { return 3; }
    QString viewDescriptorFile() const override { return QStringLiteral("phone.json"); }
    HmiStateMachine::Identifier rootStateIdentifier() const override { return QStringLiteral("PHONE.Main"); }
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState*) override { return nullptr; }
    void setupRootContext(QQmlContext*) override {}
};

} // namespace

class HmiModuleIntegrationTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void whatIsNotOverriddenHasItsDefault()
    {
        BareModule module;
        QCOMPARE(module.moduleId(), QStringLiteral("PHONE"));
        QCOMPARE(module.moduleDomain(), 0);
        QCOMPARE(module.iconUrl(), QUrl());
        QVERIFY(module.moduleRootHierarchyTransitions().isEmpty());
        QVERIFY(module.moduleRootHierarchyPopupStates().isEmpty());
        module.registerTypes();
        QVERIFY(module.enabled());
        QVERIFY(!module.blocked());
    }

    void theTypeIsFixedAtConstruction()
    {
        QCOMPARE(int(HmiModuleIntegration::RootModule), 1);
        QCOMPARE(sizeof(HmiModuleIntegration::ModuleType), sizeof(qint32));
        QCOMPARE(BareModule().type(), HmiModuleIntegration::BackgroundModule);
        const auto own = static_cast<HmiModuleIntegration::ModuleType>(17);
        QCOMPARE(FakeModule(QStringLiteral("Own"), 0, 0, own).type(), own);
    }

    void theParentOwnsIt()
    {
        QObject parent;
        const FakeModule* const module =
            new FakeModule(QStringLiteral("Child"), 0, 0, HmiModuleIntegration::RootModule, &parent);
        QCOMPARE(module->parent(), &parent);
    }

    void theMetaObjectIsThatOfTheContract_data()
    {
        QTest::addColumn<QByteArray>("name");
        QTest::addColumn<QByteArray>("type");
        QTest::addColumn<bool>("writable");
        QTest::addColumn<bool>("constant");
        QTest::addColumn<QByteArray>("notify");
        const auto row = [](const char* name, const char* type, bool writable, bool constant, const char* notify) {
            QTest::newRow(name) << QByteArray(name) << QByteArray(type) << writable << constant << QByteArray(notify);
        };
        row("moduleName", "QString", false, true, "");
        row("iconUrl", "QUrl", false, false, "iconUrlChanged(QUrl)");
        row("modulePriority", "int", false, true, "");
        row("viewDescriptorFile", "QString", false, true, "");
        row("rootStateIdentifier", "HmiStateMachine::Identifier", false, true, "");
        row("enabled", "bool", true, false, "enabledChanged(bool)");
        row("blocked", "bool", true, false, "blockedChanged(bool)");
    }

    void theMetaObjectIsThatOfTheContract()
    {
        QFETCH(QByteArray, name);
        QFETCH(QByteArray, type);
        const QMetaObject& meta = HmiModuleIntegration::staticMetaObject;
        const int index = meta.indexOfProperty(name.constData());
        QVERIFY(index >= meta.propertyOffset());
        const QMetaProperty property = meta.property(index);
        // Qt 6 resolves the alias when it compiles the meta-object.
        if (type != "HmiStateMachine::Identifier" || QByteArray(property.typeName()) != "QString")
            QCOMPARE(QByteArray(property.typeName()), type);
        QTEST(property.isWritable(), "writable");
        QTEST(property.isConstant(), "constant");
        QTEST(property.hasNotifySignal() ? property.notifySignal().methodSignature() : QByteArray(""), "notify");
    }

    void thePropertiesFollowTheContractsOrder()
    {
        const QMetaObject& meta = HmiModuleIntegration::staticMetaObject;
        QStringList names;
        for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i)
            names.append(QString::fromLatin1(meta.property(i).name()));
        QCOMPARE(
            names.join(QLatin1Char(' ')),
            QStringLiteral("moduleName iconUrl modulePriority viewDescriptorFile rootStateIdentifier enabled blocked"));
        QCOMPARE(meta.enumeratorCount() - meta.enumeratorOffset(), 0);
    }

    void onlyBlockingIsProtected()
    {
        const QMetaObject& meta = HmiModuleIntegration::staticMetaObject;
        QCOMPARE(meta.method(meta.indexOfSlot("setEnabled(bool)")).access(), QMetaMethod::Public);
        QCOMPARE(meta.method(meta.indexOfSlot("setBlocked(bool)")).access(), QMetaMethod::Protected);
    }

    void everyPropertyCanBeReadAtRunTime()
    {
        FakeModule module(QStringLiteral("Radio"), 4);
        QCOMPARE(module.property("moduleName"), QVariant(QStringLiteral("Radio")));
        QCOMPARE(module.property("modulePriority"), QVariant(4));
        QCOMPARE(module.property("viewDescriptorFile"), QVariant(QStringLiteral(":/Radio.json")));
        QCOMPARE(module.property("rootStateIdentifier").toString(), QStringLiteral("Radio.Root"));
        QCOMPARE(module.property("enabled"), QVariant(true));
        QCOMPARE(module.property("blocked"), QVariant(false));
    }

    void settersEmitOnlyOnAChange_data()
    {
        QTest::addColumn<QByteArray>("property");
        QTest::addColumn<bool>("initial");
        QTest::newRow("enabled") << QByteArray("enabled") << true;
        QTest::newRow("blocked") << QByteArray("blocked") << false;
    }

    void settersEmitOnlyOnAChange()
    {
        QFETCH(QByteArray, property);
        QFETCH(bool, initial);
        FakeModule module(QStringLiteral("Radio"));
        QSignalSpy enabledChanged(&module, &HmiModuleIntegration::enabledChanged);
        QSignalSpy blockedChanged(&module, &HmiModuleIntegration::blockedChanged);
        QSignalSpy& changed = property == "enabled" ? enabledChanged : blockedChanged;
        QSignalSpy& other = property == "enabled" ? blockedChanged : enabledChanged;
        for (const bool value : {initial, !initial, !initial, initial, initial})
            QVERIFY(module.setProperty(property.constData(), value));
        QCOMPARE(changed.count(), 2);
        QCOMPARE(changed.at(0).first().toBool(), !initial);
        QCOMPARE(changed.at(1).first().toBool(), initial);
        QCOMPARE(other.count(), 0);
    }

    void theValueIsStoredBeforeTheSignal()
    {
        FakeModule module(QStringLiteral("Radio"));
        bool seen = true;
        connect(&module, &HmiModuleIntegration::enabledChanged, this, [&] { seen = module.enabled(); });
        module.setEnabled(false);
        QVERIFY(!seen);
    }

    void qmlReadsAndBlocksModules()
    {
        FakeModule module(QStringLiteral("Radio"));
        QQmlEngine engine;
        engine.rootContext()->setContextProperty(QStringLiteral("module"), &module);
        QQmlComponent component(&engine);
        component.setData("import QtQml 2.0\n"
                          "QtObject {\n"
                          "    property string root: module.rootStateIdentifier\n"
                          "    property url icon: module.iconUrl\n"
                          "    Component.onCompleted: module.blocked = true\n"
                          "}\n",
                          QUrl());
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        QCOMPARE(object->property("root").toString(), QStringLiteral("Radio.Root"));
        QVERIFY(module.blocked());
        module.setIconUrl(QUrl(QStringLiteral("image://hmiimages/radio")));
        QCOMPARE(object->property("icon").toUrl(), module.icon);
    }
};

QTEST_GUILESS_MAIN(HmiModuleIntegrationTest)
#include "tst_hmimoduleintegration.moc"

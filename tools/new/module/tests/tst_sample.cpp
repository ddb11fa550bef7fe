// SPDX-License-Identifier: MIT
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QTest>
#include <QTranslator>

using HmiCore::HmiApplication;
using HmiCore::HmiManager;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::HmiState;
using HmiStateMachine::StateMachine;

namespace {

/// A head unit with nothing but a place for modules.
class Initializer : public HmiCore::HmiInitializer
{
public:
    void initializeSources() override {}
    void connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>&) override {}
    void completeInitialization() override {}
    void buildTopStateTree() override { m_modules = new HmiState(QStringLiteral("Modules"), StateMachine::instance()); }
    HmiState* modulesRootState() override { return m_modules; }
    QString rootHierarchyViewDescriptorPath() override { return {}; }
    QString rootHierarchyViewPrefix() override { return {}; }

private:
    HmiState* m_modules = nullptr;
};

} // namespace

/// The plugin, as HmiCore loads it.
class SampleTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void theLauncherShowsTheModule()
    {
        QCOMPARE(HmiManager::instance()->sortedModulesModel()->rowCount(), 1);
        QCOMPARE(HmiManager::instance()->factoryDefaultHomeState(), QStringLiteral("SAMPLE"));
    }

    void itsViewHasAState()
    {
        const auto views = DataStore::get<ViewManager>(QStringLiteral("ViewManager"))->guiDescriptor().views;
        QCOMPARE(views.keys(), QStringList(QStringLiteral("SAMPLE.Main")));
        QVERIFY(StateMachine::instance()->findState(QStringLiteral("SAMPLE.Main")));
    }

    void itCounts()
    {
        auto* const counter = qApp->findChild<QObject*>(QStringLiteral("sampleCounter"));
        QVERIFY(counter);
        QSignalSpy changes(counter, SIGNAL(valueChanged(int))); // the class itself is the plugin's
        QVERIFY(QMetaObject::invokeMethod(counter, "increase"));
        QCOMPARE(counter->property("value").toInt(), 1);
        QCOMPARE(changes.count(), 1);
    }

    void itSpeaksGerman()
    {
        QTranslator german;
        QVERIFY(german.load(QStringLiteral(":/sample/translations/sample_de.qm")));
        QCOMPARE(german.translate("SampleScreen", "Count"), QStringLiteral("Zählen"));
    }
};

int main(int argc, char** argv)
{
    HmiApplication application(argc, argv);
    Initializer initializer;
    application.initialize(&initializer);
    SampleTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_sample.moc"

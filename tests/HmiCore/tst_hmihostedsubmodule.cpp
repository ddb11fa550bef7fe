// SPDX-License-Identifier: MIT
#include "fakesubmodule.h"
#include "logcapture.h"

#include <QTest>

#include <optional>

using namespace HmiCore;
using HmiStateMachine::HmiState;

namespace {

/// Overrides only what it must.
class BareSubmodule : public HmiHostedSubmodule
{
public:
    HmiGuiFramework::HmiAction* entryAction() override { return nullptr; }
    QString moduleId() const override { return {}; }
    QString submoduleName() const override { return {}; }
    QString viewDescriptorFile() const override { return {}; }
    void create(HmiState*) override {}
};

} // namespace

class HmiHostedSubmoduleTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    HmiState settings{QStringLiteral("SETTINGS.Root")};
    HmiState apps{QStringLiteral("APPS.Root")};

    QStringList debugLines() { return log->take(QStringLiteral("kest.hmicore"), QtDebugMsg); }
    QStringList warnings() { return log->take(QStringLiteral("kest.hmicore"), QtWarningMsg); }

private Q_SLOTS:
    void init() { log.emplace(QStringLiteral("kest.hmicore.debug=true")); }
    void cleanup() { log.reset(); }

    void theDefaultListsAreEmpty()
    {
        BareSubmodule submodule;
        QVERIFY(submodule.createRootHierarchyTransitions().isEmpty());
        QVERIFY(submodule.createRootHierarchyPopupStates().isEmpty());
    }

    void buildsThenAddsItsEntry()
    {
        HmiSubmoduleHost host(&settings, 12, nullptr);
        FakeSubmodule sound(QStringLiteral("Sound"));
        sound.createSubmodule(&host);
        QCOMPARE(sound.ownCalls,
                 QStringList({QStringLiteral("Sound in SETTINGS.Root"), QStringLiteral("Sound entry action")}));
        QCOMPARE(host.submoduleEntryActionModel()->rowCount(), 1);
        QCOMPARE(debugLines(), QStringList(QStringLiteral("\"Sound\" Created in \"SETTINGS.Root\"")));
    }

    void loadsTheViewsUnderItsIdAndTheHostsDomain()
    {
        const ViewLoading loading;
        HmiSubmoduleHost host(&settings, 12, nullptr);
        FakeSubmodule sound(QStringLiteral("Sound"));
        sound.descriptor = loading.path();
        sound.createSubmodule(&host);
        QCOMPARE(loading.loaded(), QStringList(QStringLiteral("SOUND.Main:12")));
    }

    void withoutADescriptorNothingIsLoaded()
    {
        const ViewLoading loading;
        HmiSubmoduleHost host(&settings, 12, nullptr);
        FakeSubmodule sound(QStringLiteral("Sound"));
        sound.createSubmodule(&host);
        QCOMPARE(loading.loaded(), QStringList());
    }

    void oneStateTakesItOnce()
    {
        HmiSubmoduleHost host(&settings, 12, nullptr);
        HmiSubmoduleHost sameState(&settings, 13, nullptr);
        HmiSubmoduleHost otherState(&apps, 12, nullptr);
        FakeSubmodule sound(QStringLiteral("Sound"));
        sound.createSubmodule(&host);
        debugLines();
        sound.createSubmodule(&sameState);
        QCOMPARE(warnings(), QStringList(QStringLiteral(
                                 "Submodule creation skipped, \"SETTINGS.Root\" already contains \"Sound\"")));
        QCOMPARE(sameState.submoduleEntryActionModel()->rowCount(), 0);
        QCOMPARE(debugLines(), QStringList());
        sound.createSubmodule(&otherState);
        QCOMPARE(sound.ownCalls.filter(QStringLiteral(" in ")),
                 QStringList({QStringLiteral("Sound in SETTINGS.Root"), QStringLiteral("Sound in APPS.Root")}));
    }
};

QTEST_MAIN(HmiHostedSubmoduleTest)
#include "tst_hmihostedsubmodule.moc"

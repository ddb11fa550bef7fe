// SPDX-License-Identifier: MIT
#include "fakesubmodule.h"
#include "logcapture.h"

#include <HmiCore/HmiSubmoduleProvider>

#include <QTest>

#include <optional>

using namespace HmiCore;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;

/// The provider never forgets, so each test uses a domain of its own and objects that outlive the test.
class HmiSubmoduleProviderTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    int domain = 100;
    HmiSubmoduleProvider* provider = nullptr;
    QObject keeper;

    FakeFactory* factory()
    {
        auto* const made = new FakeFactory;
        made->setParent(&keeper);
        return made;
    }
    FakeSubmodule* submodule(const char* name, QStringList* order = nullptr)
    {
        auto* const made = new FakeSubmodule(QString::fromLatin1(name), order);
        made->setParent(&keeper);
        return made;
    }
    HmiSubmoduleHost* host(const char* stateName)
    {
        auto* const made = new HmiSubmoduleHost(new HmiState(QString::fromLatin1(stateName)), domain, &keeper);
        made->submoduleHostState()->QObject::setParent(made);
        return made;
    }
    QStringList warnings() { return log->take(QStringLiteral("kest.hmicore"), QtWarningMsg); }
    int transitionCount() const { return int(provider->rootHierarchyTransitions().size()); }
    int popupCount() const { return int(provider->rootHierarchyPopupStates().size()); }

private Q_SLOTS:
    void init()
    {
        ++domain;
        provider = HmiSubmoduleProvider::instance();
        log.emplace();
    }
    void cleanup() { log.reset(); }

    void thereIsOneBelowTheApplication()
    {
        QCOMPARE(provider, HmiSubmoduleProvider::instance());
        QCOMPARE(provider->parent(), QCoreApplication::instance());
        QVERIFY(provider->rootHierarchyTransitions().isEmpty());
        QVERIFY(provider->rootHierarchyPopupStates().isEmpty());
    }

    void aRequestBeforeTheFactoryWaitsForIt()
    {
        HmiLayeredState state(QStringLiteral("S"));
        FakeFactory* const contacts = factory();
        QVERIFY(!provider->requestSubmodule(domain, &state, QStringLiteral("one"), 1));
        QVERIFY(!provider->requestSubmodule(domain, &state, QStringLiteral("two"), 2));
        QCOMPARE(contacts->built, QStringList());
        provider->registerSubmoduleFactory(domain, contacts);
        QCOMPARE(contacts->built, QStringList({QStringLiteral("S/one/1"), QStringLiteral("S/two/2")}));
        QVERIFY(provider->requestSubmodule(domain, &state, QStringLiteral("three"), 3));
        QCOMPARE(contacts->built.last(), QStringLiteral("S/three/3"));
    }

    void aRequestForAnotherDomainIsNotServed()
    {
        HmiLayeredState state(QStringLiteral("S"));
        FakeFactory* const contacts = factory();
        QVERIFY(!provider->requestSubmodule(-domain, &state, QStringLiteral("one"), 1));
        provider->registerSubmoduleFactory(domain, contacts);
        QCOMPARE(contacts->built, QStringList());
        FakeFactory* const other = factory();
        provider->registerSubmoduleFactory(-domain, other);
        QCOMPARE(other->built.size(), 1);
    }

    void aLaterFactoryReplacesTheFirst()
    {
        HmiLayeredState state(QStringLiteral("S"));
        FakeFactory* const first = factory();
        FakeFactory* const second = factory();
        provider->requestSubmodule(domain, &state, QStringLiteral("one"), 1);
        provider->registerSubmoduleFactory(domain, first);
        provider->registerSubmoduleFactory(domain, second);
        QCOMPARE(second->built, QStringList()); // the first one served what waited
        QVERIFY(provider->requestSubmodule(domain, &state, QStringLiteral("two"), 1));
        QCOMPARE(first->built.size(), 1);
        QCOMPARE(second->built, QStringList(QStringLiteral("S/two/1")));
    }

    void aFactoryMayRequestAndRegisterWhileItBuilds()
    {
        HmiLayeredState state(QStringLiteral("S"));
        FakeFactory* const outer = factory();
        FakeFactory* const inner = factory();
        outer->whenBuilt = [&] {
            for (int i = 0; i < 100; ++i)
                provider->requestSubmodule(10000 * domain + i, &state, QStringLiteral("other"), 0);
            QVERIFY(provider->requestSubmodule(domain, &state, QStringLiteral("nested"), 0));
            provider->registerSubmoduleFactory(domain, inner);
        };
        provider->requestSubmodule(domain, &state, QStringLiteral("one"), 1);
        provider->requestSubmodule(domain, &state, QStringLiteral("two"), 2);
        provider->registerSubmoduleFactory(domain, outer);
        QCOMPARE(outer->built,
                 QStringList({QStringLiteral("S/one/1"), QStringLiteral("S/nested/0"), QStringLiteral("S/two/2")}));
        QCOMPARE(inner->built, QStringList());
    }

    void hostAndSubmoduleMeetInAnyOrder_data()
    {
        QTest::addColumn<bool>("hostFirst");
        QTest::newRow("host first") << true;
        QTest::newRow("submodule first") << false;
    }

    void hostAndSubmoduleMeetInAnyOrder()
    {
        QFETCH(bool, hostFirst);
        HmiSubmoduleHost* const settings = host("SETTINGS");
        FakeSubmodule* const sound = submodule("Sound");
        const int transitionsBefore = transitionCount();
        const int popupsBefore = popupCount();
        if (hostFirst)
            provider->registerSubmoduleHost(domain, settings);
        provider->registerHostedSubmodule(domain, sound);
        if (!hostFirst)
            provider->registerSubmoduleHost(domain, settings);
        QCOMPARE(sound->ownCalls,
                 QStringList({QStringLiteral("Sound in SETTINGS"), QStringLiteral("Sound entry action"),
                              QStringLiteral("Sound transitions"), QStringLiteral("Sound popup states")}));
        QCOMPARE(settings->submoduleEntryActionModel()->rowCount(), 1);
        QCOMPARE(transitionCount(), transitionsBefore + 1);
        QCOMPARE(provider->rootHierarchyTransitions().last().first, HmiStateMachine::ViewLevel);
        QCOMPARE(provider->rootHierarchyTransitions().last().second, &sound->transition);
        QCOMPARE(popupCount(), popupsBefore + 1);
        QCOMPARE(provider->rootHierarchyPopupStates().last().first, HmiStateMachine::PopupLevel);
        QCOMPARE(provider->rootHierarchyPopupStates().last().second, &sound->popup);
    }

    void submodulesAreBuiltInTheOrderOfTheirRegistration()
    {
        QStringList order;
        for (const char* const name : {"C", "A", "B"})
            provider->registerHostedSubmodule(domain, submodule(name, &order));
        provider->registerSubmoduleHost(domain, host("SETTINGS"));
        QCOMPARE(order.filter(QStringLiteral(" in ")),
                 QStringList({QStringLiteral("C in SETTINGS"), QStringLiteral("A in SETTINGS"),
                              QStringLiteral("B in SETTINGS")}));
    }

    void aSubmoduleRegisteredTwiceIsBuiltOnceButListedAgain()
    {
        HmiSubmoduleHost* const settings = host("SETTINGS");
        FakeSubmodule* const sound = submodule("Sound");
        provider->registerSubmoduleHost(domain, settings);
        provider->registerHostedSubmodule(domain, sound);
        const int transitionsBefore = transitionCount();
        const int popupsBefore = popupCount();
        provider->registerHostedSubmodule(domain, sound);
        QCOMPARE(warnings(),
                 QStringList(QStringLiteral("Submodule creation skipped, \"SETTINGS\" already contains \"Sound\"")));
        QCOMPARE(settings->submoduleEntryActionModel()->rowCount(), 1);
        QCOMPARE(transitionCount(), transitionsBefore + 1);
        QCOMPARE(popupCount(), popupsBefore + 1);
    }

    void aLaterHostGetsAllSubmodulesToo()
    {
        FakeSubmodule* const sound = submodule("Sound");
        HmiSubmoduleHost* const first = host("FIRST");
        HmiSubmoduleHost* const second = host("SECOND");
        provider->registerHostedSubmodule(domain, sound);
        provider->registerSubmoduleHost(domain, first);
        provider->registerSubmoduleHost(domain, second);
        QCOMPARE(sound->ownCalls.filter(QStringLiteral(" in ")),
                 QStringList({QStringLiteral("Sound in FIRST"), QStringLiteral("Sound in SECOND")}));
        FakeSubmodule* const light = submodule("Light");
        provider->registerHostedSubmodule(domain, light);
        QCOMPARE(light->ownCalls.filter(QStringLiteral(" in ")), QStringList(QStringLiteral("Light in SECOND")));
    }

    void theMenusOfAllHostsAreSorted()
    {
        HmiSubmoduleHost* const settings = host("SETTINGS");
        HmiSubmoduleHost* const apps = host("APPS");
        provider->registerSubmoduleHost(domain, settings);
        provider->registerSubmoduleHost(domain + 1000, apps);
        for (const int hostDomain : {domain, domain + 1000}) {
            for (const int order : {2, 1}) {
                FakeSubmodule* const entry = submodule("Entry");
                entry->action.setOrder(order);
                provider->registerHostedSubmodule(hostDomain, entry);
            }
        }
        provider->sortHostedModuleEntryActions();
        for (const HmiSubmoduleHost* const sorted : {settings, apps}) {
            const auto* const menu = sorted->submoduleEntryActionModel();
            const auto orderAt = [menu](int row) {
                return menu->index(row)
                    .data(HmiGuiFramework::HmiActionModel::ActionRole)
                    .value<HmiGuiFramework::HmiAction*>()
                    ->order();
            };
            QCOMPARE(orderAt(0), 1);
            QCOMPARE(orderAt(1), 2);
        }
    }

    void nullIsIgnored()
    {
        HmiLayeredState state(QStringLiteral("S"));
        const int transitionsBefore = transitionCount();
        provider->registerHostedSubmodule(domain, nullptr);
        provider->registerSubmoduleHost(domain, host("SETTINGS"));
        provider->registerSubmoduleHost(domain, nullptr);
        FakeSubmodule* const sound = submodule("Sound");
        provider->registerHostedSubmodule(domain, sound); // the host is still there
        QCOMPARE(sound->ownCalls.first(), QStringLiteral("Sound in SETTINGS"));
        QCOMPARE(transitionCount(), transitionsBefore + 1);
        FakeFactory* const contacts = factory();
        provider->registerSubmoduleFactory(domain, nullptr);
        QVERIFY(!provider->requestSubmodule(domain, &state, QStringLiteral("one"), 1));
        provider->registerSubmoduleFactory(domain, contacts);
        provider->registerSubmoduleFactory(domain, nullptr);
        QVERIFY(provider->requestSubmodule(domain, &state, QStringLiteral("two"), 1));
        QCOMPARE(contacts->built.size(), 2);
    }
};

QTEST_MAIN(HmiSubmoduleProviderTest)
#include "tst_hmisubmoduleprovider.moc"

// SPDX-License-Identifier: MIT
#include "fakesubmodule.h"
#include "logcapture.h"

#include <QTest>

#include <optional>

using namespace HmiCore;
using HmiStateMachine::HmiLayeredState;

class HmiSubmoduleFactoryTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    HmiLayeredState phone{QStringLiteral("Phone.Layer")};

    QStringList debugLines() { return log->take(QStringLiteral("kest.hmicore"), QtDebugMsg); }
    QStringList warnings() { return log->take(QStringLiteral("kest.hmicore"), QtWarningMsg); }

private Q_SLOTS:
    void init() { log.emplace(QStringLiteral("kest.hmicore.debug=true")); }
    void cleanup() { log.reset(); }

    void aTargetIsAPlainValue()
    {
        const TargetState target(&phone, QStringLiteral("View"), 4);
        TargetState copy(target);
        QCOMPARE(copy.state, &phone);
        QCOMPARE(copy.viewName, QStringLiteral("View"));
        QCOMPARE(copy.domain, 4);
        copy = TargetState(nullptr, QString(), 0);
        QVERIFY(!copy.state);
        QCOMPARE(target.domain, 4);
    }

    void buildsWithoutAViewManager()
    {
        FakeFactory factory;
        factory.descriptor = QStringLiteral("contacts.json");
        factory.createSubmodule({&phone, QStringLiteral("PHONE.Contacts"), 4});
        QCOMPARE(factory.built, QStringList(QStringLiteral("Phone.Layer/PHONE.Contacts/4")));
        QCOMPARE(debugLines(), QStringList(QStringLiteral("\"Contacts\" Created in \"PHONE.Contacts\"")));
    }

    void loadsTheViewsUnderTheViewNameAndDomainBeforeBuilding()
    {
        const ViewLoading loading;
        FakeFactory factory;
        factory.descriptor = loading.path();
        QStringList loadedWhenBuilt;
        factory.whenBuilt = [&] { loadedWhenBuilt = loading.loaded(); };
        factory.createSubmodule({&phone, QStringLiteral("PHONE.Contacts"), 4});
        QCOMPARE(loadedWhenBuilt, QStringList(QStringLiteral("PHONE.Contacts.Main:4")));
    }

    void withoutADescriptorNothingIsLoaded()
    {
        const ViewLoading loading;
        FakeFactory factory;
        factory.createSubmodule({&phone, QStringLiteral("PHONE.Contacts"), 4});
        QCOMPARE(factory.built.size(), 1);
        QCOMPARE(loading.loaded(), QStringList());
    }

    void refusesARepeatedTargetOnlyWhenTheViewHasTheStatesName()
    {
        FakeFactory factory;
        const TargetState otherName(&phone, QStringLiteral("PHONE.Contacts"), 4);
        factory.createSubmodule(otherName);
        factory.createSubmodule(otherName);
        QCOMPARE(factory.built.size(), 2);
        const TargetState stateName(&phone, QStringLiteral("Phone.Layer"), 4);
        factory.createSubmodule(stateName);
        QCOMPARE(factory.built.size(), 3);
        debugLines();
        factory.createSubmodule(stateName);
        factory.createSubmodule(otherName); // the state's name is what counts
        QCOMPARE(factory.built.size(), 3);
        QCOMPARE(warnings(),
                 QStringList(
                     {QStringLiteral("Submodule creation skipped, \"Phone.Layer\" already contains \"Contacts\""),
                      QStringLiteral("Submodule creation skipped, \"PHONE.Contacts\" already contains \"Contacts\"")}));
        QCOMPARE(debugLines(), QStringList());
    }

    void theViewNameIsNotedAfterTheBuilding()
    {
        FakeFactory factory;
        const TargetState target(&phone, QStringLiteral("Phone.Layer"), 4);
        factory.whenBuilt = [&] { factory.createSubmodule(target); };
        factory.createSubmodule(target);
        QCOMPARE(factory.built.size(), 2);
    }
};

QTEST_MAIN(HmiSubmoduleFactoryTest)
#include "tst_hmisubmodulefactory.moc"

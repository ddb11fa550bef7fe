// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiCore/HmiManager>
#include <HmiCore/HmiModuleRootModel>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/StateMachine>

#include <QMetaMethod>
#include <QSignalSpy>
#include <QSortFilterProxyModel>
#include <QTest>

#include <optional>

using namespace HmiCore;
using HmiStateMachine::HmiState;
using HmiStateMachine::StateMachine;

class HmiManagerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    StateMachine machine; // the manager goes on pointing to its states
    QString noted;

private Q_SLOTS:
    void init() { log.emplace(QStringLiteral("kest.hmicore.debug=true")); }
    void cleanup() { log.reset(); }

    void aFreshManagerIsEmpty()
    {
        const HmiManager* const manager = HmiManager::instance();
        QCOMPARE(manager, HmiManager::instance());
        QCOMPARE(manager->parent(), QCoreApplication::instance());
        QCOMPARE(manager->viewDescriptorPath(), QString());
        QCOMPARE(manager->viewPrefix(), QString());
        QCOMPARE(manager->factoryDefaultHomeState(), QString());
        QVERIFY(!manager->modulesRootState());
        QVERIFY(!manager->sortedModulesModel());
        QVERIFY(manager->moduleModel());
        QCOMPARE(manager->moduleModel()->parent(), manager);
        QCOMPARE(manager->moduleModel()->rowCount(), 0);
        QCOMPARE(StateMachine::instance()->objectName(), QStringLiteral("State Machine"));
    }

    void keepsWhatItIsGiven()
    {
        HmiManager* const manager = HmiManager::instance();
        manager->setRootHierarchyViews(QStringLiteral("root.json"), QStringLiteral("ROOT"));
        QCOMPARE(manager->viewDescriptorPath(), QStringLiteral("root.json"));
        QCOMPARE(manager->viewPrefix(), QStringLiteral("ROOT"));
        manager->setFactoryDefaultHomeState(QStringLiteral("HOME"));
        QCOMPARE(manager->factoryDefaultHomeState(), QStringLiteral("HOME"));
        {
            QSortFilterProxyModel model;
            manager->setSortedModulesModel(&model);
            QCOMPARE(manager->sortedModulesModel(), &model);
            QVERIFY(!model.parent());
            manager->setSortedModulesModel(nullptr);
        }
        QVERIFY(!manager->sortedModulesModel());
    }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiManager::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(methods, QStringList({QStringLiteral("hmiSuspend()"),
                                       QStringLiteral("moduleRootStateActivated(HmiStateMachine::Identifier)"),
                                       QStringLiteral("blacklistedModuleRootStateEntered()"),
                                       QStringLiteral("rootStateActivated()"), QStringLiteral("hmiThemeSync()"),
                                       QStringLiteral("hmiPaletteChange(QString)"), QStringLiteral("hmiRetranslated()"),
                                       QStringLiteral("showHmiUI()"), QStringLiteral("masterResetBegin()"),
                                       QStringLiteral("masterResetEnd()"), QStringLiteral("reportMasterReset()"),
                                       QStringLiteral("stateMachineStopped()")}));
        QCOMPARE(meta.method(meta.indexOfSlot("reportMasterReset()")).access(), QMetaMethod::Public);
        QCOMPARE(meta.method(meta.indexOfSlot("stateMachineStopped()")).access(), QMetaMethod::Private);
        QCOMPARE(meta.propertyCount(), QObject::staticMetaObject.propertyCount());
        QCOMPARE(meta.enumeratorCount(), 0);
    }

    void identifiersCanBeReadAtRunTime()
    {
        QSignalSpy activated(HmiManager::instance(), &HmiManager::moduleRootStateActivated);
        Q_EMIT HmiManager::instance()->moduleRootStateActivated(QStringLiteral("RADIO"));
        QCOMPARE(activated.count(), 1);
        QCOMPARE(activated.first().first().toString(), QStringLiteral("RADIO"));
    }

    void identifiersPassThroughQueuedConnections()
    {
        connect(HmiManager::instance(), SIGNAL(moduleRootStateActivated(HmiStateMachine::Identifier)), this,
                SLOT(noteIdentifier(HmiStateMachine::Identifier)), Qt::QueuedConnection);
        Q_EMIT HmiManager::instance()->moduleRootStateActivated(QStringLiteral("RADIO"));
        QCoreApplication::sendPostedEvents(this);
        QCOMPARE(noted, QStringLiteral("RADIO"));
        disconnect(HmiManager::instance(), nullptr, this, nullptr);
    }

    void masterResetBeginsBeforeItEnds()
    {
        HmiManager* const manager = HmiManager::instance();
        QStringList order;
        QObject context;
        connect(manager, &HmiManager::masterResetEnd, &context, [&] { order += QStringLiteral("end"); });
        connect(manager, &HmiManager::masterResetBegin, &context, [&] { order += QStringLiteral("begin"); });
        connect(manager, &HmiManager::masterResetBegin, &context, [&] { order += QStringLiteral("begin too"); });
        manager->reportMasterReset();
        QCOMPARE(order, QStringList({QStringLiteral("begin"), QStringLiteral("begin too"), QStringLiteral("end")}));
    }

    void everyEntryIntoTheModulesRootStateIsAnnounced()
    {
        HmiManager* const manager = HmiManager::instance();
        auto* const first = new HmiState(QStringLiteral("First"), &machine);
        auto* const second = new HmiState(QStringLiteral("Second"), &machine);
        machine.setInitialState(first);
        QSignalSpy activated(manager, &HmiManager::rootStateActivated);
        manager->setModulesRootState(first);
        QCOMPARE(manager->modulesRootState(), first);
        machine.start();
        QTRY_VERIFY(first->active());
        QCOMPARE(activated.count(), 1);
        manager->setModulesRootState(second);
        machine.requestState(second);
        QTRY_VERIFY(second->active());
        QCOMPARE(activated.count(), 2);
        machine.requestState(first);
        QTRY_VERIFY(first->active());
        QCOMPARE(activated.count(), 2);
        machine.requestState(second);
        QTRY_VERIFY(second->active());
        QCOMPARE(activated.count(), 3);
    }

    void startsTheMachineAndTellsWhenItStops()
    {
        HmiManager* const manager = HmiManager::instance();
        StateMachine* const machine = StateMachine::instance();
        auto* const state = new HmiState(QStringLiteral("Only"), machine);
        machine->setInitialState(state);
        QSignalSpy started(machine, &QStateMachine::started);
        manager->start();
        QVERIFY(started.count() == 1 || started.wait());
        QSignalSpy stopped(machine, &QStateMachine::stopped);
        machine->stop();
        QVERIFY(stopped.count() == 1 || stopped.wait());
        QCOMPARE(log->take(QStringLiteral("kest.hmicore"), QtWarningMsg),
                 QStringList(QStringLiteral("The state machine has stopped.\n State machine error: \"\"")));
    }

    void aMachineThatStopsWithAnErrorIsReportedWithItsText()
    {
        StateMachine* const machine = StateMachine::instance();
        auto* const compound = new HmiState(QStringLiteral("Compound"), machine);
        new HmiState(QStringLiteral("Compound.Child"), compound); // no initial state: an error
        machine->setInitialState(compound);
        QSignalSpy stopped(machine, &QStateMachine::stopped);
        machine->start();
        QVERIFY(stopped.count() > 0 || stopped.wait());
        const QStringList lines = log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
        QCOMPARE(lines.size(), 1);
        QCOMPARE(lines.first(),
                 QStringLiteral("The state machine has stopped.\n State machine error: \"%1\"")
                     .arg(QString(machine->errorString()).replace(QLatin1Char('"'), QLatin1String("\\\""))));
        QVERIFY(!machine->errorString().isEmpty());
        log->take(QStringLiteral("default"), QtWarningMsg); // Qt's own line about the error
    }

    void aNullModulesRootStateGivesQtsWarning()
    {
        HmiManager* const manager = HmiManager::instance();
        HmiState state(QStringLiteral("State"));
        manager->setModulesRootState(&state);
        manager->setModulesRootState(nullptr);
        QVERIFY(!manager->modulesRootState());
        QStringList warnings;
        const QList<LogCapture::Record> records = log->records();
        for (const LogCapture::Record& record : records)
            warnings += record.message;
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.first().startsWith(QStringLiteral("QObject::connect")), qPrintable(warnings.first()));
        log->takeOne(QtWarningMsg, warnings.first());
    }

public Q_SLOTS:
    void noteIdentifier(const HmiStateMachine::Identifier& identifier) { noted = identifier; }
};

QTEST_GUILESS_MAIN(HmiManagerTest)
#include "tst_hmimanager.moc"

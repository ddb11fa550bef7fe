// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/controlpanel.h>
#include <HmiVehicle/vehicleservice.h>

#include <QAbstractItemModelTester>
#include <QImage>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

#include "journal.h"
#include "statesmodel.h"

#include <memory>
#include <optional>

using namespace HmiVehicle;

/// The panel as a person uses it: with the mouse, in its window.
class ControlPanelTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::unique_ptr<VehicleService> service;
    std::unique_ptr<ControlPanel> panel;
    QStringList keys;

    /// Items of delegates are not children of the window as objects.
    static QQuickItem* find(QQuickItem* root, const QString& name)
    {
        if (root->objectName() == name && root->isVisible())
            return root;
        const QList<QQuickItem*> children = root->childItems();
        for (QQuickItem* const child : children)
            if (QQuickItem* const found = find(child, name))
                return found;
        return nullptr;
    }

    QPoint middleOf(const QString& name) const
    {
        const QQuickItem* const found = find(panel->window()->contentItem(), name);
        return found ? found->mapToScene(QPointF(found->width() / 2, found->height() / 2)).toPoint() : QPoint(-1, -1);
    }

    void hold(const QString& name) { QTest::mousePress(panel->window(), Qt::LeftButton, {}, middleOf(name)); }
    void letGo(const QString& name) { QTest::mouseRelease(panel->window(), Qt::LeftButton, {}, middleOf(name)); }

    QStringList journal() const
    {
        auto* const model = qobject_cast<Journal*>(panel->journal());
        model->flush();
        QStringList texts;
        for (int row = 0; row < model->rowCount(); ++row)
            texts.append(model->index(row).data(Journal::TextRole).toString());
        return texts;
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        keys.clear();
        Vehicle::Options options;
        options.frozen = true; // keys are timed by advance() alone
        service = std::make_unique<VehicleService>(options);
        connect(service.get(), &VehicleService::keySent, this,
                [this](int key, int state) { keys.append(QStringLiteral("%1:%2").arg(key).arg(state)); });
        panel = std::make_unique<ControlPanel>(*service);
        QVERIFY(panel->show());
        QVERIFY(QTest::qWaitForWindowExposed(panel->window()));
    }
    void cleanup()
    {
        panel.reset();
        service.reset();
        log.reset();
    }

    void aClickIsAShortPress()
    {
        hold(QStringLiteral("key22"));
        QCOMPARE(keys, {QStringLiteral("22:0")});
        letGo(QStringLiteral("key22"));
        QCOMPARE(keys, QStringList({QStringLiteral("22:0"), QStringLiteral("22:2")}));
        QCOMPARE(journal(),
                 QStringList({QStringLiteral("key 22 pressed (Preset 1)"), QStringLiteral("key 22 short (Preset 1)")}));
    }

    void holdingIsALongPress()
    {
        hold(QStringLiteral("key89"));
        service->vehicle().advance(1000);
        letGo(QStringLiteral("key89"));
        QCOMPARE(keys, QStringList({QStringLiteral("89:0"), QStringLiteral("89:3"), QStringLiteral("89:4")}));
    }

    void everyKeyOfTheCatalogueIsOnThePanel()
    {
        for (const int key : {6,  7,  8,  9,  10, 12, 13, 15, 22, 23, 24, 25, 26, 27, 35, 41,
                              47, 48, 49, 50, 54, 55, 60, 77, 78, 79, 80, 83, 88, 89, 90, 91}) {
            keys.clear();
            const QString name = QStringLiteral("key%1").arg(key);
            hold(name);
            letGo(name);
            QVERIFY2(keys.startsWith(QStringLiteral("%1:0").arg(key)), qPrintable(name + keys.join(QLatin1Char(' '))));
        }
    }

    void leavingTheWindowLetsKeysUp()
    {
        hold(QStringLiteral("key10"));
        panel->releaseAll();
        QCOMPARE(keys.constLast(), QStringLiteral("10:2"));
        letGo(QStringLiteral("key10"));
        QCOMPARE(keys.size(), 2);
    }

    void closingThePanelLetsKeysUp()
    {
        hold(QStringLiteral("key8"));
        panel.reset();
        QCOMPARE(keys.constLast(), QStringLiteral("8:2"));
    }

    void turningADialSteps()
    {
        panel->turn(54, 2);
        QCOMPARE(keys, QStringList({QStringLiteral("54:0"), QStringLiteral("54:1"), QStringLiteral("54:2"),
                                    QStringLiteral("54:0"), QStringLiteral("54:1"), QStringLiteral("54:2")}));
    }

    void aSwitchSetsTheStateOfTheVehicle()
    {
        auto* const states = qobject_cast<StatesModel*>(panel->states());
        const QAbstractItemModelTester tester(states, QAbstractItemModelTester::FailureReportingMode::QtTest);
        const QString name = QStringLiteral("FMTunerSource.hdSignalLossStatus");
        const QModelIndexList found = states->match(states->index(0), StatesModel::NameRole, name);
        QCOMPARE(found.size(), 1);
        QCOMPARE(found.constFirst().data(StatesModel::ValueRole).toInt(), 0);
        const QQuickItem* const row = find(panel->window()->contentItem(), name);
        QVERIFY(row);
        QTest::mouseClick(panel->window(), Qt::LeftButton, {},
                          row->mapToScene(QPointF(row->width() - 19, 14)).toPoint());
        QCOMPARE(service->vehicle()
                     .state(QStringLiteral("FMTunerSource"))
                     .value(QLatin1String("hdSignalLossStatus"))
                     .toInt(),
                 1);
        QCOMPARE(found.constFirst().data(StatesModel::ValueRole).toInt(), 1);
        QVERIFY(!states->set(-1, 1));
        QVERIFY(!states->set(states->rowCount(), 1));
    }

    void everySwitchIsAStateThatTheVehicleHas()
    {
        auto* const states = qobject_cast<StatesModel*>(panel->states());
        QVERIFY(states->rowCount() > 20);
        for (int row = 0; row < states->rowCount(); ++row) {
            const int value = states->index(row).data(StatesModel::ValueRole).toInt();
            QVERIFY2(states->set(row, value), qPrintable(states->index(row).data(StatesModel::NameRole).toString()));
        }
    }

    void theVehiclesOwnChangesShow()
    {
        auto* const states = qobject_cast<StatesModel*>(panel->states());
        const QModelIndex ringing =
            states->match(states->index(0), StatesModel::NameRole, QStringLiteral("PhoneSource.incomingCall"))
                .constFirst();
        QCOMPARE(panel->actions().constFirst(), QStringLiteral("A friend calls"));
        panel->trigger(0);
        QCOMPARE(ringing.data(StatesModel::ValueRole).toInt(), 1);
    }

    void everyActionIsOneThatTheVehicleKnows()
    {
        QSignalSpy changes(service.get(), &VehicleService::stateChanged);
        panel->trigger(panel->actions().indexOf(QStringLiteral("Eject the disc")));
        QVERIFY(!changes.isEmpty());
        for (int action = 0; action < panel->actions().size(); ++action)
            panel->trigger(action);
        panel->trigger(-1);
        panel->trigger(1000);
    }

    void decisionsAreAskedForAndShown()
    {
        QVERIFY(!panel->decisionsWanted());
        QSignalSpy changes(panel.get(), &ControlPanel::decisionsWantedChanged);
        QTest::mouseClick(panel->window(), Qt::LeftButton, {}, middleOf(QStringLiteral("decisions")));
        QVERIFY(panel->decisionsWanted());
        QCOMPARE(changes.size(), 1);
        Q_EMIT service->decisionReported(QStringLiteral("key 6 state 0: <b>because</b>"));
        QCOMPARE(journal(), {QStringLiteral("key 6 state 0: <b>because</b>")});
    }

    void callsAreShownWithTheirArguments()
    {
        Q_EMIT service->called("{\"source\":\"FMTunerSource\",\"call\":\"tune\",\"args\":[\"98.5\",\"-1\"]}");
        Q_EMIT service->called("{\"source\":\"DeveloperSource\",\"call\":\"fenceReached\",\"args\":[1]}");
        QCOMPARE(journal(), {QStringLiteral("FMTunerSource.tune(\"98.5\", \"-1\")")});
    }

    void aFloodIsBounded()
    {
        auto* const model = qobject_cast<Journal*>(panel->journal());
        const QAbstractItemModelTester tester(model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        for (int i = 0; i < 100000; ++i) {
            model->add(Journal::Key, QString::number(i));
            if (i % 777 == 0)
                model->flush();
        }
        const QStringList texts = journal();
        QCOMPARE(texts.size(), Journal::maximumEntries);
        QCOMPARE(texts.constLast(), QStringLiteral("99999"));
        QCOMPARE(texts.constFirst(), QString::number(100000 - Journal::maximumEntries));
        model->add(Journal::Key, QString(100000, QLatin1Char('x')));
        QCOMPARE(journal().constLast().size(), Journal::longestText);
        model->clear();
        QCOMPARE(journal(), QStringList());
    }

    void aPictureCanBeTaken()
    {
        const QTemporaryDir folder;
        const QString file = folder.filePath(QStringLiteral("panel.png"));
        QVERIFY(panel->savePicture(file));
        QCOMPARE(QImage(file).size(), panel->window()->size());
        QVERIFY(!panel->savePicture(folder.filePath(QStringLiteral("missing/panel.png"))));
    }
};

QTEST_MAIN(ControlPanelTest)
#include "tst_controlpanel.moc"

// SPDX-License-Identifier: MIT
#include "fakemodule.h"
#include "logcapture.h"

#include <HmiCore/HmiModuleRootModel>

#include <QAbstractItemModelTester>
#include <QSignalSpy>
#include <QTest>

#include <optional>

using namespace HmiCore;

class HmiModuleRootModelTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;

    static QString rows(const HmiModuleRootModel& model)
    {
        QStringList names;
        for (int row = 0; row < model.rowCount(); ++row)
            names.append(model.index(row).data(HmiModuleRootModel::ModuleName).toString());
        return names.join(QLatin1Char(' '));
    }

    QStringList debugLines() { return log->take(QStringLiteral("kest.hmicore"), QtDebugMsg); }

private Q_SLOTS:
    void init() { log.emplace(QStringLiteral("kest.hmicore.debug=true")); }
    void cleanup() { log.reset(); }

    void everyRoleAnswersItsValue_data()
    {
        QTest::addColumn<int>("role");
        QTest::addColumn<QByteArray>("name");
        QTest::addColumn<QVariant>("value");
        QTest::newRow("module name") << 256 << QByteArray("moduleName") << QVariant(QStringLiteral("Phone"));
        QTest::newRow("module priority") << 257 << QByteArray("modulePriority") << QVariant(12);
        QTest::newRow("root view") << 258 << QByteArray("moduleRootView") << QVariant(QStringLiteral("Phone.Root"));
        QTest::newRow("icon") << 259 << QByteArray("iconUrl") << QVariant(QUrl(QStringLiteral("qrc:/phone.svg")));
        QTest::newRow("module id") << 260 << QByteArray("moduleId") << QVariant(QStringLiteral("PHONE"));
        QTest::newRow("domain") << 261 << QByteArray("moduleDomain") << QVariant(7);
        QTest::newRow("blocked") << 262 << QByteArray("moduleBlocked") << QVariant(true);
        QTest::newRow("below the roles") << 255 << QByteArray() << QVariant();
        QTest::newRow("above the roles") << 263 << QByteArray() << QVariant();
        QTest::newRow("text to show") << int(Qt::DisplayRole) << QByteArray("display") << QVariant();
    }

    void everyRoleAnswersItsValue()
    {
        QFETCH(int, role);
        FakeModule module(QStringLiteral("Phone"), 12, 7);
        module.icon = QUrl(QStringLiteral("qrc:/phone.svg"));
        module.setBlocked(true);
        HmiModuleRootModel model(nullptr);
        model.append(&module);
        QTEST(model.data(model.index(0), role), "value");
        QTEST(model.roleNames().value(role), "name");
        QVERIFY(!model.data(QModelIndex(), role).isValid());
    }

    void roleNamesAddToThoseOfTheBase()
    {
        const HmiModuleRootModel model(nullptr);
        QCOMPARE(model.roleNames().size(), model.QAbstractItemModel::roleNames().size() + 7);
    }

    void rowsKeepTheOrderOfAppending()
    {
        HmiModuleRootModel model(nullptr);
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        QSignalSpy inserted(&model, &QAbstractItemModel::rowsInserted);
        FakeModule phone(QStringLiteral("Phone"), 9);
        FakeModule radio(QStringLiteral("Radio"), 1);
        model.append(&phone);
        model.append(&radio);
        QCOMPARE(rows(model), QStringLiteral("Phone Radio"));
        QCOMPARE(inserted.count(), 2);
        QCOMPARE(inserted.at(1).at(1).toInt(), 1);
        QCOMPARE(inserted.at(1).at(2).toInt(), 1);
        QCOMPARE(model.rowCount(model.index(0)), 0);
        QCOMPARE(debugLines(), QStringList());
    }

    void aDisabledModuleShowsUpAtTheEndWhenItIsEnabled()
    {
        HmiModuleRootModel model(nullptr);
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        FakeModule phone(QStringLiteral("Phone"));
        FakeModule radio(QStringLiteral("Radio"));
        phone.setEnabled(false);
        model.append(&phone);
        QCOMPARE(model.rowCount(), 0);
        model.append(&radio);
        QSignalSpy inserted(&model, &QAbstractItemModel::rowsInserted);
        phone.setEnabled(true);
        QCOMPARE(rows(model), QStringLiteral("Radio Phone"));
        QCOMPARE(inserted.count(), 1);
        QCOMPARE(debugLines(), QStringList(QStringLiteral("Enabling: \"Phone\"")));
    }

    void disablingResetsTheModel()
    {
        HmiModuleRootModel model(nullptr);
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        FakeModule phone(QStringLiteral("Phone"));
        FakeModule radio(QStringLiteral("Radio"));
        model.append(&phone);
        model.append(&radio);
        QSignalSpy aboutToReset(&model, &QAbstractItemModel::modelAboutToBeReset);
        QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
        QSignalSpy removed(&model, &QAbstractItemModel::rowsRemoved);
        phone.setEnabled(false);
        QCOMPARE(rows(model), QStringLiteral("Radio"));
        QCOMPARE(aboutToReset.count(), 1);
        QCOMPARE(reset.count(), 1);
        QCOMPARE(removed.count(), 0);
        QCOMPARE(debugLines(), QStringList(QStringLiteral("Disabling: \"Phone\"")));
        phone.setEnabled(true);
        QCOMPARE(rows(model), QStringLiteral("Radio Phone"));
    }

    void anUnchangedStateChangesNothing()
    {
        HmiModuleRootModel model(nullptr);
        FakeModule phone(QStringLiteral("Phone"));
        model.append(&phone);
        QSignalSpy inserted(&model, &QAbstractItemModel::rowsInserted);
        QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
        phone.setEnabled(true);
        Q_EMIT phone.enabledChanged(true); // shown already
        phone.setEnabled(false);
        Q_EMIT phone.enabledChanged(false); // hidden already
        QCOMPARE(inserted.count(), 0);
        QCOMPARE(reset.count(), 1);
        QCOMPARE(debugLines(), QStringList(QStringLiteral("Disabling: \"Phone\"")));
    }

    void aModuleAppendedTwiceIsShownTwiceAndGoesAtOnce()
    {
        HmiModuleRootModel model(nullptr);
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        FakeModule phone(QStringLiteral("Phone"));
        FakeModule radio(QStringLiteral("Radio"));
        model.append(&phone);
        model.append(&radio);
        model.append(&phone);
        QCOMPARE(rows(model), QStringLiteral("Phone Radio Phone"));
        QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
        phone.setEnabled(false);
        QCOMPARE(rows(model), QStringLiteral("Radio"));
        QCOMPARE(reset.count(), 1);
        phone.setEnabled(true);
        QCOMPARE(rows(model), QStringLiteral("Radio Phone"));
    }

    void changesOfAShownModuleAreAnnouncedWithTheirRole_data()
    {
        QTest::addColumn<bool>("icon");
        QTest::addColumn<int>("role");
        QTest::newRow("icon") << true << 259;
        QTest::newRow("blocked") << false << 262;
    }

    void changesOfAShownModuleAreAnnouncedWithTheirRole()
    {
        QFETCH(bool, icon);
        QFETCH(int, role);
        HmiModuleRootModel model(nullptr);
        FakeModule phone(QStringLiteral("Phone"));
        FakeModule radio(QStringLiteral("Radio"));
        model.append(&phone);
        model.append(&radio);
        const auto change = [icon, &radio] {
            if (icon)
                radio.setIconUrl(QUrl(QStringLiteral("qrc:/radio.svg")));
            else
                radio.setBlocked(!radio.blocked());
        };
        QSignalSpy changed(&model, &QAbstractItemModel::dataChanged);
        change();
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.first().at(0).toModelIndex(), model.index(1));
        QCOMPARE(changed.first().at(1).toModelIndex(), model.index(1));
        QCOMPARE(changed.first().at(2).value<QVector<int>>(), QVector<int>({role}));
        radio.setEnabled(false);
        change();
        QCOMPARE(changed.count(), 1);
    }

    void containsOnlyShownModules()
    {
        HmiModuleRootModel model(nullptr);
        FakeModule phone(QStringLiteral("Phone"), 0, 7);
        model.append(&phone);
        QVERIFY(model.containsModule(7));
        QVERIFY(!model.containsModule(8));
        phone.setEnabled(false);
        QVERIFY(!model.containsModule(7));
        bool contained = true;
        QVERIFY(QMetaObject::invokeMethod(&model, "containsModule", Q_RETURN_ARG(bool, contained), Q_ARG(int, 7)));
        QVERIFY(!contained);
        const QMetaObject& meta = HmiModuleRootModel::staticMetaObject;
        QCOMPARE(meta.method(meta.indexOfMethod("containsModule(int)")).parameterNames(),
                 QList<QByteArray>({"domain"}));
    }

    void findsTheIndexOfAShownModuleOnly()
    {
        HmiModuleRootModel model(nullptr);
        FakeModule phone(QStringLiteral("Phone"));
        FakeModule radio(QStringLiteral("Radio"));
        FakeModule hidden(QStringLiteral("Hidden"));
        hidden.setEnabled(false);
        for (FakeModule* const module : {&phone, &radio, &hidden})
            model.append(module);
        QCOMPARE(model.indexOf(&radio), model.index(1));
        QVERIFY(!model.indexOf(&hidden).isValid());
        QVERIFY(!model.indexOf(this).isValid());
        QVERIFY(!model.indexOf(nullptr).isValid());
    }

    void nullIsIgnored()
    {
        HmiModuleRootModel model(nullptr);
        model.append(nullptr);
        QCOMPARE(model.rowCount(), 0);
    }

    void doesNotOwnTheModules()
    {
        FakeModule phone(QStringLiteral("Phone"));
        {
            HmiModuleRootModel model(nullptr);
            model.append(&phone);
        }
        phone.setEnabled(false); // nobody listens any more
        QCOMPARE(phone.moduleName(), QStringLiteral("Phone"));
        QCOMPARE(debugLines(), QStringList());
    }
};

QTEST_GUILESS_MAIN(HmiModuleRootModelTest)
#include "tst_hmimodulerootmodel.moc"

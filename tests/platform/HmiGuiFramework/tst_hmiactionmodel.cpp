// SPDX-License-Identifier: MIT
#include <HmiGuiFramework/HmiActionModel>

#include <QAbstractItemModelTester>
#include <QSignalSpy>
#include <QTest>

#include <memory>

using HmiGuiFramework::HmiAction;
using HmiGuiFramework::HmiActionModel;

class HmiActionModelTest : public QObject
{
    Q_OBJECT

    static std::unique_ptr<HmiAction> action(const char* text, int order = 0)
    {
        auto made = std::make_unique<HmiAction>();
        made->setText(QString::fromLatin1(text));
        made->setOrder(order);
        return made;
    }

    static QString texts(const HmiActionModel& model)
    {
        QStringList all;
        for (int row = 0; row < model.rowCount(); ++row)
            all.append(model.index(row).data(HmiActionModel::TextRole).toString());
        return all.join(QLatin1Char(' '));
    }

private Q_SLOTS:
    void listsActionsInTheOrderOfAdding()
    {
        HmiActionModel model(nullptr);
        const QAbstractItemModelTester tester(&model);
        const auto a = action("a", 2);
        const auto b = action("b", 1);
        model.addChild(a.get());
        model.addChild(b.get());
        model.addChild(nullptr);
        model.addChild(a.get());
        QCOMPARE(texts(model), QStringLiteral("a b"));
        QCOMPARE(model.count(), 2);
    }

    void sortsByOrderAndKeepsPlacesAmongEquals()
    {
        HmiActionModel model(nullptr);
        const QAbstractItemModelTester tester(&model);
        const auto a = action("a", 5);
        const auto b = action("b", -1);
        const auto c = action("c", 5);
        const auto d = action("d", 0);
        for (const auto* entry : {&a, &b, &c, &d})
            model.addChild(entry->get());
        model.sortActions();
        QCOMPARE(texts(model), QStringLiteral("b d a c"));
    }

    void rolesGiveTheActionsProperties()
    {
        HmiActionModel model(nullptr);
        const auto a = action("a");
        a->setIcon(QStringLiteral("home"));
        a->setEnabled(false);
        model.addChild(a.get());
        const QModelIndex index = model.index(0);
        QCOMPARE(index.data(HmiActionModel::ActionRole).value<HmiAction*>(), a.get());
        QCOMPARE(index.data(HmiActionModel::IconRole).toString(), QStringLiteral("home"));
        QCOMPARE(index.data(HmiActionModel::EnabledRole).toBool(), false);
        QCOMPARE(index.data(Qt::DisplayRole).toString(), QStringLiteral("a"));
        QVERIFY(!index.data(Qt::DecorationRole).isValid());
        QVERIFY(!model.data(QModelIndex(), HmiActionModel::TextRole).isValid());
        QCOMPARE(model.roleNames().value(HmiActionModel::EnabledRole), QByteArray("actionEnabled"));
    }

    void changesOfAnActionAreAnnouncedForItsRow()
    {
        HmiActionModel model(nullptr);
        const auto a = action("a");
        const auto b = action("b");
        model.addChild(a.get());
        model.addChild(b.get());
        QSignalSpy changed(&model, &QAbstractItemModel::dataChanged);
        b->setText(QStringLiteral("c"));
        b->setText(QStringLiteral("c"));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.at(0).at(0).toModelIndex().row(), 1);
        QVERIFY(changed.at(0).at(2).value<QVector<int>>().contains(HmiActionModel::TextRole));
    }

    void aDeletedActionLeavesTheList()
    {
        HmiActionModel model(nullptr);
        const QAbstractItemModelTester tester(&model);
        auto a = action("a");
        const auto b = action("b");
        model.addChild(a.get());
        model.addChild(b.get());
        a.reset();
        QCOMPARE(texts(model), QStringLiteral("b"));
    }

    void aRowHasNoDataWhileItsDeletedActionLeaves()
    {
        HmiActionModel model(nullptr);
        auto a = action("a");
        model.addChild(a.get());
        bool asked = false;
        connect(&model, &QAbstractItemModel::rowsAboutToBeRemoved, this, [&] {
            asked = true;
            for (const int role : {int(HmiActionModel::ActionRole), int(HmiActionModel::TextRole)})
                QVERIFY(!model.index(0).data(role).isValid());
            model.trigger(0);
        });
        a.reset();
        QVERIFY(asked);
    }

    void triggerReachesEnabledActionsOnly()
    {
        HmiActionModel model(nullptr);
        const auto a = action("a");
        model.addChild(a.get());
        QSignalSpy triggered(a.get(), &HmiAction::triggered);
        model.trigger(0);
        model.trigger(-1);
        model.trigger(1);
        a->setEnabled(false);
        model.trigger(0);
        QCOMPARE(triggered.count(), 1);
    }
};

QTEST_GUILESS_MAIN(HmiActionModelTest)
#include "tst_hmiactionmodel.moc"

// SPDX-License-Identifier: MIT
#include "fakemodule.h"
#include "logcapture.h"

#include <HmiCore/HmiMenuProxyModel>
#include <HmiCore/HmiModuleRootModel>

#include <QAbstractItemModelTester>
#include <QSignalSpy>
#include <QTest>

#include <optional>

using namespace HmiCore;

namespace {

/// Shows another name for one domain and keeps what it is asked.
class RenamingProxy : public HmiMenuProxyModel
{
public:
    using HmiMenuProxyModel::HmiMenuProxyModel;

    QVariant proxyData(const QModelIndex& index, int role, int domain) const override
    {
        asked.append(QStringLiteral("%1:%2:%3").arg(index.row()).arg(role).arg(domain));
        return role == HmiModuleRootModel::ModuleName && domain == 7 ? QVariant(shownName) : QVariant();
    }

    QString shownName = QStringLiteral("Telephone");
    mutable QStringList asked;
};

/// A model with three modules of priorities 30, 10 and 20 below a proxy that is set up like the menu.
struct Menu
{
    explicit Menu(HmiMenuProxyModel* menuModel)
        : proxy(menuModel)
    {
        proxy->setSourceModel(&model);
        proxy->setSortRole(HmiModuleRootModel::ModulePriority);
        proxy->setDynamicSortFilter(true);
        proxy->sort(0, Qt::AscendingOrder);
        for (FakeModule* const module : {&phone, &radio, &media})
            model.append(module);
    }

    QString rows() const
    {
        QStringList names;
        for (int row = 0; row < proxy->rowCount(); ++row)
            names.append(proxy->index(row, 0).data(HmiModuleRootModel::ModuleName).toString());
        return names.join(QLatin1Char(' '));
    }

    FakeModule phone{QStringLiteral("Phone"), 30, 7};
    FakeModule radio{QStringLiteral("Radio"), 10, 8};
    FakeModule media{QStringLiteral("Media"), 20, 9};
    HmiModuleRootModel model{nullptr};
    std::unique_ptr<HmiMenuProxyModel> proxy;
};

} // namespace

class HmiMenuProxyModelTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;

private Q_SLOTS:
    void init() { log.emplace(); }
    void cleanup() { log.reset(); }

    void theBaseClassShowsWhatTheSourceShows()
    {
        const Menu menu(new HmiMenuProxyModel(nullptr));
        for (int row = 0; row < 3; ++row) {
            const QModelIndex index = menu.proxy->index(row, 0);
            for (int role = 255; role <= 263; ++role)
                QCOMPARE(menu.proxy->data(index, role), menu.model.data(menu.proxy->mapToSource(index), role));
        }
        QCOMPARE(menu.proxy->roleNames(), menu.model.roleNames());
        QVERIFY(!menu.proxy->proxyData(menu.proxy->index(0, 0), 256, 7).isValid());
    }

    void sortsByPriorityAndKeepsTheOrder()
    {
        Menu menu(new HmiMenuProxyModel(nullptr));
        const QAbstractItemModelTester tester(menu.proxy.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
        QCOMPARE(menu.rows(), QStringLiteral("Radio Media Phone"));
        menu.radio.setEnabled(false);
        QCOMPARE(menu.rows(), QStringLiteral("Media Phone"));
        menu.radio.setEnabled(true); // last in the source
        QCOMPARE(menu.rows(), QStringLiteral("Radio Media Phone"));
    }

    void aSubclassChangesOneRoleOfOneModule()
    {
        const Menu menu(new RenamingProxy(nullptr));
        QCOMPARE(menu.rows(), QStringLiteral("Radio Media Telephone"));
        QCOMPARE(menu.proxy->index(2, 0).data(HmiModuleRootModel::ModuleId).toString(), QStringLiteral("PHONE"));
    }

    void theHookIsAskedForEveryRoleWithTheDomain()
    {
        auto* const proxy = new RenamingProxy(nullptr);
        const Menu menu(proxy);
        proxy->asked.clear();
        const QModelIndex phone = proxy->index(2, 0);
        QCOMPARE(proxy->data(phone, HmiModuleRootModel::ModuleDomain), QVariant(7));
        QVERIFY(!proxy->data(phone, 263).isValid());
        QVERIFY(!proxy->data(QModelIndex(), 256).isValid());
        QCOMPARE(proxy->asked,
                 QStringList({QStringLiteral("2:261:7"), QStringLiteral("2:263:7"), QStringLiteral("-1:256:0")}));
    }

    void theDomainOfAnIndexIsTheSources()
    {
        const Menu menu(new RenamingProxy(nullptr));
        QCOMPARE(menu.proxy->domainForIndex(menu.proxy->index(0, 0)), 8);
        QCOMPARE(menu.proxy->domainForIndex(menu.proxy->index(2, 0)), 7);
        QCOMPARE(menu.proxy->domainForIndex(QModelIndex()), 0);
    }

    void resetMakesViewsReadAgain()
    {
        auto* const proxy = new RenamingProxy(nullptr);
        const Menu menu(proxy);
        const QAbstractItemModelTester tester(proxy, QAbstractItemModelTester::FailureReportingMode::QtTest);
        QStringList signalled;
        connect(proxy, &QAbstractItemModel::modelAboutToBeReset, this, [&] { signalled += QStringLiteral("begin"); });
        connect(proxy, &QAbstractItemModel::modelReset, this, [&] { signalled += QStringLiteral("end"); });
        proxy->shownName = QStringLiteral("Calls");
        QVERIFY(QMetaObject::invokeMethod(proxy, "reset"));
        QCOMPARE(signalled, QStringList({QStringLiteral("begin"), QStringLiteral("end")}));
        QCOMPARE(menu.rows(), QStringLiteral("Radio Media Calls"));
    }
};

QTEST_GUILESS_MAIN(HmiMenuProxyModelTest)
#include "tst_hmimenuproxymodel.moc"

// SPDX-License-Identifier: MIT
// Registering modules under the sorted menu, against sorting and inserting them once.
#include "table.h"

#include <HmiCore/HmiMenuProxyModel>
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/HmiModuleRootModel>

#include <QCoreApplication>
#include <QElapsedTimer>

#include <memory>
#include <random>

using namespace HmiCore;

namespace {

class Module : public HmiModuleIntegration
{
public:
    Module(int number, int priority)
        : HmiModuleIntegration(RootModule, nullptr)
        , m_number(number)
        , m_priority(priority)
    {
    }
    QString moduleName() const override { return QString::number(m_number); }
    int modulePriority() const override { return m_priority; }
    int moduleDomain() const override { return m_number; }
    QString viewDescriptorFile() const override { return {}; }
    HmiStateMachine::Identifier rootStateIdentifier() const override { return moduleName(); }
    HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState*) override { return nullptr; }
    void setupRootContext(QQmlContext*) override {}

private:
    const int m_number;
    const int m_priority;
};

using Modules = std::vector<std::unique_ptr<Module>>;

Modules modules(int count)
{
    std::mt19937 random(7);
    Modules made;
    for (int i = 0; i < count; ++i)
        made.push_back(std::make_unique<Module>(i, int(random() % 100000)));
    return made;
}

void setUp(HmiMenuProxyModel& menu, HmiModuleRootModel& model)
{
    menu.setSourceModel(&model);
    menu.setSortRole(HmiModuleRootModel::ModulePriority);
    menu.setDynamicSortFilter(true);
    menu.sort(0, Qt::AscendingOrder);
}

/// As at start-up: the menu is there first, then the modules come one by one.
double registering(int count)
{
    const Modules all = modules(count);
    HmiModuleRootModel model(nullptr);
    HmiMenuProxyModel menu(nullptr);
    setUp(menu, model);
    menu.rowCount(); // as a view does: the proxy maps from here on
    QElapsedTimer timer;
    timer.start();
    for (const auto& module : all)
        model.append(module.get());
    const double elapsed = double(timer.nsecsElapsed()) / 1000;
    if (menu.rowCount() != count)
        qFatal("%d rows", menu.rowCount());
    return elapsed;
}

/// The modules come without a menu; then it is sorted once.
double insertingAndSortingOnce(int count)
{
    const Modules all = modules(count);
    HmiModuleRootModel model(nullptr);
    HmiMenuProxyModel menu(nullptr);
    QElapsedTimer timer;
    timer.start();
    for (const auto& module : all)
        model.append(module.get());
    setUp(menu, model);
    const int rows = menu.rowCount();
    const double elapsed = double(timer.nsecsElapsed()) / 1000;
    if (rows != count)
        qFatal("%d rows", rows);
    return elapsed;
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication app(argc, argv);
    for (const int count : {200, 1000}) {
        std::vector<double> ours;
        std::vector<double> limit;
        for (int run = 0; run < 51; ++run) {
            ours.push_back(registering(count));
            limit.push_back(insertingAndSortingOnce(count));
        }
        char operation[80];
        std::snprintf(operation, sizeof operation, "%d modules under the sorted menu / one sort and insertion", count);
        Table::row(operation, ours, limit, 2);
    }
}

// SPDX-License-Identifier: MIT
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiManager>
#include <HmiCore/hmicore.h>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QSortFilterProxyModel>

#include <cstdio>

namespace {

class Initializer : public HmiCore::HmiInitializer
{
public:
    void initializeSources() override {}
    void connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>&) override {}
    void completeInitialization() override { complete = true; }
    void buildTopStateTree() override
    {
        root = new HmiStateMachine::HmiState(QStringLiteral("Modules"), HmiStateMachine::StateMachine::instance());
    }
    HmiStateMachine::HmiState* modulesRootState() override { return root; }
    QString rootHierarchyViewDescriptorPath() override { return {}; }
    QString rootHierarchyViewPrefix() override { return {}; }

    HmiStateMachine::HmiState* root = nullptr;
    bool complete = false;
};

} // namespace

int main(int argc, char** argv)
{
    HmiCore::HmiApplication app(argc, argv);
    Initializer initializer;
    app.initialize(&initializer);
    const HmiCore::HmiManager* const manager = HmiCore::HmiManager::instance();
    const bool menuFilled = manager->sortedModulesModel()->rowCount() == 1;
    const bool engineRegistered = app.property("consumerEngine").toBool();
    std::printf("%s: home %s, menu %s, engine %s\n", HmiCore::hmicore().categoryName(),
                qPrintable(manager->factoryDefaultHomeState()), menuFilled ? "filled" : "empty",
                engineRegistered ? "registered" : "missing");
    const bool home = manager->factoryDefaultHomeState() == QStringLiteral("CONSUMER.Main");
    return initializer.complete && home && menuFilled && engineRegistered ? 0 : 1;
}

// SPDX-License-Identifier: MIT
#pragma once

#include "topstatetree.h"

#include <HmiCore/HmiInitializer>

#include <memory>

class DrivingLock;
class FocusControl;
class InputPanel;
class Language;
class Market;
class PaletteControl;

/// \brief What makes the core this head unit: sources, top state tree, launcher, and what QML sees of them.
class ProductInitializer : public HmiCore::HmiInitializer
{
public:
    explicit ProductInitializer(bool night);
    ~ProductInitializer() override;

    void initializeSources() override;
    void registerQmlTypes() override;
    void postInit(HmiCore::HmiManager* manager) override;
    void exportObjects(QQmlContext* rootContext) override;
    void
    connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>& states) override;
    void completeInitialization() override;
    void buildTopStateTree() override;
    HmiStateMachine::HmiState* modulesRootState() override;
    QString rootHierarchyViewDescriptorPath() override;
    QString rootHierarchyViewPrefix() override;

private:
    InputPanel* makeInputPanel() const;
    void watchTransients() const;

    const bool m_night;
    QQmlContext* m_rootContext = nullptr;
    PaletteControl* m_paletteControl = nullptr;
    DrivingLock* m_drivingLock = nullptr;
    FocusControl* m_focusControl = nullptr;
    Market* m_market = nullptr;
    Language* m_language = nullptr;
    std::unique_ptr<TopStateTree> m_states;
};

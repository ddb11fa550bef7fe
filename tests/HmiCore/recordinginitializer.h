// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiInitializer>
#include <HmiCore/HmiManager>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QDebug>

/// Builds a state tree with one state for modules and logs which hook ran.
class RecordingInitializer : public HmiCore::HmiInitializer
{
public:
    explicit RecordingInitializer(const QString& descriptorPath = QString(), const QString& viewPrefix = QString())
        : descriptor(descriptorPath)
        , prefix(viewPrefix)
    {
    }

    void initializeSources() override { qDebug("initializeSources"); }
    void connectTransitions(const QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>>& transitions) override
    {
        qDebug() << "connectTransitions" << transitions.size();
        HmiInitializer::connectTransitions(transitions);
    }
    void connectPopupStates(
        const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>& popupStates) override
    {
        qDebug() << "connectPopupStates" << popupStates.size();
    }
    void postInit(HmiCore::HmiManager*) override { qDebug("postInit"); }
    void completeInitialization() override { qDebug("completeInitialization"); }
    void buildTopStateTree() override
    {
        auto* const machine = HmiStateMachine::StateMachine::instance();
        root = new HmiStateMachine::HmiState(QStringLiteral("Modules"), machine);
        machine->setInitialState(root);
        start = new HmiStateMachine::HmiState(QStringLiteral("Start"), root);
        root->setInitialState(start);
    }
    HmiStateMachine::HmiState* modulesRootState() override { return root; }
    QString rootHierarchyViewDescriptorPath() override { return descriptor; }
    QString rootHierarchyViewPrefix() override { return prefix; }

    HmiStateMachine::HmiState* root = nullptr;
    HmiStateMachine::HmiState* start = nullptr;
    const QString descriptor;
    const QString prefix;
};

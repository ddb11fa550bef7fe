// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHostedSubmodule>
#include <HmiCore/HmiSubmoduleFactory>
#include <HmiCore/HmiSubmoduleHost>
#include <HmiCore/TargetState>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/HmiAction>
#include <HmiGuiFramework/TransitionManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/KeySignalTransition>
#include <HmiStateMachine/PopupState>

#include <QFile>
#include <QQmlEngine>
#include <QTemporaryDir>

#include <functional>

/// A factory that records where it built.
class FakeFactory : public HmiCore::HmiSubmoduleFactory
{
    Q_OBJECT

public:
    QString submoduleName() const override { return QStringLiteral("Contacts"); }
    QString viewDescriptorFile() const override { return descriptor; }
    void create(const HmiCore::TargetState& target) override
    {
        built += QStringLiteral("%1/%2/%3").arg(target.state->name(), target.viewName).arg(target.domain);
        if (whenBuilt && built.size() == 1)
            whenBuilt();
    }

    QString descriptor;
    QStringList built;
    std::function<void()> whenBuilt; ///< called the first time only
};

/// A hosted submodule that records where it was built and has one transition and one popup state.
class FakeSubmodule : public HmiCore::HmiHostedSubmodule
{
    Q_OBJECT

public:
    explicit FakeSubmodule(const QString& submoduleName, QStringList* order = nullptr)
        : name(submoduleName)
        , calls(order ? order : &ownCalls)
    {
    }

    QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> createRootHierarchyTransitions() override
    {
        *calls += name + QStringLiteral(" transitions");
        return {{HmiStateMachine::ViewLevel, &transition}};
    }
    QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>> createRootHierarchyPopupStates() override
    {
        *calls += name + QStringLiteral(" popup states");
        return {{HmiStateMachine::PopupLevel, &popup}};
    }
    HmiGuiFramework::HmiAction* entryAction() override
    {
        *calls += name + QStringLiteral(" entry action");
        return &action;
    }
    QString moduleId() const override { return name.toUpper(); }
    QString submoduleName() const override { return name; }
    QString viewDescriptorFile() const override { return descriptor; }
    void create(HmiStateMachine::HmiState* hostState) override
    {
        *calls += name + QStringLiteral(" in ") + hostState->name();
    }

    const QString name;
    QString descriptor;
    QStringList ownCalls;
    QStringList* const calls;
    HmiGuiFramework::HmiAction action;
    HmiStateMachine::KeySignalTransition transition{QStringLiteral("Open")};
    HmiStateMachine::PopupState popup{QStringLiteral("Popup")};
};

/// A view manager in the data store, and a descriptor with one view for it to load.
class ViewLoading
{
public:
    ViewLoading()
    {
        write(QStringLiteral("Main.qml"), "import QtQuick 2.0\nItem {}\n");
        write(QStringLiteral("views.json"),
              "{ \"version\": 1, \"views\": [ { \"name\": \"Main\", \"url\": \"Main.qml\" } ] }");
        HmiGuiFramework::DataStore::store(&viewManager, QStringLiteral("ViewManager"));
    }
    ~ViewLoading() { HmiGuiFramework::DataStore::store(nullptr, QStringLiteral("ViewManager")); }

    QString path() const { return directory.filePath(QStringLiteral("views.json")); }

    /// What was loaded, as "identifier:domain".
    QStringList loaded() const
    {
        QStringList views;
        const auto descriptor = viewManager.guiDescriptor();
        for (const HmiGuiFramework::ViewDescriptor& view : descriptor.views)
            views += QStringLiteral("%1:%2").arg(view.identifier).arg(view.domain);
        views.sort();
        return views;
    }

private:
    void write(const QString& name, const QByteArray& content)
    {
        QFile file(directory.filePath(name));
        if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
            qFatal("cannot write %s", qPrintable(file.fileName()));
    }

    QTemporaryDir directory;
    QQmlEngine engine;
    HmiGuiFramework::TransitionManager transitions{&engine, nullptr};
    HmiGuiFramework::ViewManager viewManager{&engine, &transitions, nullptr};
};

// SPDX-License-Identifier: MIT
#pragma once

#include "logcapture.h"

#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/TransitionManager>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

#include <memory>

/// The framework's objects over a small state tree, as the core sets them up: views M.Home and the layered M.Module with
/// M.Main, M.List and M.Edit; popups M.Call, M.Note and M.Short in one region, M.OtherNote in another.
struct GuiFixture
{
    using Machine = HmiStateMachine::StateMachine;

    LogCapture log;
    QQmlEngine engine;
    HmiGuiFramework::TransitionManager transitions{&engine, nullptr};
    HmiGuiFramework::ViewManager views{&engine, &transitions, nullptr};
    Machine* machine = Machine::instance();
    HmiStateMachine::HmiState* home;
    HmiStateMachine::HmiLayeredState* module;
    QState* noPopup;

    GuiFixture()
    {
        using namespace HmiStateMachine;
        auto* const root = new NamedState(QStringLiteral("Root"), QState::ParallelStates, machine);
        machine->setInitialState(root);
        auto* const viewStates = new HmiState(QStringLiteral("Views"), root);
        home = new HmiState(QStringLiteral("M.Home"), viewStates);
        viewStates->setInitialState(home);
        module = new HmiLayeredState(QStringLiteral("M.Module"), viewStates);
        module->setInitialState(new HmiState(QStringLiteral("M.Main"), module));
        for (const char* const name : {"M.List", "M.Edit", "M.Broken", "M.NotAnItem", "M.Bare"})
            new HmiState(QString::fromLatin1(name), module);
        auto* const popups = new QState(root);
        noPopup = new QState(popups);
        popups->setInitialState(noPopup);
        for (const char* const name : {"M.Call", "M.Note", "M.Short", "M.BrokenPopup"})
            new PopupState(QString::fromLatin1(name), popups);
        auto* const otherPopups = new QState(root);
        otherPopups->setInitialState(new QState(otherPopups));
        new PopupState(QStringLiteral("M.OtherNote"), otherPopups);
        transitions.setDuration(0);
        views.stage()->setSize(QSizeF(400, 300));
        HmiGuiFramework::DataStore::store(&views, QStringLiteral("ViewManager"));
        views.loadModule(QStringLiteral(":/gui/data/views.json"), QStringLiteral("M"), 7);
    }

    ~GuiFixture()
    {
        HmiGuiFramework::AppSettings::instance()->setUiVariation(QString());
        HmiGuiFramework::AppSettings::instance()->setRightToLeft(false);
        HmiGuiFramework::AppSettings::instance()->setViewCacheSize(5);
        delete machine;
    }

    bool start()
    {
        machine->start();
        return shows("M.Home");
    }

    bool shows(const char* view)
    {
        const QString name = QString::fromLatin1(view);
        return QTest::qWaitFor([&] { return views.currentView() == name && !transitions.isRunning(); });
    }

    bool go(const char* view) { return views.requestView(QString::fromLatin1(view)) && shows(view); }

    bool isActive(const char* state) const
    {
        const auto* const found = machine->findState(QString::fromLatin1(state));
        return found && found->active();
    }

    bool becomesActive(const char* state)
    {
        return QTest::qWaitFor([&] { return isActive(state); });
    }

    /// The one warning of the framework so far is this text.
    bool warned(const char* text) { return log.takeOne(QtWarningMsg, QString::fromUtf8(text)); }
};

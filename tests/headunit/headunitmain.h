// SPDX-License-Identifier: MIT
#pragma once

#include "productinitializer.h"
#include "settings.h"

#include <AL2HMIBridge/BridgeEndpoint>
#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiManager>
#include <HmiGuiFramework/AppSettings>

#include <QTest>

#include <utility>

/// The head unit as it is, in the test's process, with what \a connector connects it to. Runs the tests of \a Test.
template <typename Test>
int runInHeadUnit(int argc, char** argv, AL2HMIBridge::BridgeEndpoint::Connector connector)
{
    AL2HMIBridge::BridgeEndpoint::setConnector(std::move(connector));
    HmiCore::HmiApplication application(argc, argv);
    applySettings(QSize(1280, 720));
    HmiGuiFramework::AppSettings::instance()->setAnimations(false);
    ProductInitializer initializer(false);
    application.initialize(&initializer);
    application.startHmi();
    Q_EMIT HmiCore::HmiManager::instance()->showHmiUI();
    Test test;
    return QTest::qExec(&test, argc, argv);
}

/// As above, without a vehicle: BridgeTester plays that.
template <typename Test>
int runInHeadUnit(int argc, char** argv)
{
    return runInHeadUnit<Test>(argc, argv, [](AL2HMIBridge::BridgeEndpoint::Channel) { return -1; });
}

// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonArray>
#include <QJsonObject>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {
class HmiModuleIntegration;
}

/// \brief What a registered module is and brings: names, places, root state, icon.
///
/// An icon that cannot be drawn becomes a problem of the report.
QJsonObject moduleDescription(const HmiCore::HmiModuleIntegration& module);

/// \brief All views, popups and transients that were loaded, each with its kind, name and URL.
///
/// QML files that do not compile, and views without a state of their name, become problems of the report.
QJsonArray viewDescriptions(QQmlEngine* engine);

/// \brief The pages that modules host, put into the host of another module, or make for other modules.
QJsonArray submoduleDescriptions();

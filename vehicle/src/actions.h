// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

namespace HmiVehicle {

class Vehicle;

/// Something that can happen to the vehicle, for scripts and panels.
struct Action
{
    QString name;
    QStringList arguments; ///< what they mean: one of "a|b", or any text; those in brackets may be left out
    QString brief;
    std::function<void(Vehicle& vehicle, const QStringList& arguments)> happen;

    int fewest() const;
};

const std::vector<Action>& allActions();
/// Null for an unknown one.
const Action* findAction(const QString& name);
/// Empty, or why the action cannot happen with these arguments.
QString checkAction(const Action& action, const QStringList& arguments);

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>

struct Arguments;

/// \brief What the head unit can do with a plugin, and if nothing, why.
struct Diagnosis
{
    /// \brief What the head unit would do.
    enum Effect {
        Uses,
        Skips, ///< and goes on without it
        Ends,  ///< the plugin takes the head unit with it
        Hangs,
    };

    /// \brief Loads the plugin in a process of its own and judges what comes of it; takes up to the time limit.
    static Diagnosis of(const Arguments& arguments);

    /// \brief Whether the plugin can be used; strictly, problems that the head unit lives with count too.
    bool isGood(bool strictly) const;

    QJsonObject toJson() const;

    QString file;
    Effect effect = Uses;
    QString code;       ///< of the reason, for programs; empty when the plugin is used
    QString reason;     ///< whole sentences; empty when the plugin is used
    QJsonObject report; ///< what was found before that: interface, keys, modules, views, engines, problems …
};

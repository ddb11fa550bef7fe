// SPDX-License-Identifier: MIT
#pragma once

#include "expectation.h"

#include <QJsonObject>
#include <QString>
#include <QStringList>

namespace HmiVehicle {

/// One command of the vehicle's scripts: of the command line, of a scenario file, of the control socket.
struct Command
{
    enum Verb {
        ShortKey,
        LongKey,
        RawKey, ///< a key state as it goes over the wire
        Press,
        Release,
        Turn,
        Combination,
        Set,
        Get,
        Do,
        Expect,
        Advance,
        Forget
    };

    /// Empty, or what is wrong with the words.
    static QString parse(const QStringList& words, Command* command);
    /// The same for the command in a line of a scenario. The \a words are what parse() takes.
    static QString wordsOf(const QJsonObject& line, QStringList* words);
    /// Splits as a shell does: quotes keep words together. Empty, or what is wrong.
    static QString split(const QString& text, QStringList* words);
    /// How all commands are written, for a help text.
    static QString usage();
    static bool isVerb(const QString& word);

    Verb verb = Forget;
    int key = 0;         ///< also of a combination
    int number = 0;      ///< milliseconds (0 for the usual time), steps or key state
    QString source;      ///< of a field
    QString name;        ///< of a field or an action
    QJsonValue value;    ///< to set
    QStringList details; ///< of an action
    Expectation expectation;
};

} // namespace HmiVehicle

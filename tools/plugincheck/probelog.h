// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>
#include <QStringList>

/// \brief What the process that loads a plugin tells the one that waits for it: lines of JSON in a file.
///
/// Each line is written at once, so that nothing is lost with the process. Any thread may write.
namespace ProbeLog {

/// \brief Opens the file for the rest of the process; false when that fails.
bool open(const QString& fileName);

/// \brief Adds members to the report; a later value of a member replaces an earlier one.
void tell(const QJsonObject& members);

/// \brief Says what happens next; the last one is where the process ended, if it did.
void enter(const char* stage);

/// \brief Adds to the problems that the head unit lives with.
void addProblem(const QString& problem);

/// \brief The report that a process left behind: all members, with an array "problems".
QJsonObject read(const QString& fileName);

} // namespace ProbeLog

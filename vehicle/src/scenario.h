// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace HmiVehicle {

/// A file of commands, one JSON object a line. It is checked as a whole before anything is played.
class Scenario
{
public:
    struct Step
    {
        QString where; ///< file and line
        QStringList words;
        int timeout = -1; ///< milliseconds for an expectation, below 0 for the usual time
    };

    /// False when it cannot be read or a line is wrong; errorString() names file and line.
    bool load(const QString& fileName);
    const std::vector<Step>& steps() const { return m_steps; }
    QString errorString() const { return m_error; }

    /// Whether a file holds recorded traffic instead.
    static bool isRecording(const QString& fileName);

private:
    QString add(const QByteArray& line, const QString& where);

    std::vector<Step> m_steps;
    QString m_error;
};

} // namespace HmiVehicle

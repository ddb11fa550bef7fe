// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonObject>
#include <QString>
#include <QVector>

/// \brief A tour as its file says: one JSON object a line, each a step. docs/tour.md lists them.
class TourFile
{
public:
    struct Step
    {
        QString where; ///< file and line
        QString verb;
        QJsonObject line;
    };

    /// \brief Reads and checks all of it. False when something is wrong: then errorString() names file, line and field.
    bool load(const QString& fileName);

    const QVector<Step>& steps() const { return m_steps; }
    QString errorString() const { return m_error; }

private:
    QVector<Step> m_steps;
    QString m_error;
};

// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/wire.h"

#include <QByteArray>
#include <QString>

#include <vector>

namespace HmiVehicle {

/// Recorded traffic of an HMI; docs/bridge-protocol.md has the format. It is checked as a whole.
class Recording
{
public:
    enum Kind { Greeting, ToHmi, FromHmi, Fence, Lost };

    struct Entry
    {
        Kind kind;
        double time; ///< seconds
        Channel channel;
        QByteArray line; ///< without its end; of FromHmi in one form for all
        int number;      ///< of the line in the file
    };

    /// False when it cannot be read or a line is wrong; errorString() names file and line.
    bool load(const QString& fileName);
    const std::vector<Entry>& entries() const { return m_entries; }
    QString errorString() const { return m_error; }

    /// What a line of the HMI is compared as; empty for one that is not compared.
    static QByteArray comparable(const QByteArray& line);
    /// A compared line as people read it.
    static QString describe(const QByteArray& line);

private:
    QString add(const QByteArray& line, int number);

    std::vector<Entry> m_entries;
    QString m_error;
};

} // namespace HmiVehicle

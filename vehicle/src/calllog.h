// SPDX-License-Identifier: MIT
#pragma once

#include "expectation.h"

#include <QObject>
#include <QStringList>

#include <deque>

namespace HmiVehicle {

/// The calls of the HMIs, in order, for who expects some of them.
class CallLog : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    void add(const QByteArray& line);

    /// Takes the first call that matches after the one taken last. False when there is none (yet).
    bool take(const Expectation& expectation);
    QStringList sinceTaken() const; ///< after the one taken last
    QStringList leftOver() const;   ///< all that nobody took
    void forget();

Q_SIGNALS:
    void grown();

private:
    struct Call
    {
        QString source;
        QString name;
        QJsonArray arguments;
        bool isTalk; ///< a report for people
        bool taken = false;
    };

    std::deque<Call> m_calls; ///< since the last forget()
    size_t m_next = 0;        ///< first call that comes after the one taken last
};

} // namespace HmiVehicle

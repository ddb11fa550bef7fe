// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

#include <functional>
#include <map>

namespace HmiVehicle {

/// The vehicle's own time, which passes only when advance() says so.
///
/// When time stands still (frozen), answers come at once and what goes on by itself does not.
class Scheduler
{
public:
    using Action = std::function<void()>;

    explicit Scheduler(bool frozen);

    qint64 now() const { return m_now; } ///< milliseconds since the start

    /// Once, \a milliseconds from now; at once when frozen. The result cancels it, 0 when nothing is left to cancel.
    int answerAfter(int milliseconds, Action action);
    /// Once, \a milliseconds from now, whether frozen or not: for what a finger does.
    int after(int milliseconds, Action action);
    /// Again and again until cancelled; never when frozen.
    int every(int milliseconds, Action action);
    void cancel(int* task); ///< sets it to 0
    void advance(int milliseconds);

private:
    struct Task
    {
        int id;
        int period; ///< 0 for once
        Action action;
    };

    int add(int milliseconds, int period, Action action);

    const bool m_frozen;
    qint64 m_now = 0;
    int m_lastId = 0;
    std::multimap<qint64, Task> m_tasks;
};

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#include "scheduler.h"

#include <algorithm>
#include <utility>

namespace HmiVehicle {

Scheduler::Scheduler(bool frozen)
    : m_frozen(frozen)
{
}

int Scheduler::answerAfter(int milliseconds, Action action)
{
    if (!m_frozen)
        return add(milliseconds, 0, std::move(action));
    action();
    return 0;
}

int Scheduler::after(int milliseconds, Action action)
{
    return add(milliseconds, 0, std::move(action));
}

int Scheduler::every(int milliseconds, Action action)
{
    return m_frozen ? 0 : add(milliseconds, milliseconds, std::move(action));
}

int Scheduler::add(int milliseconds, int period, Action action)
{
    m_tasks.insert({m_now + milliseconds, {++m_lastId, period, std::move(action)}});
    return m_lastId;
}

void Scheduler::cancel(int* task)
{
    const int id = std::exchange(*task, 0);
    const auto found =
        std::find_if(m_tasks.begin(), m_tasks.end(), [id](const auto& entry) { return entry.second.id == id; });
    if (found != m_tasks.end())
        m_tasks.erase(found);
}

void Scheduler::advance(int milliseconds)
{
    const qint64 end = m_now + milliseconds;
    while (!m_tasks.empty() && m_tasks.begin()->first <= end) {
        const auto due = m_tasks.begin();
        m_now = due->first;
        Task task = std::move(due->second);
        m_tasks.erase(due);
        const Action action = task.action;
        if (task.period)
            m_tasks.insert({m_now + task.period, std::move(task)}); // before it runs, so that it can cancel itself
        action();
    }
    m_now = end;
}

} // namespace HmiVehicle

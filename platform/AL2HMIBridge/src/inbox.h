// SPDX-License-Identifier: MIT
#pragma once

#include "message.h"
#include "waker.h"

#include <QBasicTimer>
#include <QObject>

#include <deque>
#include <mutex>
#include <vector>

namespace AL2HMIBridge {

/// Decoded messages on their way from a receive thread to the GUI thread, where this object lives. In order, bounded.
class Inbox : public QObject
{
public:
    /// \a waker is woken when there is room again. Events of higher \a priority overtake others.
    Inbox(Waker& waker, int priority);
    ~Inbox() override;

    /// The receive thread's; one posted event however many messages there are.
    void push(std::vector<Message>&& messages);

    /// The receive thread stops reading while this is so, which in the end holds back the peer.
    bool isFull() const;

protected:
    bool event(QEvent* event) override;
    void timerEvent(QTimerEvent* event) override;

private:
    void deliverSlice();
    bool refill();
    bool hasNoRoom() const; ///< under the mutex

    Waker& m_waker;
    const int m_priority;
    mutable std::mutex m_mutex;
    std::vector<Message> m_arrived;
    int m_arrivedBytes = 0;
    bool m_announced = false;
    std::deque<Message> m_current; ///< GUI thread only
    QBasicTimer m_continue;
};

} // namespace AL2HMIBridge

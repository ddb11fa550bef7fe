// SPDX-License-Identifier: MIT
#include "inbox.h"

#include "bridgelimits.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QEvent>
#include <QPointer>

#include <iterator>
#include <utility>

namespace AL2HMIBridge {

namespace {
const auto arrival = QEvent::Type(QEvent::registerEventType());
}

Inbox::Inbox(Waker& waker, int priority)
    : m_waker(waker)
    , m_priority(priority)
{
}

Inbox::~Inbox() = default;

void Inbox::push(std::vector<Message>&& messages)
{
    if (messages.empty())
        return;
    bool announce = false;
    {
        const std::lock_guard<std::mutex> lock(m_mutex);
        for (const Message& message : messages)
            m_arrivedBytes += message.bytes;
        m_arrived.insert(m_arrived.end(), std::make_move_iterator(messages.begin()),
                         std::make_move_iterator(messages.end()));
        announce = !std::exchange(m_announced, true);
    }
    if (announce)
        QCoreApplication::postEvent(this, new QEvent(arrival), m_priority);
}

bool Inbox::isFull() const
{
    const std::lock_guard<std::mutex> lock(m_mutex);
    return hasNoRoom();
}

bool Inbox::hasNoRoom() const
{
    return m_arrived.size() >= size_t(maximumIncoming) || m_arrivedBytes >= maximumIncomingBytes;
}

bool Inbox::event(QEvent* event)
{
    if (event->type() != arrival)
        return QObject::event(event);
    deliverSlice();
    return true;
}

void Inbox::timerEvent(QTimerEvent*)
{
    deliverSlice();
}

/// The timer goes on where the slice ended, after other events had their turn; also when a listener runs an event loop.
void Inbox::deliverSlice()
{
    const QPointer<Inbox> self(this);
    QElapsedTimer spent;
    spent.start();
    m_continue.start(0, this);
    while (refill()) {
        Message message = std::move(m_current.front());
        m_current.pop_front();
        deliver(message);
        if (!self || spent.elapsed() >= guiSlice)
            return;
    }
    m_continue.stop();
}

bool Inbox::refill()
{
    if (!m_current.empty())
        return true;
    std::vector<Message> arrived;
    bool wasFull = false;
    {
        const std::lock_guard<std::mutex> lock(m_mutex);
        wasFull = hasNoRoom();
        arrived.swap(m_arrived);
        m_arrivedBytes = 0;
        m_announced = !arrived.empty();
    }
    if (wasFull)
        m_waker.wake();
    std::move(arrived.begin(), arrived.end(), std::back_inserter(m_current));
    return !m_current.empty();
}

} // namespace AL2HMIBridge

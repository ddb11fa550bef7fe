// SPDX-License-Identifier: MIT
#include "receiveloop.h"

#include "bridgelog.h"
#include "channelreader.h"
#include "bridgelimits.h"

#include <QDeadlineTimer>
#include <QThread>

#include <algorithm>
#include <cerrno>
#include <poll.h>
#include <sys/socket.h>
#include <utility>

namespace AL2HMIBridge {

namespace {

/// QThread lets only its heirs say when a thread may be terminated.
struct Termination : QThread
{
    using QThread::setTerminationEnabled;
};

/// Hangs up when the connection, or the whole thread, ends.
class OpenLink
{
public:
    OpenLink(Outbox& outbox, Inbox& inbox, BridgeEndpoint::Channel channel)
        : m_outbox(outbox)
        , m_inbox(inbox)
        , m_channel(channel)
    {
    }
    ~OpenLink()
    {
        if (const int lost = m_outbox.close())
            qCWarning(bridgeLog).noquote() << "Peer on" << BridgeEndpoint::channelName(m_channel)
                                           << "gone before it read" << lost << "calls; they are dropped";
        if (!announced)
            return;
        Message message;
        message.kind = Message::Disconnected;
        message.channel = m_channel;
        std::vector<Message> messages;
        messages.push_back(std::move(message));
        m_inbox.push(std::move(messages));
    }
    Q_DISABLE_COPY(OpenLink)

    bool announced = false;

private:
    Outbox& m_outbox;
    Inbox& m_inbox;
    BridgeEndpoint::Channel m_channel;
};

int priorityOf(BridgeEndpoint::Channel channel)
{
    return channel == BridgeEndpoint::Priority ? Qt::HighEventPriority : Qt::NormalEventPriority;
}

} // namespace

ReceiveLoop::ReceiveLoop(BridgeEndpoint::Channel channel)
    : m_channel(channel)
    , m_outbox(Outbox::of(channel))
    , m_inbox(m_outbox.waker(), priorityOf(channel))
    , m_dialer(channel)
    , m_buffer(receiveChunk)
{
}

int ReceiveLoop::wait(pollfd* descriptors, unsigned count, int milliseconds)
{
    Termination::setTerminationEnabled(true);
    const int ready = ::poll(descriptors, count, milliseconds);
    Termination::setTerminationEnabled(false);
    return ready;
}

void ReceiveLoop::run()
{
    Termination::setTerminationEnabled(false);
    int pause = firstRetry;
    for (;;) {
        FileDescriptor socket = m_dialer.dial();
        if (socket.isValid() && serve(std::move(socket)))
            pause = firstRetry;
        wait(nullptr, 0, pause);
        pause = std::min(2 * pause, lastRetry);
    }
}

/// Whether the peer spoke the protocol.
bool ReceiveLoop::serve(FileDescriptor opened)
{
    if (!m_outbox.open(std::move(opened)))
        return false;
    OpenLink link(m_outbox, m_inbox, m_channel);
    ChannelReader reader(m_channel);
    const QDeadlineTimer greeting(greetingDeadline);
    for (;;) {
        const bool reading = !m_inbox.isFull();
        const short events = short((reading ? POLLIN : 0) | (m_outbox.wantsToWrite() ? POLLOUT : 0));
        pollfd descriptors[] = {{m_outbox.waker().fd(), POLLIN, 0}, {m_outbox.socket(), events, 0}};
        wait(descriptors, events ? 2 : 1, reader.greeted() ? -1 : int(greeting.remainingTime()));
        if (descriptors[0].revents)
            m_outbox.waker().clear();
        if (events & POLLOUT)
            m_outbox.flush();
        if (reading && descriptors[1].revents && !receive(descriptors[1].fd, reader))
            return reader.greeted();
        if (reading && !(descriptors[1].revents & (POLLIN | POLLHUP)) && m_outbox.isBroken())
            return reader.greeted();
        if (reader.greeted() && !link.announced) {
            link.announced = true;
            m_outbox.setReady();
        }
        if (!reader.greeted() && greeting.hasExpired()) {
            qCWarning(bridgeLog).noquote()
                << "Peer on" << BridgeEndpoint::channelName(m_channel) << "refused: it does not greet";
            return false;
        }
    }
}

/// False at the end of the connection.
bool ReceiveLoop::receive(int socket, ChannelReader& reader)
{
    const auto count = ::recv(socket, m_buffer.data(), m_buffer.size(), MSG_DONTWAIT);
    if (count < 0 && (errno == EAGAIN || errno == EINTR))
        return true;
    if (count <= 0) {
        reader.finish();
        return false;
    }
    std::vector<Message> messages;
    const bool spoken = reader.feed(m_buffer.data(), int(count), &messages);
    m_inbox.push(std::move(messages));
    return spoken;
}

} // namespace AL2HMIBridge

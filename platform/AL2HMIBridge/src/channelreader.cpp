// SPDX-License-Identifier: MIT
#include "channelreader.h"

#include "decoder.h"
#include "bridgelimits.h"
#include "tap.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace AL2HMIBridge {

ChannelReader::ChannelReader(BridgeEndpoint::Channel channel)
    : m_channel(channel)
    , m_refusals(channel)
{
}

bool ChannelReader::feed(const char* data, int size, std::vector<Message>* messages)
{
    const char* const end = data + size;
    while (data < end) {
        const auto* const lineEnd = static_cast<const char*>(std::memchr(data, '\n', size_t(end - data)));
        if (!lineEnd) {
            gather(data, end);
            return true;
        }
        bool spoken = true;
        if (m_partial.isEmpty() && !m_skipping) {
            spoken = feedLine(QByteArray::fromRawData(data, int(lineEnd - data)), messages);
        } else {
            gather(data, lineEnd);
            if (!m_skipping)
                spoken = feedLine(std::exchange(m_partial, QByteArray()), messages);
        }
        if (!spoken)
            return false;
        m_skipping = false;
        data = lineEnd + 1;
    }
    return true;
}

void ChannelReader::gather(const char* begin, const char* end)
{
    if (m_skipping)
        return;
    if (m_partial.size() + (end - begin) < maximumLine) {
        m_partial.append(begin, int(end - begin));
        return;
    }
    m_skipping = true;
    m_partial = QByteArray();
    m_refusals.report(QStringLiteral("longer than %1 bytes").arg(maximumLine));
}

bool ChannelReader::feedLine(const QByteArray& line, std::vector<Message>* messages)
{
    Message message;
    bool isJson = false;
    const QString problem = decode(line, m_channel, &message, &isJson);
    tapLine(m_channel, Direction::In, line, isJson);
    if (!m_greeted)
        return takeGreeting(message, problem, messages);
    if (problem.isEmpty())
        return takeMessage(std::move(message), messages);
    m_refusals.report(problem);
    return true;
}

bool ChannelReader::takeGreeting(const Message& message, const QString& problem, std::vector<Message>* messages)
{
    if (!problem.isEmpty() || message.kind != Message::Greeting) {
        m_refusals.report(
            QStringLiteral("no greeting: ")
            + (problem.isEmpty() ? QStringLiteral("the first line must tell the protocol version") : problem));
        return false;
    }
    m_greeted = true;
    m_gathering = m_channel == BridgeEndpoint::Messages;
    Message connected;
    connected.kind = Message::Connected;
    connected.channel = m_channel;
    messages->push_back(std::move(connected));
    return true;
}

bool ChannelReader::takeMessage(Message&& message, std::vector<Message>* messages)
{
    if (message.kind == Message::Greeting) {
        m_refusals.report(QStringLiteral("a second greeting"));
    } else if (message.kind == Message::SnapshotEnd && !m_gathering) {
        m_refusals.report(QStringLiteral("no snapshot is under way"));
    } else if (message.kind == Message::SnapshotEnd) {
        endSnapshot(messages);
    } else if (message.kind == Message::State && m_gathering) {
        return addToSnapshot(std::move(message));
    } else {
        messages->push_back(std::move(message));
    }
    return true;
}

bool ChannelReader::addToSnapshot(Message&& message)
{
    m_snapshotBytes += message.bytes;
    if (m_snapshotBytes > maximumSnapshot) {
        m_refusals.report(QStringLiteral("snapshot longer than %1 bytes").arg(maximumSnapshot));
        return false;
    }
    auto state = std::find_if(m_snapshot.begin(), m_snapshot.end(),
                              [&](const SourceState& known) { return known.source == message.source; });
    if (state == m_snapshot.end())
        state = m_snapshot.insert(m_snapshot.end(), {message.source, {}});
    for (FieldValue& entry : message.fields) {
        const auto known = std::find_if(state->values.begin(), state->values.end(),
                                        [&](const FieldValue& value) { return value.field == entry.field; });
        if (known == state->values.end())
            state->values.push_back(std::move(entry));
        else
            known->value = std::move(entry.value);
    }
    return true;
}

void ChannelReader::endSnapshot(std::vector<Message>* messages)
{
    Message message;
    message.kind = Message::Snapshot;
    message.channel = m_channel;
    message.snapshot = std::exchange(m_snapshot, {});
    message.bytes = std::exchange(m_snapshotBytes, 0);
    messages->push_back(std::move(message));
    m_gathering = false;
}

void ChannelReader::finish()
{
    if (!m_partial.isEmpty())
        m_refusals.report(QStringLiteral("the peer hung up in the middle of a line"));
    m_partial = QByteArray();
}

} // namespace AL2HMIBridge

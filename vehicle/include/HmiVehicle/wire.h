// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QJsonArray>
#include <QJsonObject>
#include <QString>

namespace HmiVehicle {

/// \brief The protocol's three connections.
enum class Channel { Messages, Priority, Touch };
constexpr Channel allChannels[] = {Channel::Messages, Channel::Priority, Channel::Touch};

/// \brief Name of a channel and of its socket.
QString channelName(Channel channel);
/// \brief False when no channel has this name.
bool channelFromName(const QString& name, Channel* channel);

constexpr int maximumLine = 1024 * 1024; ///< bytes of a line, line end included

/// \brief Lines of the protocol, with their ends.
QByteArray greetingLine();
QByteArray snapshotEndLine();
QByteArray stateLine(const QString& source, const QJsonObject& state);
QByteArray eventLine(const QString& source, const QString& event, const QJsonArray& arguments);

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

namespace AL2HMIBridge {

constexpr int protocolVersion = 1;
constexpr int maximumLine = 1024 * 1024;          ///< bytes of a line, line end included
constexpr int maximumSnapshot = 16 * 1024 * 1024; ///< bytes of all lines of a snapshot
constexpr int maximumOutgoing = 2 * 1024 * 1024;  ///< bytes that may wait for the peer to read
constexpr int maximumIncoming = 4096;             ///< messages that may wait for the GUI thread
constexpr int maximumIncomingBytes = 4 * 1024 * 1024;
constexpr int receiveChunk = 64 * 1024; ///< bytes read at once
constexpr int greetingDeadline = 2000;  ///< milliseconds until a peer must have sent its first line
constexpr int firstRetry = 50;          ///< milliseconds; doubles up to
constexpr int lastRetry = 2000;
constexpr int maximumRecordingQueue = 8 * 1024 * 1024; ///< bytes that may wait to be written
constexpr qint64 maximumRecording = 256 * 1024 * 1024; ///< bytes of a recording that is played
constexpr int guiSlice = 4;                            ///< milliseconds of delivering before other events get a turn
constexpr int refusalBurst = 100;                      ///< warnings a second and connection; further ones are counted
constexpr int shownLength = 64;                        ///< characters of outside text in a log line

} // namespace AL2HMIBridge

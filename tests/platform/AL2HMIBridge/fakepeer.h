// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QString>
#include <QTemporaryDir>

/// The application layer's end of one connection. Blocking with a deadline of some seconds; closes on destruction.
class PeerSocket
{
public:
    explicit PeerSocket(int fd = -1);
    ~PeerSocket();
    PeerSocket(PeerSocket&& other) noexcept;
    PeerSocket& operator=(PeerSocket&& other) noexcept;

    bool isOpen() const { return m_fd >= 0; }
    int fd() const { return m_fd; }
    void close();

    /// Adds the line end. False when the other side hung up or does not read in time.
    bool sendLine(const QByteArray& line);
    bool send(const QByteArray& bytes);
    /// As much as the socket takes at once.
    qint64 sendSome(const QByteArray& bytes);

    /// The next line without its end; null at the end of the connection or of the time.
    QByteArray readLine();
    /// Whether the other side hangs up, whatever it still sends.
    bool waitForHangUp();

    /// The greeting both ways and, on `messages`, a snapshot of these lines; whether the HMI's greeting was right.
    bool greet();
    bool greetWithSnapshot(const QByteArray& stateLines = QByteArray());

private:
    int m_fd;
    QByteArray m_read;
};

/// Listens as the application layer does, in a directory of its own.
class FakePeer
{
public:
    FakePeer();
    ~FakePeer();
    FakePeer(const FakePeer&) = delete;
    FakePeer& operator=(const FakePeer&) = delete;

    QString directory() const { return m_directory.path(); }
    void listen();
    /// As when the process died: sockets closed, their files left behind.
    void die();
    /// The HMI's next connection that it did not close again; not open when there is none in time.
    PeerSocket accept(const char* channel);

    static constexpr int deadline = 10000; ///< milliseconds

private:
    QTemporaryDir m_directory;
    int m_listeners[3] = {-1, -1, -1};
};

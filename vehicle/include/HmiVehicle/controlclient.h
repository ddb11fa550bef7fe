// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonValue>
#include <QObject>
#include <QString>
#include <QStringList>

namespace HmiVehicle {

class Connection;

/// \brief A keyboard's, panel's or script's end of the control socket of a vehicle in another process.
///
/// Nothing waits. Keys that were pressed here come up when the connection ends, whichever side ends it. Needs the event loop
/// of its thread.
class ControlClient : public QObject
{
    Q_OBJECT

public:
    explicit ControlClient(QObject* parent = nullptr);
    ~ControlClient() override;

    /// \brief Connects to the vehicle that serves \a directory; the old connection ends.
    ///
    /// False when none does, or when that is not this user's; errorString() says why.
    bool open(const QString& directory);
    void close();
    bool isOpen() const { return m_connection; }
    QString errorString() const { return m_error; }

    /// \name Hard keys; see KeyInput
    /// After the vehicle was lost, each of these looks for it once more. False when it is not there.
    /// @{
    bool press(int key);
    bool release(int key);
    bool turn(int key, int steps);
    /// @}

    /// \brief Sends a command as `vehicle-sim` takes it, word by word; replied() answers. 0 when there is no connection.
    ///
    /// \a timeout: milliseconds that an expectation is given, below 0 for the usual time.
    int send(const QStringList& words, int timeout = -1);

Q_SIGNALS:
    /// \brief Answer to the command with that number: \a problem is empty when it was done; \a value is what it asked for.
    void replied(int number, const QString& problem, const QJsonValue& value);
    /// \brief The vehicle went away.
    void lost();

private:
    bool sendKey(const QStringList& words);
    void take(const QByteArray& line);

    Connection* m_connection = nullptr;
    QString m_directory;
    QString m_error;
    int m_lastNumber = 0;
};

} // namespace HmiVehicle

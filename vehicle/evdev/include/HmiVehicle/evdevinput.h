// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/keyinput.h"
#include "HmiVehicle/keymap.h"

#include <QObject>
#include <QSocketNotifier>
#include <QString>
#include <QTimer>

#include <memory>

struct libevdev;

namespace HmiVehicle {

class VehicleService;

/// \brief One input device whose keys and dials are hard keys of the vehicle. Needs the event loop of the service's thread.
///
/// It is an owner of keys. A device that is lost has its keys released; it is looked for every now and then, and used again
/// when it is back. The device is not taken away from others.
class EvdevInput : public QObject
{
    Q_OBJECT

public:
    /// \brief \a service must outlive this, so it is no parent for it.
    EvdevInput(VehicleService& service, const QString& device, const KeyMap& map, QObject* parent = nullptr);
    ~EvdevInput() override;

    /// \brief Opens the device. False when that fails; errorString() says why, and it is not looked for again.
    bool open();
    bool isOpen() const { return m_descriptor >= 0; }
    QString errorString() const { return m_error; }

    /// \brief How often a lost device is looked for, in milliseconds; 1000 by default.
    void setRetryInterval(int milliseconds) { m_retry.setInterval(milliseconds); }

Q_SIGNALS:
    /// \brief The device went away, or is back.
    void lost();
    void found();

private:
    struct Closer
    {
        void operator()(libevdev* device) const;
    };

    void readEvents();
    void handle(unsigned int type, unsigned int code, int value);
    bool isHungUp() const;
    void lose();
    void close();

    VehicleService& m_service;
    const QString m_path;
    const KeyMap m_map;
    const KeyInput::Owner m_owner;
    int m_descriptor = -1;
    std::unique_ptr<libevdev, Closer> m_device;
    std::unique_ptr<QSocketNotifier> m_readable;
    QTimer m_retry;
    QString m_error;
};

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#include "HmiVehicle/evdevinput.h"

#include "HmiVehicle/vehicleservice.h"

#include <QFile>

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <libevdev/libevdev.h>
#include <poll.h>
#include <unistd.h>

namespace HmiVehicle {

void EvdevInput::Closer::operator()(libevdev* device) const
{
    libevdev_free(device);
}

EvdevInput::EvdevInput(VehicleService& service, const QString& device, const KeyMap& map, QObject* parent)
    : QObject(parent)
    , m_service(service)
    , m_path(device)
    , m_map(map)
    , m_owner(KeyInput::newOwner())
{
    m_retry.setInterval(1000);
    connect(&m_retry, &QTimer::timeout, this, [this] {
        if (!open())
            return;
        m_retry.stop();
        Q_EMIT found();
    });
}

EvdevInput::~EvdevInput()
{
    close();
    m_service.vehicle().keys().releaseAll(m_owner);
}

bool EvdevInput::open()
{
    close();
    m_descriptor = ::open(QFile::encodeName(m_path).constData(), O_RDONLY | O_NONBLOCK | O_CLOEXEC | O_NOCTTY);
    if (m_descriptor < 0) {
        m_error = m_path + QStringLiteral(": ") + QString::fromLocal8Bit(std::strerror(errno));
        return false;
    }
    libevdev* device = nullptr;
    const int result = libevdev_new_from_fd(m_descriptor, &device);
    if (result < 0) {
        m_error =
            m_path + QStringLiteral(": not an input device (%1)").arg(QString::fromLocal8Bit(std::strerror(-result)));
        close();
        return false;
    }
    m_device.reset(device);
    m_readable = std::make_unique<QSocketNotifier>(m_descriptor, QSocketNotifier::Read);
    connect(m_readable.get(), &QSocketNotifier::activated, this, &EvdevInput::readEvents);
    m_error.clear();
    return true;
}

/// Until there is nothing more: what libevdev has read ahead does not make the descriptor readable again.
void EvdevInput::readEvents()
{
    int count = 0;
    int result = LIBEVDEV_READ_STATUS_SUCCESS;
    unsigned int flags = LIBEVDEV_READ_FLAG_NORMAL;
    while (m_device) {
        input_event event{};
        result = libevdev_next_event(m_device.get(), flags, &event);
        if (result == -EAGAIN && flags == LIBEVDEV_READ_FLAG_SYNC) {
            flags = LIBEVDEV_READ_FLAG_NORMAL; // all that was dropped is made up for
            continue;
        }
        if (result < 0)
            break;
        if (result == LIBEVDEV_READ_STATUS_SYNC)
            flags = LIBEVDEV_READ_FLAG_SYNC; // events were dropped: what follows is the difference that they made
        handle(event.type, event.code, event.value);
        ++count;
    }
    if ((result < 0 && result != -EAGAIN) || (count == 0 && isHungUp()))
        lose();
}

void EvdevInput::handle(unsigned int type, unsigned int code, int value)
{
    KeyInput& keys = m_service.vehicle().keys();
    const int key = type == EV_KEY ? m_map.keyFor(code) : type == EV_REL ? m_map.dialFor(code) : -1;
    if (key < 0)
        return;
    if (type == EV_REL)
        keys.turn(key, qBound(-KeyInput::maximumSteps, value, KeyInput::maximumSteps), m_owner);
    else if (value == 1)
        keys.press(key, m_owner);
    else if (value == 0)
        keys.release(key, m_owner); // 2 is a repetition, which the vehicle makes itself
}

/// It says that there is something to read, and there is nothing: the end.
bool EvdevInput::isHungUp() const
{
    pollfd descriptor{m_descriptor, POLLIN, 0};
    return m_descriptor >= 0 && ::poll(&descriptor, 1, 0) == 1;
}

void EvdevInput::lose()
{
    close();
    m_service.vehicle().keys().releaseAll(m_owner);
    m_retry.start();
    Q_EMIT lost();
}

void EvdevInput::close()
{
    if (m_readable) {
        m_readable->setEnabled(false);
        m_readable.release()->deleteLater(); // it may be it that called
    }
    m_device.reset();
    if (m_descriptor >= 0)
        ::close(m_descriptor);
    m_descriptor = -1;
}

} // namespace HmiVehicle

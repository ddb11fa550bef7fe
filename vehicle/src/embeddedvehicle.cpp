// SPDX-License-Identifier: MIT
#include "HmiVehicle/embeddedvehicle.h"

#include "HmiVehicle/vehicleservice.h"

#include <QThread>

#include <mutex>
#include <sys/socket.h>
#include <unistd.h>
#include <utility>

namespace HmiVehicle {

namespace {

/// Closes a socket that the vehicle does not live to take.
class OfferedSocket
{
public:
    explicit OfferedSocket(int socket)
        : m_socket(socket)
    {
    }
    ~OfferedSocket()
    {
        if (m_socket >= 0)
            ::close(m_socket);
    }
    Q_DISABLE_COPY(OfferedSocket)

    int take() { return std::exchange(m_socket, -1); }

private:
    int m_socket;
};

} // namespace

struct EmbeddedVehicle::Running
{
    std::mutex mutex;
    std::unique_ptr<QThread> thread;
    VehicleService* service = nullptr; ///< lives and dies in the thread
};

EmbeddedVehicle::EmbeddedVehicle(const Vehicle::Options& options)
    : m_options(options)
    , m_running(std::make_unique<Running>())
{
}

EmbeddedVehicle::~EmbeddedVehicle()
{
    stop();
}

void EmbeddedVehicle::start()
{
    const std::lock_guard<std::mutex> lock(m_running->mutex);
    if (m_running->service)
        return;
    m_running->thread = std::make_unique<QThread>();
    m_running->thread->setObjectName(QStringLiteral("vehicle"));
    m_running->service = new VehicleService(m_options);
    m_running->service->moveToThread(m_running->thread.get());
    QObject::connect(m_running->thread.get(), &QThread::finished, m_running->service, &QObject::deleteLater);
    m_running->thread->start();
}

void EmbeddedVehicle::stop()
{
    std::unique_ptr<QThread> thread;
    {
        const std::lock_guard<std::mutex> lock(m_running->mutex);
        m_running->service = nullptr;
        thread = std::move(m_running->thread);
    }
    if (!thread)
        return;
    thread->quit();
    thread->wait();
}

bool EmbeddedVehicle::isRunning() const
{
    const std::lock_guard<std::mutex> lock(m_running->mutex);
    return m_running->service;
}

int EmbeddedVehicle::connectChannel(const QString& name)
{
    Channel channel{};
    const std::lock_guard<std::mutex> lock(m_running->mutex);
    int pair[2];
    if (!m_running->service || !channelFromName(name, &channel)
        || ::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, pair) != 0)
        return -1;
    VehicleService* const service = m_running->service;
    const auto offered = std::make_shared<OfferedSocket>(pair[0]);
    QMetaObject::invokeMethod(
        service, [service, channel, offered] { service->addConnection(channel, offered->take()); },
        Qt::QueuedConnection);
    return pair[1];
}

void EmbeddedVehicle::run(std::function<void(Vehicle&)> action)
{
    runInService([action = std::move(action)](VehicleService& service) { action(service.vehicle()); });
}

void EmbeddedVehicle::runInService(std::function<void(VehicleService&)> action)
{
    const std::lock_guard<std::mutex> lock(m_running->mutex);
    VehicleService* const service = m_running->service;
    if (service)
        QMetaObject::invokeMethod(
            service, [service, action = std::move(action)] { action(*service); }, Qt::QueuedConnection);
}

} // namespace HmiVehicle

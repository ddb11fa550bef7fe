// SPDX-License-Identifier: MIT
#pragma once

#include <QSocketNotifier>

#include <memory>

namespace HmiVehicle {

/// SIGINT and SIGTERM end the event loop of the process, so that what is open is closed; not the process at once.
///
/// To be made before the first thread: those that exist already are ended by the signals as ever. Processes that are started
/// inherit that the signals wait. The signals wait until quitEventLoop(), and for good when this has gone.
class EndSignals
{
public:
    EndSignals();
    ~EndSignals();
    Q_DISABLE_COPY(EndSignals)

    /// From now on a signal, also one that came before, ends the application object's event loop. GUI thread.
    void quitEventLoop();

private:
    const int m_descriptor;
    std::unique_ptr<QSocketNotifier> m_notifier;
};

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#pragma once

#include "receivethread.h"

namespace AL2HMIBridge {

/// \brief Receives touches of the layer behind the HMI and tells that layer what it shows: channel `touch`.
class AL2HMIBRIDGE_EXPORT TouchInputReceiverThread : public ReceiveThread
{
    Q_OBJECT

public:
    explicit TouchInputReceiverThread(QObject* parent);
    ~TouchInputReceiverThread() override;

    /// \brief The newest one, or null. GUI thread only.
    static TouchInputReceiverThread* instance();

    /// \brief Tells the layer behind the HMI whether it is seen; reported and dropped without a peer. GUI thread only.
    void setPassThroughViewVisible(bool visible);

    /// \brief Tells where the mobile navigation's picture starts, in pixels; reported and dropped without a peer. GUI thread only.
    void setMobileNavTouchParamsOffset(bool active, int x, int y);

Q_SIGNALS:
    /// \brief The view behind the HMI was touched.
    void passThroughViewTouched();
};

} // namespace AL2HMIBridge

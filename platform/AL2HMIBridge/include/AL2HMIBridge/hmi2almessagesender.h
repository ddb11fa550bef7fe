// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"

#include <QJsonArray>
#include <QObject>

namespace AL2HMIBridge {

/// \brief Sends calls to the application layer, which all source classes use: socket `messages`. GUI thread only.
class AL2HMIBRIDGE_EXPORT HMI2ALMessageSender : public QObject
{
    Q_OBJECT

public:
    /// \brief The process's one sender, made on the first call as a child of the application object.
    static HMI2ALMessageSender* instance();
    ~HMI2ALMessageSender() override;

    /// \brief Sends one call without waiting.
    ///
    /// False, after one warning that names the call, when no peer is there, when too much waits to be sent already or
    /// when the call does not fit into a line; it is then dropped, never sent later.
    bool send(const QString& source, const QString& call, const QJsonArray& arguments = QJsonArray());

private:
    HMI2ALMessageSender();
};

} // namespace AL2HMIBridge

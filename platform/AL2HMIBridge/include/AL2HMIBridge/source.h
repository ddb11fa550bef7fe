// SPDX-License-Identifier: MIT
#pragma once

#include "al2hmibridge_export.h"

#include <QObject>

class QJsonArray;

namespace AL2HMIBridge {

struct SourceInfo;

/// \brief What all sources have in common: a name on the wire and a way to send calls. GUI thread only.
class AL2HMIBRIDGE_EXPORT Source : public QObject
{
    Q_OBJECT

public:
    ~Source() override;

protected:
    /// Becomes a child of the application object. \a name must stay valid for the life of the source.
    explicit Source(const char* name);

    /// Sends a call of this source without waiting; without a peer it is reported and dropped.
    void send(const char* call) const;
    /// As above, with arguments in the order of the call's declaration.
    void send(const char* call, const QJsonArray& arguments) const;

private:
    const char* m_name;
};

} // namespace AL2HMIBridge

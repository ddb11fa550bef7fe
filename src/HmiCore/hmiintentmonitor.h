// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QObject>
#include <QPointer>

namespace HmiCore {

class HmiIntentHandler;

/// \brief Tells whether an intent can be performed now, so that controls can be greyed out. GUI thread only.
///
/// Made by HmiIntentManager::intentMonitor(), which owns it. It watches the handlers that were registered by then.
class HMICORE_EXPORT HmiIntentMonitor : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool enabled READ enabled NOTIFY enabledChanged)

public:
    /// \brief Watches those of \a handlers that live; none is owned.
    HmiIntentMonitor(int intent, const QList<QPointer<HmiIntentHandler>>& handlers, QObject* parent);
    ~HmiIntentMonitor() override;

    /// \brief Whether at least one handler can perform the intent. One that is destroyed cannot any more.
    bool enabled() const { return !m_enabledHandlers.isEmpty(); }

Q_SIGNALS:
    /// \brief Only when the first handler becomes able or the last one unable.
    void enabledChanged(bool enabled);

private Q_SLOTS:
    void actionStatusChanged(int intent, bool enabled);

private:
    void disable(HmiIntentHandler* handler);

    QList<HmiIntentHandler*> m_enabledHandlers;
    const int m_intent;
};

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QQuickWindow>
#include <QTimer>

namespace HmiGuiFramework {

/// \brief The HMI's window. Tells when the user has not touched it for a while. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT HmiQQuickWindow : public QQuickWindow
{
    Q_OBJECT

public:
    /// \brief Not shown yet.
    explicit HmiQQuickWindow(QWindow* parent = nullptr);
    ~HmiQQuickWindow() override;

    /// \brief Milliseconds without activity until idle() is emitted, once; 0 or less turns it off.
    void setIdleTimeout(int milliseconds);

public Q_SLOTS:
    /// \brief Counts as a touch: the idle time starts anew.
    void userActivityNotify();

Q_SIGNALS:
    /// \brief Nobody has touched the window for the idle time. Emitted again only after new activity.
    void idle();

protected:
    bool event(QEvent* event) override;

private:
    QTimer m_idleTimer;
};

} // namespace HmiGuiFramework

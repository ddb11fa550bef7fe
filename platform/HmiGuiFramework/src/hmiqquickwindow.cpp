// SPDX-License-Identifier: MIT
#include "hmiqquickwindow.h"

#include <QEvent>

namespace HmiGuiFramework {

namespace {
bool isUserActivity(QEvent::Type type)
{
    switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseMove:
    case QEvent::Wheel:
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::KeyPress:
        return true;
    default:
        return false;
    }
}
} // namespace

HmiQQuickWindow::HmiQQuickWindow(QWindow* parent)
    : QQuickWindow(parent)
{
    m_idleTimer.setSingleShot(true);
    connect(&m_idleTimer, &QTimer::timeout, this, &HmiQQuickWindow::idle);
}

HmiQQuickWindow::~HmiQQuickWindow() = default;

void HmiQQuickWindow::setIdleTimeout(int milliseconds)
{
    m_idleTimer.setInterval(qMax(0, milliseconds));
    userActivityNotify();
}

void HmiQQuickWindow::userActivityNotify()
{
    if (m_idleTimer.interval() > 0)
        m_idleTimer.start();
    else
        m_idleTimer.stop();
}

bool HmiQQuickWindow::event(QEvent* event)
{
    if (isUserActivity(event->type()))
        userActivityNotify();
    return QQuickWindow::event(event);
}

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#include "windowmanager.h"

#include "appsettings.h"
#include "viewmanager.h"

namespace HmiGuiFramework {

WindowManager::WindowManager(AppSettings* settings, QObject* parent)
    : QObject(parent)
    , m_settings(settings)
    , m_window(std::make_unique<HmiQQuickWindow>())
{
    m_window->resize(settings->windowSize());
    m_window->setColor(Qt::black);
    m_window->setIdleTimeout(settings->idleTimeout());
    connect(settings, &AppSettings::idleTimeoutChanged, this,
            [this] { m_window->setIdleTimeout(m_settings->idleTimeout()); });
    connect(m_window.get(), &QWindow::widthChanged, this, &WindowManager::fitStage);
    connect(m_window.get(), &QWindow::heightChanged, this, &WindowManager::fitStage);
}

WindowManager::~WindowManager()
{
    // The stage belongs to the view manager; the window must not take it along.
    if (m_viewManager)
        m_viewManager->stage()->setParentItem(nullptr);
}

void WindowManager::attachViewmanager(ViewManager* viewManager)
{
    if (!viewManager)
        return;
    m_viewManager = viewManager;
    viewManager->stage()->setParentItem(m_window->contentItem());
    fitStage();
}

void WindowManager::showScreen()
{
    if (m_settings->fullScreen())
        m_window->showFullScreen();
    else
        m_window->show();
}

void WindowManager::fitStage()
{
    if (m_viewManager)
        m_viewManager->stage()->setSize(m_window->size());
}

} // namespace HmiGuiFramework

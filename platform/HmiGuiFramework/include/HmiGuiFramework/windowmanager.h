// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"
#include "hmiqquickwindow.h"

#include <QObject>
#include <QPointer>

#include <memory>

namespace HmiGuiFramework {

class AppSettings;
class ViewManager;

/// \brief Owns the HMI's window. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT WindowManager : public QObject
{
    Q_OBJECT

public:
    /// \brief Makes the window, hidden, in the size that \a settings give.
    WindowManager(AppSettings* settings, QObject* parent);
    ~WindowManager() override;

    HmiQQuickWindow* hmiWindow() const { return m_window.get(); } ///< never null; owned by the manager

    /// \brief Makes the view manager's stage the window's content. A null view manager is ignored.
    void attachViewmanager(ViewManager* viewManager);

    /// \brief Shows the window, over the full screen when the settings say so.
    void showScreen();

private:
    void fitStage();

    AppSettings* const m_settings;
    std::unique_ptr<HmiQQuickWindow> m_window;
    QPointer<ViewManager> m_viewManager;
};

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QVariantList>

class Navigator;

/// \brief Tells of the next turn while another screen than the map is shown. GUI thread only.
///
/// Whoever handles the intents `NavTBTTransientShown` (icon, distance, street; each as text) and `NavTBTTransientHidden` gets
/// what to show and when to stop; close to a turn the status bar's transient `NAVIGATION.Turn` comes up as well.
class TurnAnnouncer : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool enabled READ isEnabled WRITE setEnabled NOTIFY enabledChanged)

public:
    TurnAnnouncer(Navigator* navigator, QObject* parent);

    bool isEnabled() const { return m_enabled; }
    void setEnabled(bool enabled);

    /// \brief Watches the screens from now on; needs the framework's view manager.
    void start();

Q_SIGNALS:
    void enabledChanged();

private:
    void update();
    void tell(const QVariantList& hint);
    void announceNearTurn();

    Navigator* const m_navigator;
    QVariantList m_told;  ///< empty while nothing is shown
    int m_announced = -1; ///< row of the step that the transient was shown for
    bool m_enabled = true;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief Brings calls to the screen: the popup of an incoming call and the view of a running one; and the phone's assistant.
/// GUI thread only.
class PhoneController : public QObject
{
    Q_OBJECT

public:
    explicit PhoneController(QObject* parent);

    /// \brief Name of the popup, of its state, and of the key signal that asks for it.
    static QString incomingCallPopup();

    /// \brief Names of the popups of the phone's assistant: it listens; it is switched off.
    static QString assistantPopup();
    static QString assistantHintPopup();

private:
    void update();
    void leaveCallView();

    bool m_inCall = false;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>

/// \brief Brings calls to the screen: the popup of an incoming call and the view of a running one. GUI thread only.
class PhoneController : public QObject
{
    Q_OBJECT

public:
    explicit PhoneController(QObject* parent);

    /// \brief Name of the popup, of its state, and of the key signal that asks for it.
    static QString incomingCallPopup();

private:
    void update();
    void leaveCallView();

    bool m_inCall = false;
};

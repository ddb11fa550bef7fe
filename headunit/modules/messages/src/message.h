// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

/// \brief One message. What the vehicle itself has to say is kept by its kind, so that it can be told in any language.
struct Message
{
    enum Kind {
        Text, ///< of somebody, on the phone
        MissedCall,
        IcyRoad,
        PhoneBattery, ///< is nearly empty
    };

    Kind kind = Text;
    QString sender; ///< of a text or a call; the name of a phone
    QString text;   ///< of a text
    QString number; ///< to call back; empty for none
    QString place;  ///< to drive to; empty for none
    QString time;   ///< of arrival, hours and minutes, as the vehicle tells them
    bool unread = true;
    int answer = -1; ///< row of MessageCenter::answers() that was sent; -1 for none

    QString icon() const;
    QString shownSender() const; ///< in the language of the HMI, where it is not a name
    QString shownText() const;
};

// SPDX-License-Identifier: MIT
#include "message.h"

#include <QCoreApplication>

namespace {

struct Look
{
    const char* icon;
    const char* sender; ///< null where it is that of the message
    const char* text;
};

/// In the order of Message::Kind.
const Look looks[] = {{"message", nullptr, nullptr},
                      {"missed-call", nullptr, QT_TRANSLATE_NOOP("Message", "Missed call")},
                      {"ice", QT_TRANSLATE_NOOP("Message", "Vehicle"),
                       QT_TRANSLATE_NOOP("Message", "The road may be icy. Drive with care.")},
                      {"battery", nullptr, QT_TRANSLATE_NOOP("Message", "The battery of the phone is nearly empty.")}};

QString translated(const char* text)
{
    return QCoreApplication::translate("Message", text);
}

} // namespace

QString Message::icon() const
{
    return QString::fromLatin1(looks[kind].icon);
}

QString Message::shownSender() const
{
    if (looks[kind].sender)
        return translated(looks[kind].sender);
    if (!sender.isEmpty())
        return sender;
    return number.isEmpty() ? QCoreApplication::translate("Message", "Unknown sender") : number;
}

QString Message::shownText() const
{
    return looks[kind].text ? translated(looks[kind].text) : text;
}

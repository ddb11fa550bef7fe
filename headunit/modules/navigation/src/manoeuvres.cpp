// SPDX-License-Identifier: MIT
#include "manoeuvres.h"

#include <QCoreApplication>

namespace Manoeuvres {

namespace {

struct Look
{
    const char* icon;
    const char* text;
};

/// In the order of the enumeration.
const Look looks[] = {{"turn-straight", QT_TRANSLATE_NOOP("Manoeuvres", "Set off")},
                      {"turn-straight", QT_TRANSLATE_NOOP("Manoeuvres", "Go straight on")},
                      {"turn-slight-left", QT_TRANSLATE_NOOP("Manoeuvres", "Bear left")},
                      {"turn-slight-right", QT_TRANSLATE_NOOP("Manoeuvres", "Bear right")},
                      {"turn-left", QT_TRANSLATE_NOOP("Manoeuvres", "Turn left")},
                      {"turn-right", QT_TRANSLATE_NOOP("Manoeuvres", "Turn right")},
                      {"turn-sharp-left", QT_TRANSLATE_NOOP("Manoeuvres", "Turn sharp left")},
                      {"turn-sharp-right", QT_TRANSLATE_NOOP("Manoeuvres", "Turn sharp right")},
                      {"turn-round", QT_TRANSLATE_NOOP("Manoeuvres", "Turn round")},
                      {"destination", QT_TRANSLATE_NOOP("Manoeuvres", "You arrive")}};

const Look& lookOf(Manoeuvre manoeuvre)
{
    return looks[int(manoeuvre)];
}

} // namespace

QString icon(Manoeuvre manoeuvre)
{
    return QString::fromLatin1(lookOf(manoeuvre).icon);
}

QString text(Manoeuvre manoeuvre)
{
    return QCoreApplication::translate("Manoeuvres", lookOf(manoeuvre).text);
}

} // namespace Manoeuvres

// SPDX-License-Identifier: MIT
#include "units.h"

#include <AL2HMIBridge/GlobalSource>
#include <HmiCore/HmiMarketPropertyStore>

#include <QCoreApplication>
#include <QLocale>

#include <algorithm>

namespace Units {

namespace {

struct System
{
    const char* shortText; ///< of the unit of short ways
    const char* longText;
    double shortMetres; ///< one of them
    double longMetres;
    double shortestLong; ///< from how many of the long unit on that is used
};

// In the catalogues these are texts of the context "Units".
const System metric{QT_TRANSLATE_NOOP("Units", "%1 m"), QT_TRANSLATE_NOOP("Units", "%1 km"), 1, 1000, 1};
const System british{QT_TRANSLATE_NOOP("Units", "%1 yd"), QT_TRANSLATE_NOOP("Units", "%1 mi"), 0.9144, 1609.344, 0.25};
const System american{QT_TRANSLATE_NOOP("Units", "%1 ft"), QT_TRANSLATE_NOOP("Units", "%1 mi"), 0.3048, 1609.344, 0.2};

const System& systemOfMarket()
{
    if (marketProperty("distanceUnit").toString() != QLatin1String("mile"))
        return metric;
    return isFahrenheit() ? american : british;
}

QString translated(const char* text)
{
    return QCoreApplication::translate("Units", text);
}

/// Steps that a driver can tell apart: the nearer, the finer.
int rounded(double amount)
{
    const int step = amount < 100 ? 10 : 50;
    return std::max(0, qRound(amount / step) * step);
}

} // namespace

QVariant marketProperty(const char* name)
{
    return HmiCore::HmiMarketPropertyStore::instance()->getProperty(
        AL2HMIBridge::GlobalSource::instance()->destinationCountry(), QString::fromLatin1(name));
}

bool isFahrenheit()
{
    return marketProperty("temperatureUnit").toString() == QLatin1String("fahrenheit");
}

/// Arabic has European digits on the screen, and the point that goes with them.
QString number(double value, int decimals)
{
    QString text = QString::number(value, 'f', decimals);
    if (QLocale().language() != QLocale::Arabic)
        text.replace(QLatin1Char('.'), QLocale().decimalPoint());
    return text;
}

QString distance(double metres)
{
    const System& system = systemOfMarket();
    const int shortAmount = rounded(metres / system.shortMetres);
    if (shortAmount * system.shortMetres < system.shortestLong * system.longMetres)
        return translated(system.shortText).arg(shortAmount);
    const double longAmount = metres / system.longMetres;
    return translated(system.longText).arg(number(longAmount, longAmount < 10 ? 1 : 0));
}

QString duration(double seconds)
{
    const int minutes = std::max(1, qRound(seconds / 60));
    if (minutes < 60)
        return QCoreApplication::translate("Units", "%1 min").arg(minutes);
    return QCoreApplication::translate("Units", "%1 h %2 min").arg(minutes / 60).arg(minutes % 60);
}

} // namespace Units

// SPDX-License-Identifier: MIT
#include "turnhint.h"

#include "intenttable.h"

#include <HmiCore/HmiIntentManager>

#include <QFile>

using HmiCore::HmiIntentManager;

namespace {
constexpr int longestName = 64; ///< of an icon
}

TurnHint::TurnHint(QObject* parent)
    : QObject(parent)
{
    const auto problem = [](const IntentTable::Data& data) {
        const QString file = QStringLiteral(":/icons/%1.svg").arg(data.value(0).toString().left(longestName));
        return QFile::exists(file) ? QString() : tr("There is no turn to show");
    };
    HmiIntentManager::instance()->registerIntentHandler(new IntentTable(
        {
            {HmiIntentManager::NavTBTTransientShown,
             [this](const IntentTable::Data& data) {
                 show(data.value(0).toString(), data.value(1).toString(), data.value(2).toString());
             },
             {},
             problem},
            {HmiIntentManager::NavTBTTransientHidden, [this](const IntentTable::Data&) { show({}, {}, {}); }, {}, {}},
        },
        this));
}

void TurnHint::show(const QString& icon, const QString& distance, const QString& street)
{
    m_icon = icon;
    m_distance = distance;
    m_street = street;
    Q_EMIT changed();
}

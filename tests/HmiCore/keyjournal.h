// SPDX-License-Identifier: MIT
#pragma once

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/KeySource>
#include <HmiCore/HardKeyController>
#include <HmiCore/HmiIntentHandler>
#include <HmiCore/HmiIntentManager>

#include <QObject>
#include <QStringList>

/// Everything that keys lead to, in order: calls as the bridge writes them, "intent 47" and "signal swcSeekUpShortPress".
class KeyJournal : public HmiCore::HmiIntentHandler
{
    Q_OBJECT

public:
    KeyJournal()
    {
        using namespace HmiCore;
        for (const int intent : {HmiIntentManager::PhoneSiriNotEnabled, HmiIntentManager::CancelAnnouncement,
                                 HmiIntentManager::RequestDisplayToggle})
            addAction(intent);
        HmiIntentManager::instance()->registerIntentHandler(this);

        const HardKeyController* const controller = HardKeyController::instance();
        const auto journal = [this, controller](void (HardKeyController::*signal)(), const char* name) {
            connect(controller, signal, this,
                    [this, name] { add(QStringLiteral("signal %1").arg(QLatin1String(name))); });
        };
        journal(&HardKeyController::swcSeekDownShortPress, "swcSeekDownShortPress");
        journal(&HardKeyController::swcSeekUpShortPress, "swcSeekUpShortPress");
        journal(&HardKeyController::swcSeekDownLongPress, "swcSeekDownLongPress");
        journal(&HardKeyController::swcSeekUpLongPress, "swcSeekUpLongPress");
        journal(&HardKeyController::swcSeekDownLongRelease, "swcSeekDownLongRelease");
        journal(&HardKeyController::swcSeekUpLongRelease, "swcSeekUpLongRelease");
    }

    bool performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData) override
    {
        const bool isBare = data.isEmpty() && !vrEvent && !vrEventData.isValid();
        add(QStringLiteral("intent %1%2").arg(intent).arg(QLatin1String(isBare ? "" : " with data")));
        return true;
    }

    QStringList take()
    {
        m_entries += AL2HMIBridge::BridgeTester::takeCalls();
        return std::exchange(m_entries, QStringList());
    }

private:
    void add(const QString& entry)
    {
        m_entries += AL2HMIBridge::BridgeTester::takeCalls();
        m_entries += entry;
    }

    QStringList m_entries;
};

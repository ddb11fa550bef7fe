// SPDX-License-Identifier: MIT
#include "hmiintentmanager.h"

#include "decision.h"
#include "hmiintenthandler.h"
#include "logcategories.h"

#include <QCoreApplication>
#include <QJSValue>
#include <QMetaEnum>
#include <QMutexLocker>
#include <QQmlEngine>

namespace HmiCore {

namespace {

QString describe(int intent)
{
    const char* const name = QMetaEnum::fromType<HmiIntentManager::HmiIntent>().valueToKey(intent);
    return QStringLiteral("intent %1 %2").arg(intent).arg(QLatin1String(name ? name : "of a module"));
}

/// QML hands arrays and objects over in a wrapper that only its engine's thread may open.
bool isScriptValue(const QVariant& value)
{
    return value.userType() == qMetaTypeId<QJSValue>();
}

} // namespace

HmiIntentManager* HmiIntentManager::instance()
{
    static HmiIntentManager* const manager = new HmiIntentManager(QCoreApplication::instance());
    return manager;
}

QObject* HmiIntentManager::intentManagerProvider(QQmlEngine*, QJSEngine*)
{
    QQmlEngine::setObjectOwnership(instance(), QQmlEngine::CppOwnership);
    return instance();
}

HmiIntentManager::HmiIntentManager(QObject* parent)
    : QObject(parent)
{
}

HmiIntentManager::~HmiIntentManager() = default;

void HmiIntentManager::registerIntentHandler(HmiIntentHandler* handler)
{
    const QMutexLocker locker(&m_mutex);
    const QList<int> intents = handler->handledActions();
    for (const int intent : intents)
        m_handlers.insert(intent, handler);
}

bool HmiIntentManager::canPerformAction(int intent)
{
    const QMutexLocker locker(&m_mutex);
    return m_handlers.contains(intent);
}

bool HmiIntentManager::requestAction(int intent, const QList<QVariant>& data, bool exclusive, bool vrEvent,
                                     const QVariant& vrEventData)
{
    if (isScriptValue(vrEventData))
        return requestAction(intent, data, exclusive, vrEvent, vrEventData.value<QJSValue>().toVariant());

    Decision decision; // outlives the lock, so that it is written without it
    const QMutexLocker locker(&m_mutex);
    if (decision.isWanted())
        decision.begin(describe(intent) + QLatin1String(exclusive ? " (exclusive)" : ""));

    auto entry = m_handlers.constFind(intent);
    if (entry == m_handlers.constEnd()) {
        decision.conclude("no handler found");
        qCWarning(coreLog) << "No handler found for intent type:" << intent;
        Q_EMIT noHandlerFound(intent);
        return false;
    }

    Q_EMIT aboutToBeHandled(intent);
    bool isHandled = false;
    QString errors;
    for (; entry != m_handlers.constEnd() && entry.key() == intent; ++entry) {
        const QPointer<HmiIntentHandler>& handler = entry.value();
        if (!handler) {
            decision.note("a handler that is gone");
            continue;
        }
        // Only who and how are noted: the data holds what people dial and search for.
        if (decision.isWanted())
            decision.note(QString::fromLatin1(handler->metaObject()->className()));
        const bool performed = handler->performAction(intent, data, vrEvent, vrEventData);
        if (!performed) {
            const QString error = handler ? handler->lastError() : QString();
            if (!errors.isEmpty())
                errors += QLatin1Char('\n');
            errors += error;
            if (decision.isWanted())
                decision.note(QLatin1String("failed: ") + error);
        } else {
            decision.note("performed it");
        }
        isHandled = isHandled || performed;
        if (exclusive && isHandled)
            break;
    }

    decision.conclude(isHandled ? "handled" : "handling failed");
    if (isHandled) {
        Q_EMIT handled(intent);
    } else {
        qCWarning(coreLog) << "The IntentHandler failed to perform an action.\n"
                           << "Intent type:" << intent;
        Q_EMIT handlingFailed(intent, errors);
    }
    return isHandled;
}

HmiIntentMonitor* HmiIntentManager::intentMonitor(int intent)
{
    const QMutexLocker locker(&m_mutex);
    if (HmiIntentMonitor* const monitor = m_monitors.value(intent))
        return monitor;
    const QList<QPointer<HmiIntentHandler>> handlers = m_handlers.values(intent);
    if (handlers.isEmpty()) {
        qCWarning(coreLog) << "Not a handled intent type:" << intent;
        return nullptr;
    }
    auto* const monitor = new HmiIntentMonitor(intent, handlers, this);
    m_monitors.insert(intent, monitor);
    return monitor;
}

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#include "workerthreads.h"

#include "logcategories.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QHash>
#include <QPointer>
#include <QThread>

#include <utility>

namespace HmiCore {

namespace {

constexpr int grace = 500; // ms, for all threads together

using Workers = QHash<QThread*, QPointer<QObject>>;

bool endIsAwaited = false;

/// Never destroyed: a thread that was left behind may be found in it to the very end.
Workers& workers()
{
    static auto* const s_workers = new Workers;
    return *s_workers;
}

void endAll()
{
    endIsAwaited = false;
    const Workers ending = workers();
    for (auto it = ending.cbegin(); it != ending.cend(); ++it)
        it.key()->quit();
    const QDeadlineTimer deadline(grace);
    for (auto it = ending.cbegin(); it != ending.cend(); ++it) {
        if (!it.key()->wait(deadline)) {
            qCWarning(coreLog) << "An engine still works at the end of the application; its thread is left behind.";
            continue;
        }
        delete it.value();
        delete it.key();
    }
    workers().clear();
}

} // namespace

void WorkerThreads::add(QThread* thread, QObject* worker)
{
    if (!std::exchange(endIsAwaited, true))
        qAddPostRoutine(&endAll);
    workers().insert(thread, worker);
    QObject::connect(thread, &QObject::destroyed, [thread] { workers().remove(thread); });
}

} // namespace HmiCore

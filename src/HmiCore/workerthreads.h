// SPDX-License-Identifier: MIT
#pragma once

#include <QtGlobal>

QT_BEGIN_NAMESPACE
class QObject;
class QThread;
QT_END_NAMESPACE

namespace HmiCore {

/// The threads in which recognizers' workers live. Whoever destroys a recognizer does not wait for its thread; the
/// application does when it ends, since static data of the process must not go away under a thread that runs.
namespace WorkerThreads {

/// Takes both over: the worker and then the thread are destroyed with the application at the latest, or left as they are if
/// the thread still works after a grace of half a second. They may be gone before. GUI thread only.
void add(QThread* thread, QObject* worker);

} // namespace WorkerThreads

} // namespace HmiCore

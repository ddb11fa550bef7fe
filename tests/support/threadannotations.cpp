// SPDX-License-Identifier: MIT
// Qt is not built with the thread sanitizer: its mutexes, posted events and threads order nothing in the sanitizer's
// eyes. The functions below stand before those of Qt and of the C library in an executable. They do the same and tell
// the sanitizer what order follows. They say no more than what Qt promises: an order too many would hide races.
#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QMetaObject>
#include <QMutex>
#include <QThread>

#include <cstdint>
#include <dlfcn.h>
#include <memory>
#include <poll.h>
#include <pthread.h>
#include <sanitizer/tsan_interface.h>
#include <unistd.h>

extern "C" int __poll(pollfd* descriptors, nfds_t count, int milliseconds); // the C library's, whoever replaces poll()

namespace {

template <typename Function>
Function replaced(const char* symbol)
{
    return reinterpret_cast<Function>(::dlsym(RTLD_NEXT, symbol));
}

/// What stands for the queue of a thread. Threads may share one, which at worst hides a race.
void* queueOf(const QThread* thread)
{
    static std::uint64_t queues[256];
    return &queues[(reinterpret_cast<std::uintptr_t>(thread) >> 4) % std::size(queues)];
}

/// What stands for all queues: who emits a signal does not know where the receivers live.
std::uint64_t signalQueue;

void posted(const QObject* receiver)
{
    if (receiver)
        __tsan_release(queueOf(receiver->thread()));
}

bool delivered(void** call)
{
    __tsan_acquire(queueOf(static_cast<QObject*>(*call)->thread()));
    __tsan_acquire(&signalQueue);
    return false; // Qt is to go on
}

[[maybe_unused]] const bool deliveriesAreSeen = QInternal::registerCallback(QInternal::EventNotifyCallback, delivered);

/// Calls a function that another thread posted, or that is connected to a signal of one. Qt counts the references of its object where the sanitizer does not see
/// it: whichever thread lets go last destroys the function, after the call.
class PostedCall : public QtPrivate::QSlotObjectBase
{
public:
    explicit PostedCall(QtPrivate::QSlotObjectBase* function)
        : QSlotObjectBase(&PostedCall::operate)
        , m_function(function)
    {
    }

private:
    static void operate(int operation, QSlotObjectBase* base, QObject* receiver, void** arguments, bool* equal)
    {
        auto* const self = static_cast<PostedCall*>(base);
        if (operation == Call) {
            self->m_function->call(receiver, arguments);
            __tsan_release(self);
        } else if (operation == Destroy) {
            __tsan_acquire(self);
            self->m_function->destroyIfLastRef();
            delete self;
        } else if (operation == Compare) {
            *equal = self->m_function->compare(arguments);
        }
    }

    QtPrivate::QSlotObjectBase* m_function;
};

struct Start
{
    void* (*function)(void*);
    void* argument;
};

/// What the thread was started with; nothing in the first thread. For Qt's it is the QThread.
thread_local void* startedWith = nullptr;

void* runStarted(void* data)
{
    auto start = std::unique_ptr<Start>(static_cast<Start*>(data));
    const auto function = start->function;
    startedWith = start->argument;
    start.reset(); // not left to the unwinding of a thread that is terminated
    return function(startedWith);
}

} // namespace

// Locks.

void QMutex::lock() noexcept
{
    static const auto next = replaced<void (*)(QMutex*)>("_ZN6QMutex4lockEv");
    next(this);
    __tsan_acquire(this);
}

bool QMutex::tryLock(int timeout) noexcept
{
    static const auto next = replaced<bool (*)(QMutex*, int)>("_ZN6QMutex7tryLockEi");
    const bool locked = next(this, timeout);
    if (locked)
        __tsan_acquire(this);
    return locked;
}

void QMutex::unlock() noexcept
{
    static const auto next = replaced<void (*)(QMutex*)>("_ZN6QMutex6unlockEv");
    __tsan_release(this);
    next(this);
}

// Posted events, and signals and calls that become such.

void QCoreApplication::postEvent(QObject* receiver, QEvent* event, int priority)
{
    static const auto next =
        replaced<void (*)(QObject*, QEvent*, int)>("_ZN16QCoreApplication9postEventEP7QObjectP6QEventi");
    posted(receiver);
    next(receiver, event, priority);
}

void QObject::deleteLater()
{
    static const auto next = replaced<void (*)(QObject*)>("_ZN7QObject11deleteLaterEv");
    posted(this);
    next(this);
}

bool QMetaObject::invokeMethodImpl(QObject* object, QtPrivate::QSlotObjectBase* slot, Qt::ConnectionType type,
                                   void* result)
{
    static const auto next = replaced<bool (*)(QObject*, QtPrivate::QSlotObjectBase*, Qt::ConnectionType, void*)>(
        "_ZN11QMetaObject16invokeMethodImplEP7QObjectPN9QtPrivate15QSlotObjectBaseEN2Qt14ConnectionTypeEPv");
    auto* const call = new PostedCall(slot); // Qt's from here on
    posted(object);
    return next(object, call, type, result);
}

QMetaObject::Connection QObject::connectImpl(const QObject* sender, void** signal, const QObject* receiver,
                                             void** function, QtPrivate::QSlotObjectBase* slot, Qt::ConnectionType type,
                                             const int* types, const QMetaObject* senderType)
{
    static const auto next = replaced<QMetaObject::Connection (*)(const QObject*, void**, const QObject*, void**,
                                                                  QtPrivate::QSlotObjectBase*, Qt::ConnectionType,
                                                                  const int*, const QMetaObject*)>(
        "_ZN7QObject11connectImplEPKS_PPvS1_S3_PN9QtPrivate15QSlotObjectBaseEN2Qt14ConnectionTypeEPKiPK11QMetaObject");
    return next(sender, signal, receiver, function, new PostedCall(slot), type, types, senderType); // Qt's from here on
}

void QMetaObject::activate(QObject* sender, const QMetaObject* type, int signal, void** arguments)
{
    static const auto next =
        replaced<void (*)(QObject*, const QMetaObject*, int, void**)>("_ZN11QMetaObject8activateEP7QObjectPKS_iPPv");
    __tsan_release(&signalQueue);
    next(sender, type, signal, arguments);
}

// Threads. That they start is seen because it is this executable, not Qt, that calls the sanitizer's pthread_create().

extern "C" int pthread_create(pthread_t* thread, const pthread_attr_t* attributes, void* (*function)(void*),
                              void* argument)
{
    static const auto next = replaced<decltype(&pthread_create)>("pthread_create");
    auto start = std::make_unique<Start>(Start{function, argument});
    const int failure = next(thread, attributes, runStarted, start.get());
    if (!failure)
        start.release(); // the thread's
    return failure;
}

/// The last that Qt calls in a thread, terminated or not, before wait() returns elsewhere.
extern "C" int pthread_cond_broadcast(pthread_cond_t* condition) noexcept
{
    static const auto next = replaced<decltype(&pthread_cond_broadcast)>("pthread_cond_broadcast");
    if (startedWith)
        __tsan_release(startedWith);
    return next(condition);
}

bool QThread::wait(QDeadlineTimer deadline)
{
    static const auto next = replaced<bool (*)(QThread*, QDeadlineTimer)>("_ZN7QThread4waitE14QDeadlineTimer");
    const bool ended = next(this, deadline);
    if (ended)
        __tsan_acquire(this);
    return ended;
}

bool QThread::wait(unsigned long milliseconds)
{
    static const auto next = replaced<bool (*)(QThread*, unsigned long)>("_ZN7QThread4waitEm");
    const bool ended = next(this, milliseconds);
    if (ended)
        __tsan_acquire(this);
    return ended;
}

bool QThread::isFinished() const
{
    static const auto next = replaced<bool (*)(const QThread*)>("_ZNK7QThread10isFinishedEv");
    const bool ended = next(this);
    if (ended)
        __tsan_acquire(const_cast<QThread*>(this));
    return ended;
}

/// A thread that is terminated here never returns to the sanitizer's poll(), which would go on to ignore all that the
/// thread locks and unlocks while it is unwound. The first thread is not terminated; there it is the sanitizer's poll()
/// that lets the handlers of signals run.
extern "C" int poll(pollfd* descriptors, nfds_t count, int milliseconds)
{
    static const auto next = replaced<decltype(&poll)>("poll");
    return startedWith ? __poll(descriptors, count, milliseconds) : next(descriptors, count, milliseconds);
}

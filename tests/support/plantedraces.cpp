// SPDX-License-Identifier: MIT
// Runs one of the cases below, named by the argument. Those of `racy` the thread sanitizer has to report, those of
// `orderly` it must not: this shows that our set-up of it is neither blind nor full of false alarms.
#include <QCoreApplication>
#include <QEvent>
#include <QMutex>
#include <QThread>

#include <atomic>
#include <cstdio>
#include <cstring>
#include <functional>
#include <map>
#include <memory>
#include <mutex>
#include <poll.h>
#include <string>
#include <thread>

namespace {

struct Shared
{
    int number = 0;
    char bytes[64] = {};
    std::size_t size = sizeof bytes; // known only at run time, or else the compiler does it without the C library
    QMutex qtMutex;
    std::mutex mutex;
};

/// Lets a thread wait for another without the order that would hide the race between them.
class Meeting
{
public:
    void arrive() { m_arrived.store(true, std::memory_order_relaxed); }
    void await() const
    {
        while (!m_arrived.load(std::memory_order_relaxed))
            ::poll(nullptr, 0, 1);
    }

private:
    std::atomic<bool> m_arrived{false};
};

/// Calls what it was made with when an event arrives, in the first thread.
class Receiver : public QObject
{
public:
    explicit Receiver(std::function<void()> action)
        : m_action(std::move(action))
    {
    }
    bool event(QEvent*) override
    {
        m_action();
        QCoreApplication::quit();
        return true;
    }

private:
    std::function<void()> m_action;
};

class Sender : public QObject
{
    Q_OBJECT

Q_SIGNALS:
    void sent();
};

/// Dies by termination, in poll() and nowhere else. Then it does what it was made with.
class Endless : public QThread
{
public:
    explicit Endless(std::function<void()> action)
        : m_action(std::move(action))
    {
    }
    Meeting waiting;

protected:
    void run() override
    {
        setTerminationEnabled(false);
        struct Unwound
        {
            std::function<void()>& action;
            ~Unwound() { action(); }
        } const unwound{m_action};
        waiting.arrive();
        setTerminationEnabled(true);
        ::poll(nullptr, 0, -1);
    }

private:
    std::function<void()> m_action;
};

/// What two threads do, the second when the first has done.
void inTwoThreads(const std::function<void()>& first, const std::function<void()>& second)
{
    Meeting done;
    const std::unique_ptr<QThread> one(QThread::create([&] {
        first();
        done.arrive();
    }));
    const std::unique_ptr<QThread> two(QThread::create([&] {
        done.await();
        second();
    }));
    one->start();
    two->start();
    one->wait();
    two->wait();
}

/// A thread posts an event, does `after`, and ends when the first thread has received the event.
void throughAnEvent(const std::function<void()>& before, const std::function<void()>& after,
                    const std::function<void()>& received)
{
    Meeting done;
    Receiver receiver([&] {
        done.await();
        received();
    });
    const std::unique_ptr<QThread> thread(QThread::create([&] {
        before();
        QCoreApplication::postEvent(&receiver, new QEvent(QEvent::User));
        after();
        done.arrive();
    }));
    thread->start();
    QCoreApplication::exec();
    thread->wait();
}

void terminated(const std::function<void()>& unwinding, const std::function<void()>& meanwhile,
                const std::function<void()>& after)
{
    Endless thread(unwinding);
    thread.start();
    thread.waiting.await();
    thread.terminate();
    meanwhile();
    thread.wait();
    after();
}

using Case = std::function<void(Shared&)>;

void nothing() {}

const std::map<std::string, Case> racy{
    {"without-lock", [](Shared& s) { inTwoThreads([&] { ++s.number; }, [&] { ++s.number; }); }},
    {"lock-on-one-side",
     [](Shared& s) {
         inTwoThreads(
             [&] {
                 const QMutexLocker lock(&s.qtMutex);
                 ++s.number;
             },
             [&] { ++s.number; });
     }},
    {"different-locks",
     [](Shared& s) {
         inTwoThreads(
             [&] {
                 const QMutexLocker lock(&s.qtMutex);
                 ++s.number;
             },
             [&] {
                 const std::lock_guard<std::mutex> lock(s.mutex);
                 ++s.number;
             });
     }},
    {"through-the-c-library",
     [](Shared& s) {
         inTwoThreads([&] { std::memset(s.bytes, 1, s.size); }, [&] { std::memset(s.bytes, 0, s.size); });
     }},
    {"touched-after-posting",
     [](Shared& s) {
         throughAnEvent(
             nothing, [&] { ++s.number; }, [&] { ++s.number; });
     }},
    {"before-the-wait", [](Shared& s) { terminated([&] { ++s.number; }, [&] { ++s.number; }, nothing); }},
    {"started-too-early",
     [](Shared& s) {
         const std::unique_ptr<QThread> thread(QThread::create([&] { ++s.number; }));
         thread->start();
         ++s.number;
         thread->wait();
     }},
};

const std::map<std::string, Case> orderly{
    {"mutex",
     [](Shared& s) {
         const auto count = [&] {
             const QMutexLocker lock(&s.qtMutex);
             ++s.number;
         };
         inTwoThreads(count, count);
     }},
    {"try-lock",
     [](Shared& s) {
         const auto count = [&] {
             while (!s.qtMutex.tryLock()) {
             }
             ++s.number;
             s.qtMutex.unlock();
         };
         inTwoThreads(count, count);
     }},
    {"posted-event", [](Shared& s) { throughAnEvent([&] { ++s.number; }, nothing, [&] { ++s.number; }); }},
    {"queued-call",
     [](Shared& s) {
         QThread thread;
         QObject receiver;
         receiver.moveToThread(&thread);
         thread.start();
         ++s.number;
         const auto owned = std::make_shared<int>(0);
         for (int i = 0; i < 100; ++i)
             QMetaObject::invokeMethod(
                 &receiver, [owned, i] { *owned = i; }, Qt::QueuedConnection);
         QMetaObject::invokeMethod(
             &receiver,
             [&] {
                 ++s.number;
                 thread.quit();
             },
             Qt::QueuedConnection);
         thread.wait();
         ++s.number;
     }},
    {"queued-signal",
     [](Shared& s) {
         QThread thread;
         Sender sender;
         QObject receiver;
         receiver.moveToThread(&thread);
         QObject::connect(&sender, &Sender::sent, &receiver, [&] {
             ++s.number;
             thread.quit();
         });
         thread.start();
         ++s.number;
         Q_EMIT sender.sent();
         thread.wait();
         ++s.number;
     }},
    {"termination",
     [](Shared& s) {
         for (int cycle = 0; cycle < 50; ++cycle) {
             const auto count = [&] {
                 const std::lock_guard<std::mutex> lock(s.mutex);
                 ++s.number;
             };
             terminated(count, count, [&] { ++s.number; });
         }
     }},
};

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication app(argc, argv);
    const std::string name = argc > 1 ? argv[1] : "";
    for (const auto* const cases : {&racy, &orderly}) {
        const auto found = cases->find(name);
        if (found == cases->end())
            continue;
        Shared shared;
        found->second(shared);
        return 0;
    }
    std::fprintf(stderr, "no case is named '%s'\n", name.c_str());
    return 2;
}

#include "plantedraces.moc"

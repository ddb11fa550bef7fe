// SPDX-License-Identifier: MIT
#include <HmiVehicle/endsignals.h>

#include <QCoreApplication>
#include <QTest>
#include <QTimer>

#include <csignal>

using HmiVehicle::EndSignals;

class EndSignalsTest : public QObject
{
    Q_OBJECT

    static constexpr int notEnded = 1;

    static int runEventLoop()
    {
        QTimer deadline;
        QObject::connect(&deadline, &QTimer::timeout, [] { QCoreApplication::exit(notEnded); });
        deadline.start(10000);
        return QCoreApplication::exec();
    }

private Q_SLOTS:
    void aSignalEndsTheEventLoop_data()
    {
        QTest::addColumn<int>("signal");
        QTest::newRow("SIGINT") << SIGINT;
        QTest::newRow("SIGTERM") << SIGTERM;
    }

    void aSignalEndsTheEventLoop()
    {
        QFETCH(int, signal);
        EndSignals signalsToEnd;
        signalsToEnd.quitEventLoop();
        QTimer::singleShot(0,
                           [signal] { ::raise(signal); }); // to this thread: the test's others do not hold signals back
        QCOMPARE(runEventLoop(), 0);
        takeBack(signal);
    }

    void aSignalThatCameBeforeIsNotLost()
    {
        EndSignals signalsToEnd;
        ::raise(SIGTERM);
        signalsToEnd.quitEventLoop();
        QCOMPARE(runEventLoop(), 0);
        takeBack(SIGTERM);
    }

private:
    /// What ended the loop still waits, and would end the next.
    static void takeBack(int signal)
    {
        sigset_t waiting;
        sigemptyset(&waiting);
        sigaddset(&waiting, signal);
        int taken = 0;
        QCOMPARE(::sigwait(&waiting, &taken), 0);
        QCOMPARE(taken, signal);
    }
};

QTEST_GUILESS_MAIN(EndSignalsTest)
#include "tst_endsignals.moc"

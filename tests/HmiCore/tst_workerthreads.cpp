// SPDX-License-Identifier: MIT
#include "fakerecognizer.h"

#include <QCoreApplication>
#include <QTest>

#include <vector>

namespace {

using Threads = QList<QPointer<QThread>>;

int programArguments = 1;
char programName[] = "tst_workerthreads";
char* programArgument[] = {programName, nullptr};

/// In which thread the recognizer works; it has worked there.
QPointer<QThread> threadOf(FakeRecognizer& recognizer)
{
    QPointer<QThread> thread;
    QObject::connect(&recognizer, &FakeRecognizer::done, &recognizer,
                     [&thread](const QString&, QThread* worked) { thread = worked; });
    recognizer.processStrokes();
    return QTest::qWaitFor([&thread] { return !thread.isNull(); }) ? thread : nullptr;
}

} // namespace

/// There is no application but that of each test: what is looked at is what its end leaves.
class WorkerThreadsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void endWithTheApplicationWhetherOrNotTheirRecognizerDoes()
    {
        std::vector<std::unique_ptr<FakeRecognizer>> outliving;
        Threads threads;
        {
            QCoreApplication application(programArguments, programArgument);
            for (int i = 0; i < 20; ++i) {
                auto recognizer = std::make_unique<FakeRecognizer>();
                threads += threadOf(*recognizer);
                QVERIFY(threads.constLast());
                if (i % 2 == 0)
                    outliving.push_back(std::move(recognizer));
            }
        }
        for (const QPointer<QThread>& thread : std::as_const(threads))
            QVERIFY(thread.isNull());
        for (const auto& recognizer : outliving)
            recognizer->processStrokes(); // nobody is there to do it
    }

    void endBeforeTheyHaveBegun()
    {
        for (int round = 0; round < 50; ++round) {
            QCoreApplication application(programArguments, programArgument);
            const FakeRecognizer recognizers[4];
            FakeRecognizer destroyedAtOnce;
        }
    }

    void oneWhoseEngineHangsIsLeftBehind()
    {
        auto work = std::make_shared<Work>();
        work->waits = true;
        std::unique_ptr<FakeRecognizer> recognizer;
        QTest::ignoreMessage(QtWarningMsg,
                             "An engine still works at the end of the application; its thread is left behind.");
        {
            QCoreApplication application(programArguments, programArgument);
            recognizer = std::make_unique<FakeRecognizer>(work);
            recognizer->processStrokes();
            work->begun.acquire();
        }
        QCOMPARE(work->finished, 0);

        QSemaphore ended;
        QObject::connect(recognizer.get(), &FakeRecognizer::done, [&ended] { ended.release(); });
        work->mayEnd.release();
        QVERIFY(ended.tryAcquire(1, 10000));
    }

    void nextApplicationWaitsForItsOwn()
    {
        for (int round = 0; round < 2; ++round) {
            FakeRecognizer* recognizer = nullptr;
            QPointer<QThread> thread;
            {
                QCoreApplication application(programArguments, programArgument);
                recognizer = new FakeRecognizer;
                thread = threadOf(*recognizer);
                QVERIFY(thread);
            }
            QVERIFY(thread.isNull());
            delete recognizer;
        }
    }
};

QTEST_APPLESS_MAIN(WorkerThreadsTest)
#include "tst_workerthreads.moc"

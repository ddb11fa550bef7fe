// SPDX-License-Identifier: MIT
#include "fakerecognizer.h"

#include <QCoreApplication>
#include <QTest>

#include <future>
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
                if (i % 2 == 0) {
                    outliving.push_back(std::move(recognizer));
                } else {
                    const QPointer<FakeRecognizer> destroyed(recognizer.release());
                    destroyed->deleteLater(); // its thread may still be about to leave the operation
                    QTRY_VERIFY(!destroyed);
                }
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
        std::promise<QThread*> ended;
        QTest::ignoreMessage(QtWarningMsg,
                             "An engine still works at the end of the application; its thread is left behind.");
        {
            QCoreApplication application(programArguments, programArgument);
            recognizer = std::make_unique<FakeRecognizer>(work);
            QObject::connect(recognizer.get(), &FakeRecognizer::done,
                             [&ended](const QString&, QThread* thread) { ended.set_value(thread); });
            recognizer->processStrokes();
            work->begun.acquire();
        }
        QCOMPARE(work->finished, 0);

        work->mayEnd.release();
        auto result = ended.get_future();
        QVERIFY(result.wait_for(std::chrono::seconds(10)) == std::future_status::ready);
        QThread* const leftBehind = result.get();
        QVERIFY(leftBehind->wait(10000)); // it was told to end
        delete leftBehind;
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

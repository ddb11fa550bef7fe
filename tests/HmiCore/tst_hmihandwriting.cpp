// SPDX-License-Identifier: MIT
#include "fakerecognizer.h"
#include "logcapture.h"

#include <HmiCore/DummyRecognizer>
#include <HmiCore/HmiHandwriting>
#include <HmiCore/HmiHandwritingRecognizerFactory>

#include <QPointer>
#include <QSignalSpy>
#include <QTest>

#include <optional>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

class EngineFactory : public HmiHandwritingRecognizerFactory
{
public:
    EngineFactory()
        : HmiHandwritingRecognizerFactory(nullptr)
    {
    }
    HmiHandwritingRecognizer* createRecognizer(QObject* parent) override
    {
        return fails ? nullptr : new FakeRecognizer(work, parent);
    }
    bool fails = false;
    std::shared_ptr<Work> work = std::make_shared<Work>();
};

} // namespace

class HmiHandwritingTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;

private Q_SLOTS:
    void init() { log.emplace(); }
    void cleanup()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        log.reset();
    }

    void withoutALanguageThereIsADummy()
    {
        HmiHandwriting handwriting;
        QSignalSpy changes(&handwriting, &HmiHandwriting::recognizerChanged);
        QCOMPARE(handwriting.language(), 0);
        HmiHandwritingRecognizer* const dummy = handwriting.recognizer();
        QVERIFY(qobject_cast<DummyRecognizer*>(dummy));
        QCOMPARE(dummy->parent(), &handwriting);
        QCOMPARE(handwriting.recognizer(), dummy);
        QCOMPARE(changes.size(), 0);
    }

    void theLanguageChoosesTheRecognizer()
    {
        EngineFactory factory;
        HmiHandwriting::registerFactory(101, &factory);
        HmiHandwriting handwriting;
        QStringList told;
        connect(&handwriting, &HmiHandwriting::languageChanged, this,
                [&](int language) { told.append(QStringLiteral("language %1").arg(language)); });
        connect(&handwriting, &HmiHandwriting::recognizerChanged, this, [&](HmiHandwritingRecognizer* recognizer) {
            told.append(text(recognizer->metaObject()->className()));
        });
        const QPointer<HmiHandwritingRecognizer> dummy = handwriting.recognizer();
        QVERIFY(handwriting.setProperty("language", 101));
        QCOMPARE(told, QStringList({text("language 101"), text("FakeRecognizer")}));
        QVERIFY(dummy); // bindings may still look at it
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!dummy);
        handwriting.setLanguage(101);
        QCOMPARE(told.size(), 2);

        told.clear();
        factory.fails = true;
        HmiHandwriting other;
        other.setLanguage(101);
        QVERIFY(qobject_cast<DummyRecognizer*>(other.recognizer()));
        QCOMPARE(log->take(core, QtWarningMsg),
                 {text("void HmiCore::HmiHandwriting::updateRecognizer() Engine creation failed.")});
    }

    void withoutAFactoryThereIsADummy()
    {
        HmiHandwriting handwriting;
        QSignalSpy changes(&handwriting, &HmiHandwriting::recognizerChanged);
        {
            EngineFactory factory;
            HmiHandwriting::registerFactory(102, &factory);
        }
        handwriting.setLanguage(102);
        handwriting.setLanguage(103);
        handwriting.setLanguage(0);
        QCOMPARE(changes.size(), 3);
        QCOMPARE(log->take(core, QtWarningMsg),
                 QStringList({text("Unsupported language. 102"), text("Unsupported language. 103"),
                              text("Unsupported language. 0")}));
    }

    void theFirstFactoryOfALanguageStays()
    {
        EngineFactory first;
        EngineFactory second;
        HmiHandwriting::registerFactory(104, nullptr);
        HmiHandwriting::registerFactory(104, &first);
        HmiHandwriting::registerFactory(104, nullptr);
        HmiHandwriting::registerFactory(104, &second);
        const QStringList warnings = log->take(core, QtWarningMsg);
        QCOMPARE(warnings.size(), 2);
        for (const QString& warning : warnings)
            QVERIFY(warning.startsWith(
                text("Handwriting recognizer factory registration failed, duplicated language. 104 ")));
        second.fails = true;
        HmiHandwriting handwriting;
        handwriting.setLanguage(104);
        QVERIFY(qobject_cast<FakeRecognizer*>(handwriting.recognizer()));
    }

    void languagesChangeWhileTheEngineWorks()
    {
        EngineFactory factory;
        HmiHandwriting::registerFactory(105, &factory);
        auto handwriting = std::make_unique<HmiHandwriting>();
        handwriting->setLanguage(105);
        factory.work->waits = true;
        handwriting->recognizer()->addStrokes(stroke({{1, 1}}));
        QVERIFY(factory.work->begun.tryAcquire(1, 20000));
        handwriting->setLanguage(0);
        QCOMPARE(log->take(core, QtWarningMsg).size(), 1);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCOMPARE(factory.work->destroyed.load(), 0);

        // The pad goes while another engine works.
        handwriting->setLanguage(105);
        handwriting->recognizer()->processStrokes();
        QVERIFY(factory.work->begun.tryAcquire(1, 20000));
        handwriting.reset();
        QCOMPARE(factory.work->destroyed.load(), 0);
        factory.work->waits = false;
        factory.work->mayEnd.release(2);
        QTRY_COMPARE(factory.work->destroyed.load(), 2);
    }

    void aPadTakesItsRestingRecognizerAlong()
    {
        auto handwriting = std::make_unique<HmiHandwriting>();
        const QPointer<HmiHandwritingRecognizer> recognizer = handwriting->recognizer();
        handwriting.reset();
        QVERIFY(!recognizer);
    }
};

QTEST_GUILESS_MAIN(HmiHandwritingTest)
#include "tst_hmihandwriting.moc"

// SPDX-License-Identifier: MIT
#include "accuracy.h"
#include "engineplugin.h"
#include "handwritingenginetest.h"
#include "zinniafactory.h"

#include <HmiCore/HmiHandwriting>

#include <QFile>
#include <QFileInfo>
#include <QTemporaryFile>
#include <QTest>

using namespace HmiCore;

namespace {

const QString simplified = QStringLiteral(ZINNIA_MODELS "/handwriting-zh_CN.model");
const QString japanese = QStringLiteral(ZINNIA_MODELS "/handwriting-ja.model");
const QString zinniaLog = QStringLiteral("headunit.inputmethods.zinnia");

Zinnia::ZinniaFactory simplifiedFactory(simplified);
Zinnia::ZinniaFactory japaneseFactory(japanese);

Recognizer recognizerOf(const QString& model)
{
    Zinnia::ZinniaFactory factory(model);
    return Recognizer(factory.createRecognizer(nullptr));
}

} // namespace

class TestZinnia : public HandwritingEngineTest
{
    Q_OBJECT

public:
    TestZinnia()
        : HandwritingEngineTest(&simplifiedFactory, STROKES "/simplified.txt", "大", "口")
    {
    }

private Q_SLOTS:
    void writtenCharactersAreRecognized_data()
    {
        QTest::addColumn<QString>("model");
        QTest::addColumn<QString>("file");
        QTest::addColumn<int>("count");
        QTest::addColumn<int>("first");
        QTest::addColumn<int>("amongEight");
        QTest::newRow("Simplified") << simplified << QStringLiteral(STROKES "/simplified.txt") << 60 << 65 << 75;
        QTest::newRow("Traditional") << japanese << QStringLiteral(STROKES "/traditional.txt") << 30 << 58 << 70;
    }

    /// So well at least, in per cent.
    void writtenCharactersAreRecognized()
    {
        QFETCH(QString, model);
        QFETCH(QString, file);
        QFETCH(int, count);
        QFETCH(int, first);
        QFETCH(int, amongEight);
        QString error;
        const QList<Recording> written = Recordings::written(file, &error);
        QCOMPARE(error, QString());
        QVERIFY(written.size() >= count);
        const Recognizer recognizer = recognizerOf(model);
        QVERIFY(recognizer);
        const Accuracy accuracy = Accuracy::of(*recognizer, written);
        QVERIFY2(accuracy.first * 100 >= accuracy.count * first, accuracy.missesAsText().toUtf8().constData());
        QVERIFY2(accuracy.amongEight * 100 >= accuracy.count * amongEight,
                 accuracy.missesAsText().toUtf8().constData());
    }

    void offersNoMoreThanTheModelHas()
    {
        const Recognizer recognizer = makeRecognizer();
        recognizer->setMaxCandidateCount(100000);
        recognizer->setStrokes(strokesOf(m_one));
        QTRY_VERIFY_WITH_TIMEOUT(recognizer->candidateCount() > 10, 30000);
        QVERIFY(recognizer->candidateCount() <= 6763);
    }

    void missingModelMakesNoRecognizer()
    {
        QVERIFY(!recognizerOf(QStringLiteral("no such model")));
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("Cannot read the model \"no such model\"")));
    }

    void brokenModelOffersNothing_data()
    {
        QTest::addColumn<int>("length");
        QTest::newRow("empty") << 0;
        QTest::newRow("beginning of a header") << 3;
        QTest::newRow("cut off") << 100000;
    }

    void brokenModelOffersNothing()
    {
        QFETCH(int, length);
        QFile model(simplified);
        QVERIFY(model.open(QIODevice::ReadOnly));
        QTemporaryFile file;
        QVERIFY(file.open());
        file.write(model.read(length));
        QVERIFY(file.flush());
        const Recognizer recognizer = recognizerOf(file.fileName());
        QVERIFY(recognizer);
        recognizer->setStrokes(strokesOf(m_one));
        QStringList warnings;
        QTRY_VERIFY_WITH_TIMEOUT(!(warnings += m_log->take(zinniaLog, QtWarningMsg)).isEmpty(), 30000);
        QCOMPARE(warnings.size(), 1); // however often it is needed
        QVERIFY2(warnings.at(0).startsWith(QStringLiteral("Cannot open the model \"%1\"").arg(file.fileName())),
                 qPrintable(warnings.at(0)));
        QCOMPARE(recognizer->candidates(), QStringList());
    }

    void pluginRegistersItsLanguages()
    {
        registerPlugin(QStringLiteral(PLUGIN_FILE),
                       {QStringLiteral("SimplifiedChinese"), QStringLiteral("TraditionalChinese")},
                       QStringLiteral("Latin"));
        if (QTest::currentTestFailed())
            return;
        for (const int language : {HmiHandwriting::SimplifiedChinese, HmiHandwriting::TraditionalChinese}) {
            HmiHandwriting handwriting;
            handwriting.setLanguage(language);
            handwriting.recognizer()->setStrokes(strokesOf(m_one));
            QTRY_VERIFY_WITH_TIMEOUT(handwriting.recognizer()->candidates().contains(m_one), 30000);
        }
    }
};

QTEST_GUILESS_MAIN(TestZinnia)
#include "tst_zinnia.moc"

// SPDX-License-Identifier: MIT
#include "accuracy.h"
#include "engineplugin.h"
#include "handwritingenginetest.h"
#include "latinfactory.h"
#include "latinmatcher.h"

#include <HmiCore/HmiHandwriting>

#include <QSet>
#include <QTest>

#include <algorithm>
#include <cmath>
#include <random>

using namespace HmiCore;

namespace {

Latin::LatinFactory factory;

/// Strokes in the grid of the templates, in which a pad's capitals are from 13 to 78 per cent.
QList<Latin::Stroke> inGrid(const QVariantList& strokes)
{
    QList<Latin::Stroke> all;
    for (const QVariant& stroke : strokes) {
        Latin::Stroke points;
        const QVariantList list = stroke.toList();
        for (const QVariant& point : list)
            points.append(QPointF(point.toPointF().x() / 65, (point.toPointF().y() - 13) / 65));
        all.append(points);
    }
    return all;
}

/// From -1 to 1, the same with every library.
double anyOf(std::mt19937& random)
{
    return double(random()) / double(std::mt19937::max()) * 2 - 1;
}

/// The same, tilted by up to 12 degrees, stretched by up to a fifth, and each point moved by up to 5 per cent of a capital.
QList<Latin::Stroke> unsteady(QList<Latin::Stroke> strokes, std::mt19937& random)
{
    const double tilt = anyOf(random) * 12 * M_PI / 180;
    const double stretched = 1 + anyOf(random) / 5;
    for (Latin::Stroke& stroke : strokes) {
        for (QPointF& point : stroke) {
            const QPointF from((point.x() - 0.5) * stretched, point.y() - 0.5);
            point = {from.x() * std::cos(tilt) - from.y() * std::sin(tilt) + 0.5 + anyOf(random) * 0.05,
                     from.x() * std::sin(tilt) + from.y() * std::cos(tilt) + 0.5 + anyOf(random) * 0.05};
        }
    }
    return strokes;
}

} // namespace

class TestLatin : public HandwritingEngineTest
{
    Q_OBJECT

public:
    TestLatin()
        : HandwritingEngineTest(&factory, STROKES "/latin-upright.txt", "A", "k")
    {
    }

private Q_SLOTS:
    void writtenCharactersAreRecognized_data()
    {
        QTest::addColumn<QString>("file");
        QTest::addColumn<int>("first");
        QTest::addColumn<int>("amongThree");
        QTest::addColumn<int>("amongEight");
        QTest::newRow("upright") << QStringLiteral(STROKES "/latin-upright.txt") << 74 << 77 << 78;
        QTest::newRow("slanted") << QStringLiteral(STROKES "/latin-slanted.txt") << 71 << 75 << 78;
    }

    void writtenCharactersAreRecognized()
    {
        QFETCH(QString, file);
        QFETCH(int, first);
        QFETCH(int, amongThree);
        QFETCH(int, amongEight);
        QString error;
        const QList<Recording> written = Recordings::written(file, &error);
        QCOMPARE(error, QString());
        QCOMPARE(written.size(), 79);
        const Recognizer recognizer = makeRecognizer();
        const Accuracy accuracy = Accuracy::of(*recognizer, written);
        const QByteArray missed = accuracy.missesAsText().toUtf8();
        QVERIFY2(accuracy.first >= first, missed.constData());
        QVERIFY2(accuracy.amongThree >= amongThree, missed.constData());
        QVERIFY2(accuracy.amongEight >= amongEight, missed.constData());
    }

    void unsteadyHandsAreUnderstood_data()
    {
        QTest::addColumn<QString>("file");
        QTest::addColumn<int>("first");
        QTest::addColumn<int>("amongThree");
        QTest::newRow("upright") << QStringLiteral(STROKES "/latin-upright.txt") << 88 << 94;
        QTest::newRow("slanted") << QStringLiteral(STROKES "/latin-slanted.txt") << 80 << 91;
    }

    /// So well at least, in per cent, when each character is tilted, stretched and shaken in five ways.
    void unsteadyHandsAreUnderstood()
    {
        QFETCH(QString, file);
        QFETCH(int, first);
        QFETCH(int, amongThree);
        QString error;
        const QList<Recording> written = Recordings::written(file, &error);
        QCOMPARE(error, QString());
        std::mt19937 random(1);
        Accuracy accuracy;
        for (int hand = 0; hand < 5; ++hand)
            for (const Recording& recording : written)
                accuracy.add(recording.meant, Latin::Matcher::candidates(unsteady(inGrid(recording.input), random), 8));
        const QByteArray missed =
            QByteArray::number(accuracy.first) + " first, " + QByteArray::number(accuracy.amongThree) + " among three, "
            + QByteArray::number(accuracy.amongEight) + " among eight of " + QByteArray::number(accuracy.count);
        QVERIFY2(accuracy.first * 100 >= accuracy.count * first, missed.constData());
        QVERIFY2(accuracy.amongThree * 100 >= accuracy.count * amongThree, missed.constData());
    }

    void everyCharacterIsTheFirstOfItsOwnTemplates()
    {
        const QList<Latin::Matcher::Template> all = Latin::Matcher::templates();
        QSet<QChar> characters;
        int first = 0;
        for (const Latin::Matcher::Template& entry : all) {
            characters.insert(entry.character);
            first += Latin::Matcher::candidates(entry.strokes, 1).value(0) == entry.character;
        }
        QCOMPARE(characters.size(), 83);
        QVERIFY2(first >= all.size() * 98 / 100, qPrintable(QStringLiteral("%1 of %2").arg(first).arg(all.size())));
    }

    /// Or the recordings would say nothing.
    void noRecordingIsATemplate()
    {
        const QList<Latin::Matcher::Template> templates = Latin::Matcher::templates();
        int compared = 0;
        for (const char* const file : {STROKES "/latin-upright.txt", STROKES "/latin-slanted.txt"}) {
            QString error;
            const QList<Recording> written = Recordings::written(QString::fromUtf8(file), &error);
            for (const Recording& recording : written) {
                if (recording.meant.size() == 1 && QStringLiteral(".,:;'\"!-").contains(recording.meant))
                    continue; // dots and short lines are all the same
                const Latin::PointCloud cloud(inGrid(recording.input));
                for (const Latin::Matcher::Template& entry : templates) {
                    ++compared;
                    QVERIFY2(cloud.distance(Latin::PointCloud(entry.strokes), 1) > 0.005,
                             qPrintable(recording.meant + QStringLiteral(" is a template of ") + entry.character));
                }
            }
        }
        QVERIFY(compared > 10000);
    }

    void capitalsAndSmallLettersDifferBySize_data()
    {
        QTest::addColumn<double>("scale");
        QTest::addColumn<QString>("letter");
        QTest::newRow("large") << 1.0 << QStringLiteral("S");
        QTest::newRow("small") << 0.6 << QStringLiteral("s");
    }

    void capitalsAndSmallLettersDifferBySize()
    {
        QFETCH(double, scale);
        QFETCH(QString, letter);
        QList<Latin::Stroke> strokes = inGrid(strokesOf(QStringLiteral("S")));
        for (Latin::Stroke& stroke : strokes)
            for (QPointF& point : stroke)
                point = {point.x() * scale, 1 - (1 - point.y()) * scale};
        const QStringList candidates = Latin::Matcher::candidates(strokes, 3);
        QCOMPARE(candidates.value(0), letter);
        QVERIFY(candidates.contains(QStringLiteral("S")) && candidates.contains(QStringLiteral("s")));
    }

    void directionAndOrderOfStrokesDoNotMatter()
    {
        for (const char letter : {'A', 'k', 'X', '4', '#'}) {
            const QList<Latin::Stroke> strokes = inGrid(strokesOf(QString(QLatin1Char(letter))));
            QList<Latin::Stroke> reversed;
            for (Latin::Stroke stroke : strokes) {
                std::reverse(stroke.begin(), stroke.end());
                reversed.prepend(stroke);
            }
            QCOMPARE(Latin::Matcher::candidates(reversed, 1), Latin::Matcher::candidates(strokes, 1));
        }
    }

    /// A circle is one on a pad of any shape.
    void shapeOfTheWritingAreaIsTakenIntoAccount_data()
    {
        QTest::addColumn<double>("width");
        QTest::newRow("wide") << 200.0;
        QTest::newRow("very wide") << 400.0;
        QTest::newRow("narrow") << 90.0;
    }

    void shapeOfTheWritingAreaIsTakenIntoAccount()
    {
        QFETCH(double, width);
        const Recognizer recognizer = makeRecognizer();
        recognizer->setInputWidth(width);
        for (const char letter : {'D', 'k', 'm', '8'}) {
            const QString character{QLatin1Char(letter)};
            QVariantList strokes;
            const QVariantList original = strokesOf(character);
            for (const QVariant& stroke : original) {
                QVariantList points;
                const QVariantList list = stroke.toList();
                for (const QVariant& point : list)
                    points.append(point.toPointF() + QPointF((width - 100) / 2, 0));
                strokes.append(QVariant(points));
            }
            recognizer->setStrokes(strokes);
            QTRY_COMPARE_WITH_TIMEOUT(recognizer->candidates().value(0), character, 30000);
        }
    }

    void pluginRegistersItsLanguage()
    {
        registerPlugin(QStringLiteral(PLUGIN_FILE), {QStringLiteral("Latin")}, QStringLiteral("SimplifiedChinese"));
        if (QTest::currentTestFailed())
            return;
        HmiHandwriting handwriting;
        handwriting.setLanguage(HmiHandwriting::Latin);
        handwriting.recognizer()->setStrokes(strokesOf(m_one));
        QTRY_COMPARE_WITH_TIMEOUT(handwriting.recognizer()->candidates().value(0), m_one, 30000);
    }
};

QTEST_GUILESS_MAIN(TestLatin)
#include "tst_latin.moc"

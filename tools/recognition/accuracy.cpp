// SPDX-License-Identifier: MIT
#include "accuracy.h"

#include <HmiCore/HmiComplexKeyboardEngine>
#include <HmiCore/HmiHandwritingRecognizer>

#include <QElapsedTimer>
#include <QEventLoop>
#include <QTimer>

#include <algorithm>
#include <functional>

using namespace HmiCore;

namespace {

constexpr int shown = 8;
constexpr int patience = 5000; // milliseconds; an engine that offers nothing says nothing

/// Lets the recognizer work until its candidates change.
void awaitCandidates(HmiHandwritingRecognizer& recognizer, const std::function<void()>& ask)
{
    QEventLoop loop;
    QObject::connect(&recognizer, &HmiHandwritingRecognizer::candidatesChanged, &loop, &QEventLoop::quit,
                     Qt::QueuedConnection);
    QTimer::singleShot(patience, &loop, &QEventLoop::quit);
    ask();
    loop.exec();
}

void clear(HmiHandwritingRecognizer& recognizer)
{
    const auto ask = [&recognizer] { recognizer.setStrokes({}); };
    if (recognizer.candidates().isEmpty())
        ask();
    else
        awaitCandidates(recognizer, ask);
}

} // namespace

void Accuracy::add(const QString& meant, const QStringList& offered)
{
    const int place = int(offered.indexOf(meant));
    const bool isOffered = place >= 0;
    ++count;
    first += place == 0;
    amongThree += isOffered && place < 3;
    amongEight += isOffered && place < 8;
    if (place != 0)
        misses.append({meant, offered.mid(0, shown)});
}

QString Accuracy::missesAsText() const
{
    QStringList lines;
    for (const Miss& miss : misses)
        lines.append(miss.meant + QStringLiteral(": ") + miss.offered.join(QLatin1Char(' ')));
    return lines.join(QLatin1Char('\n'));
}

Accuracy Accuracy::of(HmiHandwritingRecognizer& recognizer, const QList<Recording>& written)
{
    Accuracy accuracy;
    qint64 nanoseconds = 0;
    for (const Recording& recording : written) {
        clear(recognizer);
        QElapsedTimer timer;
        timer.start();
        awaitCandidates(recognizer, [&] { recognizer.setStrokes(recording.input); });
        nanoseconds += timer.nsecsElapsed();
        accuracy.add(recording.meant, recognizer.candidates());
    }
    clear(recognizer);
    accuracy.milliseconds = double(nanoseconds) / 1e6 / std::max(accuracy.count, 1);
    return accuracy;
}

Accuracy Accuracy::of(HmiComplexKeyboardEngine& engine, const QList<Recording>& typed)
{
    Accuracy accuracy;
    QElapsedTimer timer;
    qint64 nanoseconds = 0;
    for (const Recording& recording : typed) {
        engine.clearInput();
        timer.start();
        for (const QVariant& key : recording.input)
            engine.addInput(key);
        nanoseconds += timer.nsecsElapsed();
        accuracy.add(recording.meant, engine.candidates());
    }
    engine.clearInput();
    accuracy.milliseconds = double(nanoseconds) / 1e6 / std::max(accuracy.count, 1);
    return accuracy;
}

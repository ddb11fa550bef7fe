// SPDX-License-Identifier: MIT
#include "characterrecognizer.h"

#include <algorithm>

namespace InputMethods {

namespace {

constexpr int size = 100;               // of the writing area
constexpr int mostStrokes = 64;         // no character has as many
constexpr int mostPointsOfStroke = 128; // a hand writes fewer; bounds the work of the engine

QPoint inside(const QPoint& point)
{
    return {std::clamp(point.x(), 0, size), std::clamp(point.y(), 0, size)};
}

QList<QPoint> bounded(const QList<QPoint>& stroke)
{
    QList<QPoint> points;
    const qint64 count = std::min(int(stroke.size()), mostPointsOfStroke);
    for (qint64 i = 0; i < count; ++i)
        points.append(inside(stroke.at(count < 2 ? 0 : int(i * (stroke.size() - 1) / (count - 1)))));
    return points;
}

QList<QList<QPoint>> bounded(const QList<QList<QPoint>>& strokes)
{
    QList<QList<QPoint>> all;
    for (const QList<QPoint>& stroke : strokes)
        all.append(bounded(stroke));
    return all;
}

} // namespace

CharacterRecognizer::CharacterRecognizer(QObject* parent)
    : HmiHandwritingRecognizer(parent)
{
}

CharacterRecognizer::~CharacterRecognizer() = default;

/// Whatever is recognised comes through here; strokes() may have more by now.
QList<QList<QPoint>> CharacterRecognizer::normalize(const QList<QVariant>& strokes)
{
    m_recognized = strokes;
    return HmiHandwritingRecognizer::normalize(strokes);
}

void CharacterRecognizer::recognition(const QList<QList<QPoint>>& strokes)
{
    const bool isCharacter = !strokes.isEmpty() && strokes.size() <= mostStrokes;
    setCandidates(isCharacter ? candidatesFor(bounded(strokes), maxCandidateCount()) : QStringList());
}

void CharacterRecognizer::process()
{
    recognition(normalize(strokes()));
}

/// A stroke alone says nothing.
void CharacterRecognizer::newStrokePreProcessing(const QList<QPoint>& /*stroke*/)
{
    process();
}

void CharacterRecognizer::handleCandidateSelection(int index)
{
    if (index < 0 || index >= candidateCount())
        return;
    setCandidates(QStringList());
    const QVariantList done = m_recognized;
    QMetaObject::invokeMethod(
        this, [this, done] { removeStrokes(done); }, Qt::QueuedConnection);
}

/// In the GUI thread: the next character may have been begun, or others may have taken the place of all.
void CharacterRecognizer::removeStrokes(const QVariantList& first)
{
    const QVariantList all = strokes();
    if (all.mid(0, first.size()) == first)
        setStrokes(all.mid(first.size()));
}

} // namespace InputMethods

// SPDX-License-Identifier: MIT
#include "writtentext.h"

#include <HmiCore/DummyRecognizer>

#include <QPointF>

#include <algorithm>

using HmiCore::DummyRecognizer;
using HmiCore::HmiHandwriting;
using HmiCore::HmiHandwritingRecognizer;

namespace {

constexpr int pauseBetweenCharacters = 700; // ms; strokes of one character follow faster

} // namespace

WrittenText::WrittenText(QObject* parent)
    : TextComposer(parent)
{
    m_pause.setSingleShot(true);
    m_pause.setInterval(pauseBetweenCharacters);
    connect(&m_pause, &QTimer::timeout, this, &WrittenText::rest);
}

void WrittenText::setLanguage(int language)
{
    if (language == m_handwriting.language() && m_recognizer)
        return;
    drop();
    m_handwriting.setLanguage(language);
    follow();
}

void WrittenText::follow()
{
    if (m_recognizer)
        disconnect(m_recognizer, nullptr, this, nullptr);
    m_recognizer = m_handwriting.recognizer();
    m_recognizer->setInputWidth(m_boxWidth);
    m_recognizer->setInputHeight(m_height);
    connect(m_recognizer, &HmiHandwritingRecognizer::candidatesChanged, this, &WrittenText::present);
}

bool WrittenText::canWrite()
{
    return m_recognizer && !qobject_cast<DummyRecognizer*>(m_recognizer.data());
}

void WrittenText::setPadSize(double width, double height)
{
    m_boxes = height > 0 ? std::max(1, qRound(width / height)) : 1;
    m_boxWidth = width / m_boxes;
    m_height = height;
    if (!m_recognizer)
        return;
    m_recognizer->setInputWidth(m_boxWidth);
    m_recognizer->setInputHeight(m_height);
}

void WrittenText::beginStroke(double x)
{
    m_pause.stop();
    const int box = m_boxWidth > 0 ? int(x / m_boxWidth) : 0;
    const bool isNext = box != m_box || (m_rested && m_handwriting.language() == HmiHandwriting::Latin);
    if (isNext && m_isBegun)
        finish();
    m_box = box;
    m_rested = false;
}

void WrittenText::addStroke(const QVariantList& points)
{
    if (!m_recognizer || points.isEmpty())
        return;
    QVariantList stroke;
    for (const QVariant& point : points)
        stroke.append(point.toPointF() - QPointF(m_box * m_boxWidth, 0));
    m_isStale = false;
    m_isBegun = true;
    m_recognizer->addStrokes(QVariant(stroke));
    m_pause.start();
}

void WrittenText::rest()
{
    m_rested = true;
    if (m_recognizer)
        m_recognizer->processStrokes();
    Q_EMIT handRested();
}

void WrittenText::present(const QStringList& candidates)
{
    if (!m_isStale)
        show(candidates, candidates.value(0));
}

void WrittenText::select(int candidate)
{
    if (candidate < 0 || candidate >= candidates().size())
        return;
    const QString text = candidates().at(candidate);
    m_recognizer->selectCandidate(candidate); // the engine takes away the strokes that it was for
    clear();
    Q_EMIT committed(text);
}

bool WrittenText::takeBack()
{
    if (!m_isBegun)
        return false;
    drop();
    return true;
}

void WrittenText::finish()
{
    if (candidates().isEmpty())
        drop();
    else
        select(0);
}

void WrittenText::drop()
{
    if (m_recognizer)
        m_recognizer->setStrokes({});
    clear();
}

void WrittenText::clear()
{
    m_pause.stop();
    m_rested = false;
    m_isStale = true;
    m_isBegun = false;
    show({}, {});
    Q_EMIT padCleared();
}

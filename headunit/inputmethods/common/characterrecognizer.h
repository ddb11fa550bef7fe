// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiHandwritingRecognizer>

namespace InputMethods {

/// \brief The base of engines that recognise one character, anew with each stroke.
///
/// Candidates come with each stroke, whether it is added or all are set; processStrokes() asks for them again. Selecting a
/// candidate clears the candidates and the strokes that they were for; strokes that were begun since stay.
class CharacterRecognizer : public HmiCore::HmiHandwritingRecognizer
{
    Q_OBJECT

public:
    explicit CharacterRecognizer(QObject* parent);
    ~CharacterRecognizer() override;

    using HmiHandwritingRecognizer::normalize;
    QList<QList<QPoint>> normalize(const QList<QVariant>& strokes) override;
    void recognition(const QList<QList<QPoint>>& strokes) override;
    void process() override;
    void newStrokePreProcessing(const QList<QPoint>& stroke) override;
    void handleCandidateSelection(int index) override;

protected:
    /// \brief What the strokes may be, the most likely first; at most \a count, which is 1 at least. In the own thread.
    ///
    /// They are in per cent of the writing area, within it, and there are between 1 and 64 of them, of between 1 and 128
    /// points: of longer strokes only some, evenly, with both ends.
    virtual QStringList candidatesFor(const QList<QList<QPoint>>& strokes, int count) = 0;

private:
    void removeStrokes(const QVariantList& first);

    QVariantList m_recognized; ///< of the own thread: the strokes that the candidates are for
};

} // namespace InputMethods

// SPDX-License-Identifier: MIT
#pragma once

#include "recordings.h"

#include <QStringList>

namespace HmiCore {
class HmiComplexKeyboardEngine;
class HmiHandwritingRecognizer;
} // namespace HmiCore

/// How well an engine understood recordings.
struct Accuracy
{
    struct Miss
    {
        QString meant;
        QStringList offered; ///< the first ones
    };

    int count = 0;
    int first = 0;           ///< what was meant is the first candidate
    int amongThree = 0;      ///< it is one of the first three
    int amongEight = 0;      ///< it is one of the first eight
    double milliseconds = 0; ///< each, the whole way from the input to the candidates
    QList<Miss> misses;      ///< what was meant is not the first candidate

    /// \brief The misses, as a person reads them: "meant: what was offered, …".
    QString missesAsText() const;

    /// \brief Takes in one answer.
    void add(const QString& meant, const QStringList& offered);

    /// \brief What the recognizer offers for each, which has to be the current one of its language. Runs the event loop.
    static Accuracy of(HmiCore::HmiHandwritingRecognizer& recognizer, const QList<Recording>& written);
    /// \brief What the engine offers after the keys of each. Clears its input.
    static Accuracy of(HmiCore::HmiComplexKeyboardEngine& engine, const QList<Recording>& typed);
};

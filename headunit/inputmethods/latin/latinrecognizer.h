// SPDX-License-Identifier: MIT
#pragma once

#include "characterrecognizer.h"

namespace Latin {

/// \brief Recognises one Latin letter, digit or sign, anew with each stroke.
///
/// The writing area is taken for a line of text, of which capitals leave some room above and tails of letters need some below.
class LatinRecognizer : public InputMethods::CharacterRecognizer
{
    Q_OBJECT

public:
    explicit LatinRecognizer(QObject* parent);

    void recognition(const QList<QList<QPoint>>& strokes) override;

protected:
    QStringList candidatesFor(const QList<QList<QPoint>>& strokes, int count) override;
};

} // namespace Latin

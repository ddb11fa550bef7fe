// SPDX-License-Identifier: MIT
#pragma once

#include "characterrecognizer.h"

#include <memory>

namespace Zinnia {

class ZinniaModel;

/// \brief Recognises one Chinese character, anew with each stroke.
///
/// The model is opened in the recognizer's thread when there is something to do for the first time, which processStrokes() is as
/// well. When it cannot be, a warning says so once and there are no candidates.
class ZinniaRecognizer : public InputMethods::CharacterRecognizer
{
    Q_OBJECT

public:
    ZinniaRecognizer(const QString& modelFile, QObject* parent);
    ~ZinniaRecognizer() override;

    void recognition(const QList<QList<QPoint>>& strokes) override;

protected:
    QStringList candidatesFor(const QList<QList<QPoint>>& strokes, int count) override;

private:
    void openModel();

    const QString m_modelFile;
    // Of the own thread.
    std::shared_ptr<ZinniaModel> m_model;
    bool m_failed = false;
};

} // namespace Zinnia

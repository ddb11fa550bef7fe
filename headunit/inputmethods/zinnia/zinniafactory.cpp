// SPDX-License-Identifier: MIT
#include "zinniafactory.h"

#include "zinnialog.h"
#include "zinniarecognizer.h"

#include <QFileInfo>

namespace Zinnia {

Q_LOGGING_CATEGORY(zinniaLog, "headunit.inputmethods.zinnia")

ZinniaFactory::ZinniaFactory(const QString& modelFile, QObject* parent)
    : HmiHandwritingRecognizerFactory(parent)
    , m_modelFile(modelFile)
{
}

HmiCore::HmiHandwritingRecognizer* ZinniaFactory::createRecognizer(QObject* parent)
{
    if (!QFileInfo(m_modelFile).isReadable()) {
        qCWarning(zinniaLog) << "Cannot read the model" << m_modelFile;
        return nullptr;
    }
    auto* const recognizer = new ZinniaRecognizer(m_modelFile, parent);
    recognizer->processStrokes(); // the model is open by the time of the first stroke
    return recognizer;
}

} // namespace Zinnia

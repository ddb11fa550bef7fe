// SPDX-License-Identifier: MIT
#include "zinniarecognizer.h"

#include "zinnialog.h"
#include "zinniamodel.h"

namespace Zinnia {

ZinniaRecognizer::ZinniaRecognizer(const QString& modelFile, QObject* parent)
    : CharacterRecognizer(parent)
    , m_modelFile(modelFile)
{
}

ZinniaRecognizer::~ZinniaRecognizer() = default;

void ZinniaRecognizer::recognition(const QList<QList<QPoint>>& strokes)
{
    openModel(); // also when there is nothing to recognise: that is what the factory asks for
    CharacterRecognizer::recognition(strokes);
}

QStringList ZinniaRecognizer::candidatesFor(const QList<QList<QPoint>>& strokes, int count)
{
    return m_model ? m_model->classify(strokes, count) : QStringList();
}

void ZinniaRecognizer::openModel()
{
    if (m_model || m_failed)
        return;
    QString error;
    m_model = ZinniaModel::shared(m_modelFile, &error);
    m_failed = !m_model;
    if (m_failed)
        qCWarning(zinniaLog) << "Cannot open the model" << m_modelFile << error;
}

} // namespace Zinnia

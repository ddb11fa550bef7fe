// SPDX-License-Identifier: MIT
#include "dummyrecognizer.h"

#include "logcategories.h"

namespace HmiCore {

namespace {

void warn()
{
    qCWarning(coreLog) << "Using a dummy recognizer, don't expect much.";
}

} // namespace

DummyRecognizer::DummyRecognizer(QObject* parent)
    : HmiHandwritingRecognizer(parent)
{
}

DummyRecognizer::~DummyRecognizer() = default;

void DummyRecognizer::recognition(const QList<QList<QPoint>>&)
{
    warn();
}

void DummyRecognizer::process()
{
    warn();
}

void DummyRecognizer::newStrokePreProcessing(const QList<QPoint>&)
{
    warn();
}

void DummyRecognizer::handleCandidateSelection(int)
{
    warn();
}

} // namespace HmiCore

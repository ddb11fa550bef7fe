// SPDX-License-Identifier: MIT
#pragma once

#include "hmihandwritingrecognizer.h"

namespace HmiCore {

/// \brief Stands in for an engine that is missing: each use is a warning, and there are no candidates.
class HMICORE_EXPORT DummyRecognizer : public HmiHandwritingRecognizer
{
    Q_OBJECT

public:
    explicit DummyRecognizer(QObject* parent);
    ~DummyRecognizer() override;

    void recognition(const QList<QList<QPoint>>& strokes) override;
    void process() override;
    void newStrokePreProcessing(const QList<QPoint>& stroke) override;
    void handleCandidateSelection(int index) override;
};

} // namespace HmiCore

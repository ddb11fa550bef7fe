// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QTranslator>

namespace HmiCore {

/// \brief A translator that always has an answer: a text without a translation is itself. Carriage returns are taken out.
///
/// So translators that were installed before it are not asked. Any thread may translate; loading is for the GUI thread.
class HMICORE_EXPORT HmiTranslator : public QTranslator
{
    Q_OBJECT

public:
    explicit HmiTranslator(QObject* parent);
    ~HmiTranslator() override;

    /// \brief The text of the catalogue, else the source text; without carriage returns.
    QString translate(const char* context, const char* sourceText, const char* disambiguation = nullptr,
                      int n = -1) const override;
};

} // namespace HmiCore

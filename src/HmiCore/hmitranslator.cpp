// SPDX-License-Identifier: MIT
#include "hmitranslator.h"

namespace HmiCore {

HmiTranslator::HmiTranslator(QObject* parent)
    : QTranslator(parent)
{
}

HmiTranslator::~HmiTranslator() = default;

QString HmiTranslator::translate(const char* context, const char* sourceText, const char* disambiguation, int n) const
{
    QString text = QTranslator::translate(context, sourceText, disambiguation, n);
    if (text.isEmpty())
        text = QString::fromLatin1(sourceText);
    if (text.contains(QLatin1Char('\r'))) // removing copies, also when there is nothing to remove
        text.remove(QLatin1Char('\r'));
    return text;
}

} // namespace HmiCore

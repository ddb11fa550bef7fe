// SPDX-License-Identifier: MIT
#include "hmitranslator.h"

#include <cstring>

namespace HmiCore {

namespace {

constexpr char16_t carriageReturn = u'\r';

/// Nearly no text has one, and each look-up asks: the first search, for the byte, costs less than half of the second.
bool hasCarriageReturn(const QString& text)
{
    return std::memchr(text.constData(), carriageReturn, size_t(text.size()) * sizeof(QChar))
           && text.contains(QChar(carriageReturn));
}

} // namespace

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
    if (hasCarriageReturn(text)) // removing copies, also when there is nothing to remove
        text.remove(QChar(carriageReturn));
    return text;
}

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#include "zhuyindecoder.h"

#include "bopomofo.h"
#include "readings.h"

#include <QFile>

#include <chewing.h>

#include <algorithm>
#include <iterator>
#include <limits>

namespace Zhuyin {

namespace {
constexpr int mostCharacters = 39;            // in the library's buffer; with more it would commit by itself
constexpr auto noUserDictionary = ":memory:"; // of the library's database

constexpr InputMethods::Reading allReadings[] = {
#include "readings.inc"
};

QStringList readings(QChar character)
{
    return InputMethods::readingsOf(character, allReadings, std::size(allReadings));
}

QString closedPart(const QString& symbols)
{
    const auto last = std::find_if(symbols.crbegin(), symbols.crend(), isTone);
    return symbols.left(int(symbols.crend() - last));
}

void noLog(void* /*data*/, int /*level*/, const char* /*format*/, ...) {}
} // namespace

std::unique_ptr<ZhuyinDecoder> ZhuyinDecoder::create(const QString& dictionary)
{
    ChewingContext* const context =
        chewing_new2(QFile::encodeName(dictionary).constData(), noUserDictionary, noLog, nullptr);
    return std::unique_ptr<ZhuyinDecoder>(context ? new ZhuyinDecoder(context) : nullptr);
}

ZhuyinDecoder::ZhuyinDecoder(ChewingContext* context)
    : m_context(context)
{
}

ZhuyinDecoder::~ZhuyinDecoder()
{
    chewing_delete(m_context);
}

void ZhuyinDecoder::feed(const QString& closed)
{
    if (!m_fed.isEmpty() && m_fed == closed)
        return;
    chewing_Reset(m_context);
    chewing_set_maxChiSymbolLen(m_context, mostCharacters);
    chewing_set_phraseChoiceRearward(m_context, 0);
    for (const QChar symbol : closed) {
        const int key = static_cast<unsigned char>(keyOf(symbol));
        if (key == ' ')
            chewing_handle_Space(m_context);
        else
            chewing_handle_Default(m_context, key);
    }
    chewing_clean_bopomofo_buf(m_context);
    m_fed = closed;
}

QStringList ZhuyinDecoder::candidates(const QString& symbols, int count)
{
    const QString closed = closedPart(symbols);
    if (closed.isEmpty())
        return QStringList();
    if (closed != m_closed || count != m_count) {
        feed(closed);
        m_found = read(count);
        m_closed = closed;
        m_count = count;
    }
    return m_found;
}

/// What the library offers for what it was fed with, which it has to be again afterwards.
QStringList ZhuyinDecoder::read(int count)
{
    m_fed.clear();
    if (chewing_buffer_Len(m_context) < 1)
        return QStringList();
    QStringList found{QString::fromUtf8(chewing_buffer_String_static(m_context))};
    chewing_handle_Home(m_context);
    bool more = chewing_cand_open(m_context) == 0;
    while (more && found.size() < count) {
        for (int index = 0; index < chewing_cand_TotalChoice(m_context); ++index)
            found.append(QString::fromUtf8(chewing_cand_string_by_index_static(m_context, index)));
        found.removeDuplicates();
        more = chewing_cand_list_has_next(m_context) && chewing_cand_list_next(m_context) == 0;
    }
    return found.mid(0, count);
}

bool ZhuyinDecoder::converts(const QString& symbols)
{
    feed(closedPart(symbols));
    return chewing_buffer_Len(m_context) == int(std::count_if(symbols.cbegin(), symbols.cend(), isTone));
}

/// The dictionary does not have all characters that have a reading, nor each under all of its readings.
QString ZhuyinDecoder::keysFor(QChar character)
{
    const auto known = m_keys.constFind(character);
    if (known != m_keys.constEnd())
        return *known;
    const QStringList all = readings(character);
    const auto found = std::find_if(all.cbegin(), all.cend(), [this, character](const QString& keys) {
        return candidates(keys, std::numeric_limits<int>::max()).contains(QString(character));
    });
    const QString keys = found == all.cend() ? QString() : *found;
    m_keys.insert(character, keys);
    return keys;
}

} // namespace Zhuyin

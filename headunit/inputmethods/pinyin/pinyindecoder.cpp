// SPDX-License-Identifier: MIT
#include "pinyindecoder.h"

#include "readings.h"

#include <QFile>
#include <QFileInfo>

#include <pinyinime.h>

#include <algorithm>
#include <array>
#include <iterator>

namespace Pinyin {

namespace {

// The library ends the process when its memory for matches is used up. Initials alone, each of which may be many syllables,
// use the most: fourteen times "z" are too many.
constexpr int mostLetters = 12;

constexpr InputMethods::Reading allReadings[] = {
#include "readings.inc"
};

QStringList readings(QChar character)
{
    return InputMethods::readingsOf(character, allReadings, std::size(allReadings));
}

QString candidate(int index)
{
    std::array<ime_pinyin::char16, ime_pinyin::kMaxSearchSteps + 1> buffer{};
    if (!ime_pinyin::im_get_candidate(size_t(index), buffer.data(), buffer.size() - 1))
        return QString();
    return QString::fromUtf16(reinterpret_cast<const char16_t*>(buffer.data()));
}

/// How many letters the first \a syllables of the current search are.
int lettersOf(size_t syllables)
{
    const ime_pinyin::uint16* starts = nullptr;
    const size_t count = ime_pinyin::im_get_spl_start_pos(starts);
    return starts[std::min(syllables, count)];
}

int searchAll(const QString& letters)
{
    const QByteArray spelling = letters.toLatin1();
    return int(ime_pinyin::im_search(spelling.constData(), size_t(spelling.size())));
}

} // namespace

/// Never closed before the end: the library loses some memory each time that it opens a dictionary.
std::shared_ptr<PinyinDecoder> PinyinDecoder::shared(const QString& dictionary)
{
    static std::shared_ptr<PinyinDecoder> s_decoder;
    if (QFileInfo(dictionary).size() < 1)
        return nullptr;
    if (!s_decoder && ime_pinyin::im_open_decoder(QFile::encodeName(dictionary).constData(), ""))
        s_decoder.reset(new PinyinDecoder);
    return s_decoder;
}

PinyinDecoder::~PinyinDecoder()
{
    ime_pinyin::im_close_decoder();
}

/// The library goes on from the letters that both searches begin with, whoever the last one was for. Where letters are left
/// out, the last syllable is too: it may go on in them.
int PinyinDecoder::search(const QString& letters)
{
    const int available = searchAll(letters.left(mostLetters));
    const ime_pinyin::uint16* starts = nullptr;
    const size_t syllables = ime_pinyin::im_get_spl_start_pos(starts);
    if (letters.size() <= mostLetters || syllables < 2)
        return available;
    return searchAll(letters.left(starts[syllables - 1]));
}

QStringList PinyinDecoder::candidates(const QString& letters, int count)
{
    QStringList found;
    const int available = search(letters);
    for (int index = 0; index < std::min(available, count); ++index)
        found.append(candidate(index));
    return found;
}

PinyinDecoder::Choice PinyinDecoder::choose(const QString& letters, int index)
{
    if (index < 0 || index >= search(letters))
        return Choice();
    Choice choice;
    choice.text = candidate(index);
    ime_pinyin::im_choose(size_t(index));
    choice.letters = lettersOf(ime_pinyin::im_get_fixed_len());
    ime_pinyin::im_reset_search(); // or the choice would stay for the next search
    return choice;
}

QStringList PinyinDecoder::predictions(const QString& history, int count)
{
    if (history.isEmpty() || readings(history.back()).isEmpty())
        return QStringList();
    const QString recent = history.right(int(ime_pinyin::kMaxPredictSize));
    std::array<ime_pinyin::char16, ime_pinyin::kMaxPredictSize + 1> buffer{};
    std::transform(recent.cbegin(), recent.cend(), buffer.begin(), [](QChar unit) { return unit.unicode(); });

    ime_pinyin::char16(*texts)[ime_pinyin::kMaxPredictSize + 1] = nullptr;
    const int available = int(ime_pinyin::im_get_predicts(buffer.data(), texts));
    QStringList found;
    for (int index = 0; index < std::min(available, count); ++index)
        found.append(QString::fromUtf16(reinterpret_cast<const char16_t*>(texts[index])));
    return found;
}

bool PinyinDecoder::offers(const QString& letters, QChar character)
{
    const int available = search(letters);
    for (int index = 0; index < available; ++index)
        if (candidate(index) == character)
            return true;
    return false;
}

/// The dictionary does not have all characters that have a reading, nor each under all of its readings.
QString PinyinDecoder::keysFor(QChar character)
{
    const auto known = m_keys.constFind(character);
    if (known != m_keys.constEnd())
        return *known;
    const QStringList all = readings(character);
    const auto found = std::find_if(all.cbegin(), all.cend(),
                                    [this, character](const QString& keys) { return offers(keys, character); });
    const QString keys = found == all.cend() ? QString() : *found;
    m_keys.insert(character, keys);
    return keys;
}

} // namespace Pinyin

// SPDX-License-Identifier: MIT
// Keyboards: from a key to the candidates, against the library alone.
#include "ratios.h"

#include "pinyinfactory.h"
#include "zhuyinfactory.h"

#include <HmiCore/HmiComplexKeyboardEngine>

#include <QCoreApplication>
#include <QFile>

#include <chewing.h>
#include <pinyinime.h>

#include <array>
#include <memory>

using namespace HmiCore;

namespace {

constexpr int wanted = 10;

void noLog(void* /*data*/, int /*level*/, const char* /*format*/, ...) {}

/// All keys of a word, with the candidates after each; then it is cleared.
void typeInto(benchmark::State& state, HmiComplexKeyboardEngine& engine, const QString& word)
{
    for (auto _ : state) {
        for (const QChar key : word)
            engine.addInput(QString(key));
        benchmark::DoNotOptimize(engine.candidates());
        engine.clearInput();
    }
}

void bareSearch(const QByteArray& letters)
{
    std::array<ime_pinyin::char16, 64> text{};
    const auto found = int(ime_pinyin::im_search(letters.constData(), size_t(letters.size())));
    for (int index = 0; index < std::min(found, wanted); ++index)
        benchmark::DoNotOptimize(ime_pinyin::im_get_candidate(size_t(index), text.data(), text.size()));
}

void barePinyin(benchmark::State& state)
{
    const QByteArray word = "zhongguoren";
    for (auto _ : state) {
        for (int length = 1; length <= word.size(); ++length)
            bareSearch(word.left(length));
        ime_pinyin::im_reset_search();
    }
}

void bareCandidates(ChewingContext* context)
{
    if (chewing_buffer_Len(context) < 1)
        return;
    benchmark::DoNotOptimize(chewing_buffer_String_static(context));
    chewing_handle_Home(context);
    chewing_cand_open(context);
    const int count = std::min(wanted, chewing_cand_TotalChoice(context));
    for (int index = 0; index < count; ++index)
        benchmark::DoNotOptimize(chewing_cand_string_by_index_static(context, index));
    chewing_cand_close(context);
    chewing_handle_End(context);
}

/// The keys of ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ. The library keeps what was typed; candidates change with a tone only.
void bareZhuyin(benchmark::State& state, ChewingContext* context)
{
    for (auto _ : state) {
        chewing_Reset(context);
        for (const char key : {'5', 'j', '/', ' ', 'e', 'j', 'i', '6', 'b', 'p', '6'}) {
            if (key == ' ')
                chewing_handle_Space(context);
            else
                chewing_handle_Default(context, key);
            bareCandidates(context);
        }
    }
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    Pinyin::PinyinFactory pinyinFactory;
    Zhuyin::ZhuyinFactory zhuyinFactory;
    const std::unique_ptr<HmiComplexKeyboardEngine> pinyin(pinyinFactory.createEngine(nullptr));
    const std::unique_ptr<HmiComplexKeyboardEngine> zhuyin(zhuyinFactory.createEngine(nullptr));
    ChewingContext* const context = chewing_new2(ZHUYIN_DICTIONARY, ":memory:", noLog, nullptr);
    if (!pinyin || !zhuyin || !context)
        qFatal("no dictionary");

    measure("bare pinyin", barePinyin);
    measure("pinyin", [&](benchmark::State& state) { typeInto(state, *pinyin, QStringLiteral("zhongguoren")); });
    measure("bare zhuyin", [&](benchmark::State& state) { bareZhuyin(state, context); });
    measure("zhuyin",
            [&](benchmark::State& state) { typeInto(state, *zhuyin, QString::fromUtf8("ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ")); });

    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("Pinyin: 11 keys with candidates / the library", "pinyin", "bare pinyin", 2);
    ratios.row("Zhuyin: 11 keys with candidates / the library", "zhuyin", "bare zhuyin", 2);
    chewing_delete(context);
}

// SPDX-License-Identifier: MIT
// Catalogues: what passes the check of its structure can be loaded, and everything in it looked up.
#include "fuzzing.h"

#include "catalogue.h"

#include <QStringList>
#include <QTranslator>

#include <cstring>
#include <sys/mman.h>
#include <unistd.h>

using namespace HmiCore;

namespace {

/// Memory whose last byte is followed by a page that must not be read: Qt is not built with the sanitizers.
class GuardedCopy
{
public:
    explicit GuardedCopy(const QByteArray& content)
        : m_page(size_t(::sysconf(_SC_PAGESIZE)))
        , m_size((size_t(content.size()) + m_page - 1) / m_page * m_page)
        , m_memory(::mmap(nullptr, m_size + m_page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0))
        , m_begin(static_cast<uchar*>(m_memory) + m_size - content.size())
    {
        Fuzzing::check(m_memory != MAP_FAILED, "there is memory");
        std::memcpy(m_begin, content.constData(), size_t(content.size()));
        ::mprotect(static_cast<uchar*>(m_memory) + m_size, m_page, PROT_NONE);
    }
    ~GuardedCopy() { ::munmap(m_memory, m_size + m_page); }
    Q_DISABLE_COPY(GuardedCopy)

    const uchar* begin() const { return m_begin; }

private:
    const size_t m_page;
    const size_t m_size;
    void* const m_memory;
    uchar* const m_begin;
};

/// The texts of a seed's catalogue and all that stands in this one, so that many hashes are hit.
QList<QByteArray> wordsOf(const QByteArray& content)
{
    QList<QByteArray> words{"", "Radio", "Screen", "c", "%n file(s)"};
    QByteArray word;
    for (const char letter : content) {
        if (letter >= ' ' && letter != '\x7f') {
            word += letter;
            continue;
        }
        if (word.size() > 1 && words.size() < 40)
            words.append(word);
        word.clear();
    }
    return words;
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray content(reinterpret_cast<const char*>(data), int(size));
    QStringList dependencies;
    const bool isSound = Catalogue::isSound(content, &dependencies);
    QStringList again;
    Fuzzing::check(isSound == Catalogue::isSound(content, &again) && dependencies == again, "the check is repeatable");
    if (!isSound || !dependencies.isEmpty()) // what it builds on is looked for in files
        return 0;

    const GuardedCopy copy(content);
    QTranslator translator;
    if (!translator.load(copy.begin(), content.size()))
        return 0;
    const QList<QByteArray> words = wordsOf(content);
    for (const QByteArray& context : words) {
        translator.translate(context.constData(), "Radio");
        for (const QByteArray& text : words) {
            translator.translate(context.constData(), text.constData());
            translator.translate(context.constData(), text.constData(), "c", 2);
        }
    }
    return 0;
}

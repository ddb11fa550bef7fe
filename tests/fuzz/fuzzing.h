// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QString>

#include <cstddef>
#include <cstdint>

/// What every fuzzer defines: takes what was invented, and ends the process when a rule is broken.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size);
/// And what it does before the first.
extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv);

namespace Fuzzing {

/// Makes the application object, unless the fuzzer makes its own: off screen and with nothing logged. Once, in
/// LLVMFuzzerInitialize().
enum class Application { Core, Gui, Own };
void start(int* argc, char** argv, Application kind = Application::Core);

/// Takes log lines of warning level and above from now on; null for none.
using LogReader = void (*)(const QString& message);
void readLog(LogReader reader);

/// Ends the process as a crash does, which is a find, when \a holds is not true.
void check(bool holds, const char* rule, const QString& seen = QString());

/// Whether an object in JSON text has a key twice, as far as a look at the text tells.
///
/// Qt 5 loses the memory of a list or object whose key comes again. Its fault would be found over and over.
bool repeatsKeys(const QByteArray& json);

/// What was invented, as numbers and choices. At its end everything is 0.
class Input
{
public:
    Input(const uint8_t* data, size_t size)
        : m_at(data)
        , m_end(data + size)
    {
    }

    bool atEnd() const { return m_at == m_end; }
    uint8_t byte() { return atEnd() ? 0 : *m_at++; }
    bool yes() { return byte() & 1; }
    int below(int limit) { return byte() % limit; } ///< up to 256
    quint64 bits(int bytes);
    int integer() { return int(quint32(bits(4))); }
    double real(); ///< any pattern of bits, so that NaN, the infinities and denormal numbers turn up too
    QString text(int longest);
    QByteArray rest();

private:
    const uint8_t* m_at;
    const uint8_t* const m_end;
};

/// A regular file that holds an input, in memory. Readers that ask for a folder and a name get both.
class MemoryFile
{
public:
    MemoryFile();
    ~MemoryFile();
    MemoryFile(const MemoryFile&) = delete;
    MemoryFile& operator=(const MemoryFile&) = delete;

    void write(const QByteArray& content);
    static QString folder();
    QString name() const;
    QString path() const { return folder() + QLatin1Char('/') + name(); }

private:
    const int m_descriptor;
};

} // namespace Fuzzing

// SPDX-License-Identifier: MIT
#pragma once

#include <QElapsedTimer>
#include <QString>
#include <QStringList>

#include <memory>
#include <type_traits>

namespace HmiCore {

/// Why something was done for a key or an intent: one line in `kest.hmicore.decisions` at the end of its life.
///
/// While that category is off, all operations are a test of a pointer.
class Decision
{
public:
    Decision();
    ~Decision();
    Decision(const Decision&) = delete;
    Decision& operator=(const Decision&) = delete;

    bool isWanted() const { return m_line != nullptr; }

    void begin(const QString& subject); ///< what is decided on
    void note(const char* text);        ///< a step on the way
    void note(const QString& text);
    void saw(const char* what, int value);
    void conclude(const char* outcome); ///< what was done; an outcome may lead to another one

private:
    struct Line;

    std::unique_ptr<Line> m_line;
};

} // namespace HmiCore

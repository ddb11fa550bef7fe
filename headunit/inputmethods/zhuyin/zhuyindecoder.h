// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>

struct ChewingContext;

namespace Zhuyin {

/// \brief Converts Bopomofo, each syllable closed by its tone, with a context of its own of the library.
///
/// Each call says all symbols that it is about; what was asked for last is answered again without the library. What is chosen is
/// not learned. GUI thread only.
class ZhuyinDecoder
{
public:
    /// \brief Null when there is no dictionary in the folder \a dictionary.
    static std::unique_ptr<ZhuyinDecoder> create(const QString& dictionary);
    ~ZhuyinDecoder();
    Q_DISABLE_COPY(ZhuyinDecoder)

    /// \brief What the closed syllables of \a symbols may be: all of them first, then their beginnings. At most \a count.
    QStringList candidates(const QString& symbols, int count);
    /// \brief Whether there is a text for each closed syllable of \a symbols.
    bool converts(const QString& symbols);
    /// \brief The symbols of one syllable with which \a character can be typed; empty when it cannot.
    QString keysFor(QChar character);

private:
    explicit ZhuyinDecoder(ChewingContext* context);
    void feed(const QString& closed);
    QStringList read(int count);

    ChewingContext* m_context;
    QString m_fed; ///< what the library has, when nothing has been looked up in it yet
    QString m_closed;
    int m_count = 0;
    QStringList m_found;          ///< for m_closed, at most m_count
    QHash<QChar, QString> m_keys; ///< those that were asked for
};

} // namespace Zhuyin

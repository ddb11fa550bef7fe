// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>

namespace Pinyin {

/// \brief The decoder, of which its library has one per process. GUI thread only.
///
/// It keeps nothing for anybody: each call says all letters that it is about, so engines share it and none finds the input
/// of another. What is chosen is not learned.
class PinyinDecoder
{
public:
    /// What a candidate stands for: the text, and how many letters it is of. No text when there is no such candidate.
    struct Choice
    {
        QString text;
        int letters = 0;
    };

    /// \brief The one decoder, opened with \a dictionary unless it is open; null when that cannot be opened.
    static std::shared_ptr<PinyinDecoder> shared(const QString& dictionary);
    ~PinyinDecoder();
    Q_DISABLE_COPY(PinyinDecoder)

    /// \brief What \a letters, a to z and ', may be: all of them first, then their beginnings. At most \a count.
    ///
    /// Of many letters only the first few syllables are looked at.
    QStringList candidates(const QString& letters, int count);
    /// \brief The candidate at \a index, which may be any number, of \a letters.
    Choice choose(const QString& letters, int index);
    /// \brief How a text that ends with \a history may go on, if that is with a Chinese character. At most \a count.
    QStringList predictions(const QString& history, int count);
    /// \brief The letters with which \a character can be typed; empty when it cannot.
    QString keysFor(QChar character);

private:
    PinyinDecoder() = default;
    int search(const QString& letters);
    bool offers(const QString& letters, QChar character);

    QHash<QChar, QString> m_keys; ///< those that were asked for
};

} // namespace Pinyin

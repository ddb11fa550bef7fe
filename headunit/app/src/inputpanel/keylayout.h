// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>
#include <QVariantList>
#include <QVector>

#include <optional>

/// \brief The keys of one on-screen keyboard, as a layout file says. A plain value.
///
/// A row is `{"before": [...], "keys": "a b c", "after": [...]}`: texts that keys type, apart by spaces, between keys that do
/// something, such as "backspace". The key `space` stands among the texts.
class KeyLayout
{
public:
    QString name;
    QString title;       ///< as the key shows that leads to it
    int engine = 0;      ///< language of HmiComplexKeyboard; 0 when the keys type their own texts
    int handwriting = 0; ///< language of HmiHandwriting; 0 when it cannot be written by hand

    /// \brief Reads a layout. Nothing, with \a error naming file and field, when it cannot be used.
    static std::optional<KeyLayout> read(const QString& file, QString* error);

    /// \brief The rows for QML, each a list of keys: `text`, `capital` (as with Shift), `more` and `moreCapital` (further texts),
    /// `action`, `icon` and `width` (1: a key that types).
    ///
    /// \a mirrored: keys that do something lie at the other end; those that type stay in order.
    QVariantList rows(bool mirrored) const;

private:
    struct Row
    {
        QStringList before;
        QStringList texts;
        QStringList after;
    };

    QVariantMap typing(const QString& text) const;
    QVariantMap acting(const QString& action) const;

    QVector<Row> m_rows;
    QHash<QString, QStringList> m_more;
};

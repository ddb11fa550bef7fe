// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractListModel>

class Market;

/// \brief Everything that sound can come from: what can play now, and what plays. GUI thread only.
class AudioSources : public QAbstractListModel
{
    Q_OBJECT

public:
    enum Role {
        Name = Qt::UserRole + 1,
        Icon,
        Hint,     ///< what it plays, or why it cannot
        Playable, ///< it can be chosen
        Active,   ///< it is the audio source
    };

    /// \brief Lists what \a market, which outlives it, offers.
    AudioSources(const Market& market, QObject* parent);

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

    /// \brief Asks for a row as the audio source, and for its screen once it is heard. Rows that cannot play are ignored.
    Q_INVOKABLE void select(int row);

    struct Entry; ///< what the list knows of a source

private:
    bool isListed(const Entry& entry) const;
    const Entry* entryAt(int row) const;
    void update();
    void showAwaited();

    const Market& m_market;
    static constexpr int nothing = -1;
    int m_awaited = nothing; ///< source that was asked for and is not heard yet
};

// SPDX-License-Identifier: MIT
#include "librarymodel.h"

#include <AL2HMIBridge/MediaAudioSource>
#include <HmiCore/HmiManager>

#include <QCollator>
#include <QLocale>

#include <algorithm>

using AL2HMIBridge::MediaAudioSource;
using HmiCore::HmiManager;

namespace {

QString firstLetter(const QString& title)
{
    const bool isPair = title.size() > 1 && title.at(0).isHighSurrogate();
    return title.left(isPair ? 2 : 1).toUpper();
}

/// Without a language set, the order of code points is nothing that a person finds a title with.
QLocale alphabet()
{
    return QLocale().language() == QLocale::C ? QLocale(QLocale::English) : QLocale();
}

} // namespace

LibraryModel::LibraryModel(QObject* parent)
    : QAbstractListModel(parent)
{
    connect(MediaAudioSource::instance(), &MediaAudioSource::libraryChanged, this, &LibraryModel::rebuild);
    // Each language has an order of its own.
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, this, &LibraryModel::rebuild);
    rebuild();
}

void LibraryModel::setOrder(Order order)
{
    if (order == m_order || order < ByTitle || order > ByAlbum)
        return;
    m_order = order;
    rebuild();
    Q_EMIT orderChanged();
}

int LibraryModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant LibraryModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const Entry& entry = m_rows.at(index.row());
    switch (role) {
    case Title:
        return entry.title;
    case Detail:
        return entry.detail;
    case Section:
        return entry.section;
    case Row:
        return entry.row;
    default:
        return {};
    }
}

QHash<int, QByteArray> LibraryModel::roleNames() const
{
    return {{Title, "title"}, {Detail, "detail"}, {Section, "section"}, {Row, "row"}};
}

/// Sections in order of the alphabet; within one, titles in order too, but an album as it is played.
void LibraryModel::rebuild()
{
    QVector<Entry> rows;
    const auto library = MediaAudioSource::instance()->library();
    for (const auto& item : library) {
        const QVariantMap track = item.toMap();
        const QString title = track.value(QStringLiteral("title")).toString();
        const QString artist = track.value(QStringLiteral("artist")).toString();
        const QString album = track.value(QStringLiteral("album")).toString();
        const QString sections[] = {firstLetter(title), artist, album};
        rows.append({title, m_order == ByArtist ? album : artist, sections[m_order], int(rows.size())});
    }
    const QCollator collator(alphabet());
    const bool inOrderOfPlay = m_order == ByAlbum;
    std::stable_sort(rows.begin(), rows.end(), [&](const Entry& left, const Entry& right) {
        const int sections = collator.compare(left.section, right.section);
        return sections || inOrderOfPlay ? sections < 0 : collator.compare(left.title, right.title) < 0;
    });
    const int before = count();
    beginResetModel();
    m_rows = rows;
    endResetModel();
    if (count() != before)
        Q_EMIT countChanged();
}

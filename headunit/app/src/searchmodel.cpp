// SPDX-License-Identifier: MIT
#include "searchmodel.h"

#include "market.h"

#include <AL2HMIBridge/AMTunerSource>
#include <AL2HMIBridge/DABTunerSource>
#include <AL2HMIBridge/FMTunerSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/PhoneSource>
#include <AL2HMIBridge/XMTunerSource>
#include <HmiCore/HmiIntentManager>

#include <algorithm>
#include <iterator>

using namespace AL2HMIBridge;
using HmiCore::HmiIntentManager;

namespace {

struct Band
{
    GlobalSource::ALAudioSource source;
    const char* name;
    TunerSource* (*tuner)();
};

template <typename Tuner>
TunerSource* tuner()
{
    return Tuner::instance();
}

const Band bands[] = {
    {GlobalSource::AudioFM, QT_TRANSLATE_NOOP("SearchModel", "FM"), tuner<FMTunerSource>},
    {GlobalSource::AudioDAB, QT_TRANSLATE_NOOP("SearchModel", "DAB"), tuner<DABTunerSource>},
    {GlobalSource::AudioAM, QT_TRANSLATE_NOOP("SearchModel", "AM"), tuner<AMTunerSource>},
    {GlobalSource::AudioXM, QT_TRANSLATE_NOOP("SearchModel", "Satellite"), tuner<XMTunerSource>},
};

constexpr int nowhere = -1;

/// Without case, accents and the vowel signs of Arabic.
QString plain(const QString& text)
{
    QString letters;
    const QString parts = text.left(200).normalized(QString::NormalizationForm_KD).toCaseFolded();
    std::copy_if(parts.cbegin(), parts.cend(), std::back_inserter(letters), [](QChar c) { return !c.isMark(); });
    return letters;
}

/// Lower is better; nowhere when \a name has nothing of \a query. Both plain.
int rankOf(const QString& name, const QString& query)
{
    const auto at = name.indexOf(query);
    if (at <= 0)
        return int(at);
    return name.contains(QLatin1Char(' ') + query) ? 1 : 2;
}

QString field(const QVariant& record, const char* name)
{
    return record.toMap().value(QString::fromLatin1(name)).toString();
}

QString digitsOf(const QString& text)
{
    QString digits;
    std::copy_if(text.cbegin(), text.cend(), std::back_inserter(digits), [](QChar c) { return c.isDigit(); });
    return digits;
}

} // namespace

SearchModel::SearchModel(const Market& market, QObject* parent)
    : QAbstractListModel(parent)
    , m_market(market)
{
    connect(PhoneSource::instance(), &PhoneSource::contactsChanged, this, &SearchModel::update);
    for (const Band& band : bands)
        connect(band.tuner(), &TunerSource::stationListChanged, this, &SearchModel::update);
    connect(&market, &Market::changed, this, &SearchModel::update);
}

int SearchModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant SearchModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const Found& found = m_found.at(index.row());
    const bool isStation = found.band >= 0;
    switch (role) {
    case Name:
        return found.name;
    case Detail:
        return isStation ? tr(bands[found.band].name) + QLatin1Char(' ') + found.detail : found.detail;
    case Icon:
        return isStation ? QStringLiteral("radio") : QStringLiteral("person");
    case Station:
        return isStation;
    default:
        return {};
    }
}

QHash<int, QByteArray> SearchModel::roleNames() const
{
    return {{Name, "name"}, {Detail, "detail"}, {Icon, "icon"}, {Station, "station"}};
}

void SearchModel::setQuery(const QString& query)
{
    if (query == m_query)
        return;
    m_query = query;
    update();
    Q_EMIT queryChanged();
}

QVector<SearchModel::Found> SearchModel::search() const
{
    QVector<Found> all;
    const QString query = plain(m_query).trimmed();
    if (query.isEmpty())
        return all;
    const QString digits = digitsOf(query);
    const QVariantList contacts = PhoneSource::instance()->contacts();
    for (const QVariant& contact : contacts) {
        const QString number = field(contact, "number");
        int rank = rankOf(plain(field(contact, "name")), query);
        if (rank == nowhere && digits.size() > 1 && digitsOf(number).contains(digits))
            rank = 3;
        if (rank != nowhere)
            all.append({field(contact, "name"), number, number, nowhere, 0, rank});
    }
    for (int band = 0; band < int(std::size(bands)); ++band) {
        if (!m_market.offersSource(bands[band].source))
            continue;
        const QVariantList stations = bands[band].tuner()->stationList();
        for (int row = 0; row < stations.size(); ++row) {
            const QVariant& station = stations.at(row);
            const int rank = rankOf(plain(field(station, "name")), query);
            if (rank != nowhere)
                all.append({field(station, "name"), field(station, "frequency"), {}, band, row, rank});
        }
    }
    std::stable_sort(all.begin(), all.end(), [](const Found& a, const Found& b) { return a.rank < b.rank; });
    return all;
}

void SearchModel::update()
{
    beginResetModel();
    m_found = search();
    endResetModel();
    Q_EMIT countChanged();
}

void SearchModel::use(int row)
{
    if (row < 0 || row >= count())
        return;
    const Found found = m_found.at(row);
    if (found.band < 0) {
        HmiIntentManager::instance()->requestAction(HmiIntentManager::MakePhoneCall, {found.target});
        return;
    }
    HmiIntentManager::instance()->requestAction(HmiIntentManager::ChangeAudioSource, {int(bands[found.band].source)});
    bands[found.band].tuner()->tuneToStation(found.station);
}

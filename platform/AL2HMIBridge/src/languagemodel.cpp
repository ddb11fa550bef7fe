// SPDX-License-Identifier: MIT
#include "languagemodel.h"

#include "sourceinfo.h"

#include <QCoreApplication>
#include <QPointer>

namespace AL2HMIBridge {

LanguageModel::LanguageModel()
    : QAbstractListModel(QCoreApplication::instance())
{
}

LanguageModel::~LanguageModel() = default;

LanguageModel* LanguageModel::instance()
{
    static QPointer<LanguageModel> model;
    if (!model)
        model = new LanguageModel;
    return model;
}

bool LanguageModel::languageSupported(GlobalSource::SystemLanguage language) const
{
    return GlobalSource::instance()->supportedLanguages().contains(language);
}

QString LanguageModel::localeFromId(GlobalSource::SystemLanguage language) const
{
    for (const Language& known : SourceTable::languages())
        if (known.id == language)
            return known.locale;
    return QString();
}

int LanguageModel::idForLocale(const QString& locale) const
{
    for (const Language& known : SourceTable::languages())
        if (known.locale == locale)
            return known.id;
    return -1;
}

int LanguageModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : SourceTable::languages().count;
}

QVariant LanguageModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return QVariant();
    const Language& language = SourceTable::languages().first[index.row()];
    switch (role) {
    case LocaleRole:
        return QString(language.locale);
    case NameRole:
    case Qt::DisplayRole:
        return QString::fromUtf8(language.name);
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> LanguageModel::roleNames() const
{
    return {{LocaleRole, QByteArrayLiteral("locale")}, {NameRole, QByteArrayLiteral("name")}};
}

} // namespace AL2HMIBridge

// SPDX-License-Identifier: MIT
// coreanswers FOLDER: answers questions about the configuration of a folder, one JSON object a line, as the core does.

#include <HmiCore/HmiLanguagePropertyStore>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiCore/HmiRegionPropertyStore>
#include <HmiCore/HmiValueMapper>
#include <HmiGuiFramework/AppSettings>

#include <QCoreApplication>
#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QLoggingCategory>

using namespace HmiCore;

namespace {

QVariant answer(const QJsonObject& question)
{
    const auto text = [&](const char* name) { return question.value(QLatin1String(name)).toString(); };
    const QJsonValue country = question.value(QLatin1String("country"));
    if (country.isDouble())
        return HmiMarketPropertyStore::instance()->getProperty(country.toInt(), text("property"));
    const QJsonValue region = question.value(QLatin1String("region"));
    if (region.isDouble())
        return HmiRegionPropertyStore::instance()->getProperty(region.toInt(), text("property"));
    if (question.contains(QLatin1String("bundle")))
        return HmiLanguagePropertyStore::instance()->getLanguageProperty(text("bundle"), text("locale"),
                                                                         text("property"));
    return HmiValueMapper::instance()->mappedValue(text("value"), question.value(QLatin1String("number")).toInt());
}

QByteArray line(const QVariant& answer)
{
    const QJsonObject object{{QStringLiteral("valid"), answer.isValid()},
                             {QStringLiteral("value"), QJsonValue::fromVariant(answer)}};
    return QJsonDocument(object).toJson(QJsonDocument::Compact) + '\n';
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 2)
        return 2;
    QLoggingCategory::setFilterRules(QStringLiteral("kest.hmicore.warning=false")); // bad documents are the purpose

    const QString folder = arguments.at(1) + QLatin1Char('/');
    HmiGuiFramework::AppSettings::mainFolderPath = folder;
    HmiMarketPropertyStore::instance()->loadConfiguration(folder + QLatin1String("markets"),
                                                          QStringLiteral("config.json"));
    HmiRegionPropertyStore::instance()->loadConfiguration(folder + QLatin1String("regions"),
                                                          QStringLiteral("config.json"));
    HmiValueMapper::instance()->loadValueMapping(folder + QLatin1String("valuemappings.json"));

    QFile input;
    QFile output;
    if (!input.open(stdin, QIODevice::ReadOnly) || !output.open(stdout, QIODevice::WriteOnly))
        return 1;
    for (QByteArray question = input.readLine(); !question.isEmpty(); question = input.readLine()) {
        if (output.write(line(answer(QJsonDocument::fromJson(question).object()))) < 0)
            return 1;
    }
    return 0;
}

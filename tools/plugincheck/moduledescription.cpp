// SPDX-License-Identifier: MIT
#include "moduledescription.h"

#include "probelog.h"

#include <HmiCore/HmiHostedSubmodule>
#include <HmiCore/HmiModuleIntegration>
#include <HmiCore/HmiSubmoduleFactory>
#include <HmiCore/HmiSubmoduleHost>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/GuiDescriptor>
#include <HmiGuiFramework/HmiImageProvider>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/TransientCollection>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/StateMachine>

#include <QCoreApplication>
#include <QQmlComponent>
#include <QQmlEngine>

using HmiCore::HmiModuleIntegration;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::HmiImageProvider;

namespace {

constexpr int iconSize = 48; // pixels

QString kindOf(const HmiModuleIntegration& module)
{
    switch (module.type()) {
    case HmiModuleIntegration::RootModule:
        return QStringLiteral("menu");
    case HmiModuleIntegration::BackgroundModule:
        return QStringLiteral("background");
    }
    return QString::number(module.type());
}

/// The image provider warns of an icon that does not exist.
void checkIcon(const HmiModuleIntegration& module)
{
    const QUrl icon = module.iconUrl();
    if (icon.isEmpty() && module.type() == HmiModuleIntegration::RootModule)
        ProbeLog::addProblem(QStringLiteral("The module %1 is in the menu but has no icon.").arg(module.moduleName()));
    QSize size;
    if (icon.scheme() == QLatin1String("image") && icon.host() == HmiImageProvider::imageProviderName)
        HmiImageProvider().requestImage(icon.path().mid(1), &size, {iconSize, iconSize});
}

void checkQml(QQmlEngine* engine, const QUrl& url)
{
    const QQmlComponent component(engine, url);
    const QList<QQmlError> errors = component.errors();
    for (const QQmlError& error : errors)
        ProbeLog::addProblem(error.toString());
}

void checkState(const QString& name)
{
    if (!HmiStateMachine::StateMachine::instance()->findState(name))
        ProbeLog::addProblem(
            QStringLiteral("There is no state %1, so that the view of this name cannot be shown.").arg(name));
}

QJsonObject description(const char* kind, const QString& name, const QUrl& url)
{
    return {{QStringLiteral("kind"), QString::fromLatin1(kind)},
            {QStringLiteral("name"), name},
            {QStringLiteral("url"), url.toString()}};
}

/// A view or popup, which has a state of its name.
QJsonObject screen(QQmlEngine* engine, const char* kind, const QString& name, const QUrl& url)
{
    checkState(name);
    checkQml(engine, url);
    return description(kind, name, url);
}

QStringList sorted(QStringList names)
{
    names.sort();
    return names;
}

template <typename Submodule>
QJsonObject submodule(const char* kind, const Submodule& found)
{
    return {{QStringLiteral("kind"), QString::fromLatin1(kind)},
            {QStringLiteral("name"), found.submoduleName()},
            {QStringLiteral("viewDescriptor"), found.viewDescriptorFile()}};
}

} // namespace

QJsonObject moduleDescription(const HmiModuleIntegration& module)
{
    checkIcon(module);
    const QString state = module.rootStateIdentifier();
    return {{QStringLiteral("name"), module.moduleName()},
            {QStringLiteral("id"), module.moduleId()},
            {QStringLiteral("kind"), kindOf(module)},
            {QStringLiteral("priority"), module.modulePriority()},
            {QStringLiteral("domain"), module.moduleDomain()},
            {QStringLiteral("icon"), module.iconUrl().toString()},
            {QStringLiteral("viewDescriptor"), module.viewDescriptorFile()},
            {QStringLiteral("rootState"), state},
            {QStringLiteral("hasRootState"), HmiStateMachine::StateMachine::instance()->findState(state) != nullptr}};
}

QJsonArray viewDescriptions(QQmlEngine* engine)
{
    QJsonArray found;
    const auto gui = DataStore::get<HmiGuiFramework::ViewManager>(QStringLiteral("ViewManager"))->guiDescriptor();
    const QStringList views = sorted(gui.views.keys());
    for (const QString& view : views)
        found += screen(engine, "view", view, gui.views.value(view).url);
    const QStringList popups = sorted(gui.popups.keys());
    for (const QString& popup : popups)
        found += screen(engine, "popup", popup, gui.popups.value(popup).url);
    const auto notices =
        DataStore::get<HmiGuiFramework::StatusBarController>(QStringLiteral("StatusBarController"))->transients();
    const QStringList transients = sorted(notices.transients.keys());
    for (const QString& transient : transients) {
        const QUrl url = notices.components.value(notices.transients.value(transient).componentKey).url;
        checkQml(engine, url);
        found += description("transient", transient, url);
    }
    return found;
}

QJsonArray submoduleDescriptions()
{
    QJsonArray found;
    const QObject* const application = QCoreApplication::instance();
    const auto hosted = application->findChildren<HmiCore::HmiHostedSubmodule*>();
    for (const HmiCore::HmiHostedSubmodule* const page : hosted)
        found += submodule("hosted", *page);
    const auto factories = application->findChildren<HmiCore::HmiSubmoduleFactory*>();
    for (const HmiCore::HmiSubmoduleFactory* const factory : factories)
        found += submodule("factory", *factory);
    if (const int hosts = application->findChildren<HmiCore::HmiSubmoduleHost*>().size(); hosts > 0)
        found += QJsonObject{{QStringLiteral("kind"), QStringLiteral("host")}, {QStringLiteral("count"), hosts}};
    return found;
}

// SPDX-License-Identifier: MIT
#include "samplemodule.h"

#include "counter.h"

#include <HmiCore/HmiManager>
#include <HmiCore/HmiModuleTranslation>
#include <HmiCore/HmiTranslationManager>
#include <HmiStateMachine/HmiLayeredState>

#include <QCoreApplication>
#include <QQmlContext>
#include <QTranslator>
#include <QUrl>

using HmiCore::HmiManager;
using HmiCore::HmiModuleTranslation;
using HmiCore::HmiTranslationManager;
using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::HmiState;
using HmiStateMachine::NamedState;

SampleModule::SampleModule(QObject* parent)
    : HmiModuleIntegration(RootModule, parent)
    , m_counter(new Counter(this))
{
    m_counter->setObjectName(QStringLiteral("sampleCounter"));
}

/// The launcher shows its translation in the context "Modules"; in upper case it is the prefix of the views.
QString SampleModule::moduleName() const
{
    return QString::fromLatin1(QT_TRANSLATE_NOOP("Modules", "Sample"));
}

/// Place in the launcher, smallest first.
int SampleModule::modulePriority() const
{
    return DOMAIN_NUMBER;
}

/// Any number that no other module has.
int SampleModule::moduleDomain() const
{
    return DOMAIN_NUMBER;
}

QString SampleModule::viewDescriptorFile() const
{
    return QStringLiteral(":/sample/views.json");
}

HmiStateMachine::Identifier SampleModule::rootStateIdentifier() const
{
    return QStringLiteral("SAMPLE");
}

QUrl SampleModule::iconUrl() const
{
    return QUrl(QStringLiteral("image://hmiimages/sample-tile"));
}

/// Each view has the state of its name.
NamedState* SampleModule::createRootState(HmiState* modulesRootState)
{
    auto* const root = new HmiLayeredState(rootStateIdentifier(), modulesRootState);
    root->setInitialState(new HmiState(QStringLiteral("SAMPLE.Main"), root));
    return root;
}

void SampleModule::setupRootContext(QQmlContext* rootContext)
{
    registerTranslation();
    rootContext->setContextProperty(QStringLiteral("_sampleCounter"), m_counter);
}

void SampleModule::registerTranslation()
{
    auto* const translation =
        new HmiModuleTranslation(QStringLiteral(":/sample/translations/sample"), QStringLiteral("_"), this);
    QTranslator* const translator = translation->translator(); // first, so that the present language is loaded at once
    HmiTranslationManager::instance()->registerModuleTranslation(translation);

    // The head unit's own translators leave no text to earlier ones, so this one has to be the later.
    connect(HmiManager::instance(), &HmiManager::hmiRetranslated, translator, [translator] {
        QCoreApplication::removeTranslator(translator);
        QCoreApplication::installTranslator(translator);
    });
}

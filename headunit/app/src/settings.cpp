// SPDX-License-Identifier: MIT
#include "settings.h"

#include <HmiCore/HmiApplication>
#include <HmiGuiFramework/AppSettings>

#include <QDir>
#include <QFont>

using HmiGuiFramework::AppSettings;

void applySettings(const QSize& windowSize)
{
    QDir base(QCoreApplication::applicationDirPath());
    HmiCore::HmiApplication::moveToBaseDir(base);
    AppSettings::mainFolderPath = base.absolutePath() + QLatin1Char('/');
    AppSettings::frameworkImportPath = QStringLiteral("qml");
    AppSettings::instance()->setThemeFile(QStringLiteral(":/theme/theme.json"));
    AppSettings::instance()->setWindowSize(windowSize);

    QCoreApplication::setApplicationVersion(QStringLiteral(HEADUNIT_VERSION));
    QFont font;
    font.setFamilies(
        {QStringLiteral("Inter"), QStringLiteral("Noto Sans Arabic UI"), QStringLiteral("WenQuanYi Micro Hei")});
    QGuiApplication::setFont(font);
}

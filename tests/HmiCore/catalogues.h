// SPDX-License-Identifier: MIT
#pragma once

#include "jsonfiles.h"

#include <QMap>
#include <QProcess>

/// Compiles catalogues with the tool that products use.
inline QByteArray compileCatalogue(const QString& context, const QMap<QString, QString>& texts, int filler = 0)
{
    Files files;
    QString ts =
        QStringLiteral("<?xml version=\"1.0\" encoding=\"utf-8\"?><!DOCTYPE TS><TS version=\"2.1\" language=\"de_DE\">"
                       "<context><name>%1</name>")
            .arg(context);
    const auto add = [&ts](const QString& source, const QString& translation) {
        ts += QStringLiteral("<message><source>%1</source><comment>c</comment><translation>%2</translation></message>"
                             "<message><source>%1</source><translation>%2</translation></message>")
                  .arg(source.toHtmlEscaped(),
                       translation.toHtmlEscaped().replace(QLatin1Char('\r'), QLatin1String("&#13;")));
    };
    for (auto text = texts.constBegin(); text != texts.constEnd(); ++text)
        add(text.key(), text.value());
    for (int i = 0; i < filler; ++i)
        add(QStringLiteral("Filler number %1").arg(i), QStringLiteral("Füller Nummer %1").arg(i));
    ts += QStringLiteral(
        "<message numerus=\"yes\"><source>%n file(s)</source><translation><numerusform>%n Datei</numerusform>"
        "<numerusform>%n Dateien</numerusform></translation></message></context></TS>");
    files.write(QStringLiteral("a.ts"), ts.toUtf8());
    QProcess process;
    process.start(QStringLiteral(LRELEASE), {QStringLiteral("-silent"), files.path(QStringLiteral("a.ts")),
                                             QStringLiteral("-qm"), files.path(QStringLiteral("a.qm"))});
    QFile compiled(files.path(QStringLiteral("a.qm")));
    if (!process.waitForFinished(60000) || process.exitCode() != 0 || !compiled.open(QIODevice::ReadOnly))
        return QByteArray();
    return compiled.readAll();
}

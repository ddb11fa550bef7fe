// SPDX-License-Identifier: MIT
#pragma once

#include <QFile>
#include <QList>
#include <QString>
#include <QStringList>
#include <QXmlStreamReader>

/// The head unit's translations as they are in the repository.
namespace CatalogueFiles {

struct Catalogue
{
    QString name;
    QString folder;      ///< of its files
    QStringList sources; ///< folders whose texts it has
    bool isProduct;
};

struct Message
{
    QString context;
    QString source;
    QStringList forms; ///< the translation, or its plural forms
    bool finished;
    bool counts;

    QString name() const { return context + QStringLiteral(": ") + source; }
};

inline QByteArray contentOf(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

inline QList<Catalogue> all()
{
    QList<Catalogue> found;
    const QString list = QString::fromUtf8(contentOf(QStringLiteral(CATALOGUES_FILE)));
    const QStringList lines = list.split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    for (const QString& line : lines) {
        const QStringList fields = line.split(QLatin1Char('|'));
        found.append({fields.value(0), fields.value(1), fields.mid(3), fields.value(2) == QLatin1String("PRODUCT")});
    }
    return found;
}

inline QString fileOf(const Catalogue& catalogue, const QString& language)
{
    return QStringLiteral("%1/%2_%3.ts").arg(catalogue.folder, catalogue.name, language);
}

inline Message readMessage(QXmlStreamReader& xml, const QString& context)
{
    Message message{context, QString(), {}, true, xml.attributes().hasAttribute(QStringLiteral("numerus"))};
    while (xml.readNextStartElement()) {
        if (xml.name() == QLatin1String("source")) {
            message.source = xml.readElementText();
        } else if (xml.name() == QLatin1String("translation")) {
            message.finished = !xml.attributes().hasAttribute(QStringLiteral("type"));
            if (!message.counts)
                message.forms.append(xml.readElementText());
            while (message.counts && xml.readNextStartElement())
                message.forms.append(xml.readElementText());
        } else {
            xml.skipCurrentElement();
        }
    }
    return message;
}

inline QList<Message> messagesOf(const Catalogue& catalogue, const QString& language)
{
    QList<Message> messages;
    QXmlStreamReader xml(contentOf(fileOf(catalogue, language)));
    QString context;
    while (!xml.atEnd()) {
        if (!xml.readNextStartElement())
            continue;
        if (xml.name() == QLatin1String("name"))
            context = xml.readElementText();
        else if (xml.name() == QLatin1String("message"))
            messages.append(readMessage(xml, context));
    }
    return messages;
}

} // namespace CatalogueFiles

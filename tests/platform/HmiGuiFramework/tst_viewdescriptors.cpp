// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>

#include <sys/stat.h>

using namespace HmiGuiFramework;

class ViewDescriptorsTest : public QObject
{
    Q_OBJECT

    static QString text(const char* name) { return QString::fromLatin1(name); }

    struct Loader
    {
        LogCapture log;
        QQmlEngine engine;
        TransitionManager transitions{&engine, nullptr};
        ViewManager views{&engine, &transitions, nullptr};
        QTemporaryDir folder;

        QString write(const QByteArray& content)
        {
            for (const char* const name : {"A.qml", "B.qml"}) {
                QFile qml(folder.filePath(QString::fromLatin1(name)));
                if (qml.open(QIODevice::WriteOnly))
                    qml.write("import QtQuick 2.15\nItem {}\n");
            }
            QFile file(folder.filePath(QStringLiteral("d.json")));
            if (file.open(QIODevice::WriteOnly))
                file.write(content);
            return file.fileName();
        }

        QStringList warnings() { return log.take(QStringLiteral("hmi.gui"), QtWarningMsg); }
    };

private Q_SLOTS:
    void identifiersCarryThePrefix()
    {
        GuiFixture gui;
        const GuiDescriptor descriptor = gui.views.guiDescriptor();
        const ViewDescriptor list = descriptor.views.value(text("M.List"));
        QCOMPARE(list.identifier, text("M.List"));
        QCOMPARE(list.url, QUrl(text("qrc:/gui/data/View.qml")));
        QCOMPARE(list.transition, text("slide-forward"));
        QCOMPARE(list.domain, 7);
        QCOMPARE(descriptor.popups.value(text("M.Call")).priority, 80);
        QCOMPARE(descriptor.popups.value(text("M.Short")).timeout, 20);
    }

    void withoutAPrefixNamesStayAsTheyAre()
    {
        Loader loader;
        const QString path = loader.write(R"({"version": 1, "views": [{"name": "Plain", "url": "A.qml"}]})");
        loader.views.loadModule(path, QString(), 0);
        QCOMPARE(loader.views.guiDescriptor().views.keys(), QStringList{text("Plain")});
        QCOMPARE(loader.views.guiDescriptor().views.value(text("Plain")).url,
                 QUrl::fromLocalFile(loader.folder.filePath(text("A.qml"))));
    }

    void pathsMayBeResourcesOrRelativeToTheMainFolder()
    {
        Loader loader;
        loader.write(R"({"version": 1, "views": [{"name": "V", "url": "A.qml"}]})");
        AppSettings::mainFolderPath = loader.folder.path() + QLatin1Char('/');
        loader.views.loadModule(text("d.json"), text("relative"), 0);
        loader.views.loadModule(text("qrc:/gui/data/views.json"), text("resource"), 0);
        AppSettings::mainFolderPath.clear();
        QVERIFY(loader.views.guiDescriptor().views.contains(text("relative.V")));
        QVERIFY(loader.views.guiDescriptor().views.contains(text("resource.Home")));
    }

    void aFaultyEntryGivesOneWarningAndTheRestIsLoaded_data()
    {
        QTest::addColumn<QByteArray>("section");
        QTest::addColumn<QString>("error");
        const auto row = [](const char* name, const char* section, const char* error) {
            QTest::newRow(name) << QByteArray(section) << QString::fromUtf8(error);
        };
        row("not an object", R"("views": [5, %1])", "views[0]: must be an object");
        row("name missing", R"("views": [{"url": "A.qml"}, %1])", "views[0].name: is missing");
        row("name of wrong type", R"("views": [{"name": 3, "url": "A.qml"}, %1])", "views[0].name: must be a string");
        row("name empty", R"("views": [{"name": "", "url": "A.qml"}, %1])", "views[0].name: must not be empty");
        row("url missing", R"("views": [{"name": "X"}, %1])", "views[0].url: is missing");
        row("url of wrong type", R"("views": [{"name": "X", "url": []}, %1])", "views[0].url: must be a string");
        row("url empty", R"("views": [{"name": "X", "url": ""}, %1])", "views[0].url: must name a QML file");
        row("file missing", R"("views": [{"name": "X", "url": "C.qml"}, %1])",
            "views[0].url: the file \"C.qml\" does not exist");
        row("transition", R"("views": [{"name": "X", "url": "A.qml", "transition": "boom"}, %1])",
            "views[0].transition: there is no transition \"boom\"");
        row("keepAlive", R"("views": [{"name": "X", "url": "A.qml", "keepAlive": 1}, %1])",
            "views[0].keepAlive: must be true or false");
        row("unknown field", R"("views": [{"name": "X", "url": "A.qml", "colour": 1}, %1])",
            "views[0].colour: is not a known field");
        row("variations", R"("views": [{"name": "X", "url": "A.qml", "variations": 1}, %1])",
            "views[0].variations: must be an object of file by variation");
        row("variation's file", R"("views": [{"name": "X", "url": "A.qml", "variations": {"c": "C.qml"}}, %1])",
            "views[0].variations.c: the file \"C.qml\" does not exist");
        row("priority too large", R"("views": [%1], "popups": [{"name": "X", "url": "A.qml", "priority": 101}])",
            "popups[0].priority: must be a whole number from 0 to 100");
        row("priority with a fraction", R"("views": [%1], "popups": [{"name": "X", "url": "A.qml", "priority": 1.5}])",
            "popups[0].priority: must be a whole number from 0 to 100");
        row("priority of wrong type", R"("views": [%1], "popups": [{"name": "X", "url": "A.qml", "priority": "1"}])",
            "popups[0].priority: must be a whole number from 0 to 100");
        row("timeout negative", R"("views": [%1], "popups": [{"name": "X", "url": "A.qml", "timeout": -1}])",
            "popups[0].timeout: must be a whole number from 0 to 3600000");
        row("transient without component", R"("views": [%1], "transients": [{"name": "X"}])",
            "transients[0].component: is missing");
        row("component without key", R"("views": [%1], "components": [{"url": "A.qml"}])",
            "components[0].key: is missing");
        row("section not an array", R"("views": [%1], "popups": {})", "popups: must be an array");
        row("unknown section", R"("views": [%1], "widgets": [])", "widgets: is not a known field");
        row("shell missing", R"("views": [%1], "shell": "C.qml")", "shell: the file \"C.qml\" does not exist");
    }

    void aFaultyEntryGivesOneWarningAndTheRestIsLoaded()
    {
        QFETCH(QByteArray, section);
        QFETCH(QString, error);
        Loader loader;
        const QByteArray good(R"({"name": "Good", "url": "B.qml"})");
        const QString path = loader.write("{\"version\": 1, " + section.replace("%1", good) + "}");
        loader.views.loadModule(path, text("P"), 0);
        QCOMPARE(loader.warnings(), QStringList{text("view descriptor %1: %2").arg(path, error)});
        QCOMPARE(loader.views.guiDescriptor().views.keys(), QStringList{text("P.Good")});
        QVERIFY(loader.views.guiDescriptor().popups.isEmpty());
        QVERIFY(loader.views.transients().transients.isEmpty());
    }

    /// An entry with a value for every field that the schema knows.
    static QJsonObject entryFromSchema(const QJsonObject& definition)
    {
        const QHash<QString, QJsonValue> byReference{
            {text("#/definitions/name"), text("X")},
            {text("#/definitions/url"), text("A.qml")},
            {text("#/definitions/variations"), QJsonObject{{text("c"), text("B.qml")}}}};
        QJsonObject entry;
        const QJsonObject properties = definition.value(text("properties")).toObject();
        for (auto property = properties.begin(); property != properties.end(); ++property) {
            const QJsonObject type = property.value().toObject();
            if (type.contains(text("$ref")))
                entry.insert(property.key(), byReference.value(type.value(text("$ref")).toString()));
            else if (type.contains(text("enum")))
                entry.insert(property.key(), type.value(text("enum")).toArray().last());
            else if (type.value(text("type")) == text("integer"))
                entry.insert(property.key(), type.value(text("maximum")));
            else
                entry.insert(property.key(), true);
        }
        return entry;
    }

    void everyFieldOfTheSchemaIsUnderstood_data()
    {
        QTest::addColumn<QString>("section");
        for (const char* const section : {"views", "popups", "transients", "components"})
            QTest::newRow(section) << text(section);
    }

    void everyFieldOfTheSchemaIsUnderstood()
    {
        QFETCH(QString, section);
        QFile file(QFINDTESTDATA("../../../docs/schemas/view-descriptor.schema.json"));
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QJsonObject schema = QJsonDocument::fromJson(file.readAll()).object();
        const QJsonObject definitions = schema.value(text("definitions")).toObject();
        QVERIFY(schema.value(text("properties")).toObject().contains(section));
        const QJsonObject entry = entryFromSchema(definitions.value(section.chopped(1)).toObject());
        QVERIFY(entry.size() >= 2);
        Loader loader;
        const QString path =
            loader.write(QJsonDocument(QJsonObject{{text("version"), 1}, {section, QJsonArray{entry}}}).toJson());
        loader.views.loadModule(path, text("P"), 0);
        QCOMPARE(loader.warnings(), QStringList());
        QCOMPARE(loader.views.guiDescriptor().views.size() + loader.views.guiDescriptor().popups.size()
                     + loader.views.transients().transients.size() + loader.views.transients().components.size(),
                 1);
    }

    void anUnusableDescriptorGivesOneWarningAndLoadsNothing_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("error");
        QTest::newRow("empty") << QByteArray() << text("line 1: illegal value");
        QTest::newRow("truncated") << QByteArray("{\n\"version\": 1,\n\"views\": [") << text("line 3: ");
        QTest::newRow("array") << QByteArray("[]") << text("the top level is not an object");
        QTest::newRow("no version") << QByteArray("{}") << text("version: must be 1");
        QTest::newRow("another version") << QByteArray(R"({"version": 2, "views": []})") << text("version: must be 1");
        QTest::newRow("too large") << QByteArray(1024 * 1024 + 1, ' ') << text("it is larger than 1 MiB");
    }

    void anUnusableDescriptorGivesOneWarningAndLoadsNothing()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, error);
        Loader loader;
        const QString path = loader.write(content);
        loader.views.loadModule(path, text("P"), 0);
        const QStringList warnings = loader.warnings();
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.at(0).startsWith(text("view descriptor %1: %2").arg(path, error)),
                 qPrintable(warnings.at(0)));
        QVERIFY(loader.views.guiDescriptor().views.isEmpty());
    }

    void whatIsNotARegularFileIsRefused()
    {
        Loader loader;
        const QString pipe = loader.folder.filePath(text("pipe"));
        QCOMPARE(::mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
        const QString missing = loader.folder.filePath(text("missing.json"));
        for (const QString& path : {pipe, loader.folder.path(), missing})
            loader.views.loadModule(path, text("P"), 0);
        QCOMPARE(loader.warnings(),
                 QStringList({text("view descriptor %1: it is not a regular file").arg(pipe),
                              text("view descriptor %1: it is not a regular file").arg(loader.folder.path()),
                              text("view descriptor %1: the file does not exist").arg(missing)}));
    }

    void aNameThatIsLoadedAlreadyStaysAsItWas()
    {
        Loader loader;
        const QString path =
            loader.write(R"({"version": 1, "views": [{"name": "V", "url": "A.qml"}, {"name": "V", "url": "B.qml"}]})");
        loader.views.loadModule(path, text("P"), 0);
        QCOMPARE(loader.warnings(), QStringList{text("%1 view P.V is loaded already; the first one stays").arg(path)});
        QVERIFY(loader.views.guiDescriptor().views.value(text("P.V")).url.toString().endsWith(text("A.qml")));
    }

    void aShellThatCannotBeCreatedGivesOneWarning()
    {
        Loader loader;
        const QString path = loader.write(R"({"version": 1, "shell": "qrc:/gui/data/Broken.qml"})");
        loader.views.loadModule(path, text("P"), 0);
        const QStringList warnings = loader.warnings();
        QCOMPARE(warnings.size(), 1);
        QVERIFY(warnings.at(0).startsWith(text("shell qrc:/gui/data/Broken.qml cannot be created: ")));
    }
};

QTEST_MAIN(ViewDescriptorsTest)
#include "tst_viewdescriptors.moc"

// SPDX-License-Identifier: MIT
#include "keylayout.h"
#include "scratchfile.h"

#include <QDir>
#include <QTest>

/// Layout files, good and bad.
class KeyLayoutTest : public QObject
{
    Q_OBJECT

    const ScratchFile m_file{QStringLiteral("layout.json")};

    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    static QStringList named(const QVariantList& row, const char* field)
    {
        QStringList names;
        for (const QVariant& key : row)
            names.append(key.toMap().value(text(field)).toString());
        return names;
    }

private Q_SLOTS:
    void allOfTheProductCanBeRead()
    {
        const QDir folder(text(":/app/layouts"));
        const QStringList files = folder.entryList();
        QVERIFY(files.size() >= 10);
        for (const QString& file : files) {
            QString error;
            QVERIFY2(KeyLayout::read(folder.filePath(file), &error), qPrintable(error));
        }
    }

    void rowsHaveKeysThatTypeAndKeysThatAct()
    {
        QString error;
        const auto layout = KeyLayout::read(m_file.with(R"({"name": "L", "title": "abc", "handwriting": "Latin",
            "rows": [{"before": ["shift", "layout"], "keys": "a ß space", "after": ["enter"]}],
            "more": {"a": "à á"}})"),
                                            &error);
        QVERIFY2(layout, qPrintable(error));
        QCOMPARE(layout->handwriting, 3);
        QCOMPARE(layout->engine, 0);
        const QVariantList row = layout->rows(false).constFirst().toList();
        QCOMPARE(named(row, "action"),
                 (QStringList{text("shift"), text("layout"), {}, {}, text("space"), text("enter")}));
        QCOMPARE(named(row, "text"), (QStringList{{}, {}, text("a"), text("ß"), {}, {}}));
        QCOMPARE(named(row, "capital"), (QStringList{{}, {}, text("A"), text("ß"), {}, {}}));
        QCOMPARE(row.at(2).toMap().value(text("moreCapital")).toStringList(), (QStringList{text("À"), text("Á")}));
    }

    void mirroredOnlyWhatActsChangesSides()
    {
        QString error;
        const auto layout = KeyLayout::read(m_file.with(R"({"name": "L", "title": "abc",
            "rows": [{"before": ["shift", "layout"], "keys": "a b", "after": ["hide", "enter"]}]})"),
                                            &error);
        QVERIFY2(layout, qPrintable(error));
        const QVariantList row = layout->rows(true).constFirst().toList();
        QCOMPARE(named(row, "action"),
                 (QStringList{text("enter"), text("hide"), {}, {}, text("layout"), text("shift")}));
        QCOMPARE(named(row, "text").mid(2, 2), (QStringList{text("a"), text("b")}));
    }

    void badFilesAreNamed_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("complaint");
        const QByteArray rows = R"("rows": [{"keys": "a"}])";
        QTest::newRow("no JSON") << QByteArray("{") << text("layout.json: ");
        QTest::newRow("a list") << QByteArray("[]") << text("is no object");
        QTest::newRow("no name") << QByteArray(R"({"title": "x", )" + rows + "}") << text("name: must be a text");
        QTest::newRow("no title") << QByteArray(R"({"name": "x", )" + rows + "}") << text("title: must be a text");
        QTest::newRow("no rows") << QByteArray(R"({"name": "x", "title": "x"})") << text("rows: must not be empty");
        QTest::newRow("row without keys")
            << QByteArray(R"({"name": "x", "title": "x", "rows": [{}]})") << text("keys: must be a text");
        QTest::newRow("unknown engine") << QByteArray(R"({"name": "x", "title": "x", "engine": "Elvish", )" + rows
                                                      + "}")
                                        << text("engine: is no language");
        QTest::newRow("engine by number") << QByteArray(R"({"name": "x", "title": "x", "engine": 1, )" + rows + "}")
                                          << text("engine: is no language");
        QTest::newRow("unknown key") << QByteArray(
            R"({"name": "x", "title": "x", "rows": [{"before": ["dance"], "keys": "a"}]})")
                                     << text("before: \"dance\" is no key");
    }
    void badFilesAreNamed()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, complaint);
        const QString file = m_file.with(content);
        QString error;
        QVERIFY(!KeyLayout::read(file, &error));
        QVERIFY2(error.startsWith(file + text(": ")) && error.contains(complaint), qPrintable(error));
    }

    void aMissingFileIsNamed()
    {
        QString error;
        QVERIFY(!KeyLayout::read(text("nowhere.json"), &error));
        QVERIFY2(error.startsWith(text("nowhere.json: ")), qPrintable(error));
    }
};

QTEST_GUILESS_MAIN(KeyLayoutTest)
#include "tst_keylayout.moc"

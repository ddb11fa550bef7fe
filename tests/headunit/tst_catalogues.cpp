// SPDX-License-Identifier: MIT
#include "cataloguefiles.h"

#include <QDir>
#include <QFile>
#include <QHash>
#include <QLocale>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QTest>
#include <QTranslator>

using CatalogueFiles::Catalogue;
using CatalogueFiles::contentOf;
using CatalogueFiles::fileOf;
using CatalogueFiles::Message;
using CatalogueFiles::messagesOf;

/// The head unit's texts in all languages: as the sources have them, complete, and found by locale.
class CataloguesTest : public QObject
{
    Q_OBJECT

    static const QHash<QString, int>& pluralForms()
    {
        static const QHash<QString, int> forms{{QStringLiteral("en"), 2},   {QStringLiteral("de"), 2},
                                               {QStringLiteral("fr"), 2},   {QStringLiteral("es"), 2},
                                               {QStringLiteral("ar"), 6},   {QStringLiteral("zh_CN"), 1},
                                               {QStringLiteral("zh_TW"), 1}};
        return forms;
    }

    static QStringList placeholdersOf(const QString& text)
    {
        static const QRegularExpression argument(QStringLiteral("%L?[0-9n]"));
        QStringList found;
        for (auto match = argument.globalMatch(text); match.hasNext();)
            found.append(match.next().captured());
        found.sort();
        return found;
    }

    /// What is wrong with a translation, or nothing.
    static QString faultOf(const Message& message, int forms)
    {
        if (!message.finished)
            return QStringLiteral("is not finished");
        if (message.forms.size() != (message.counts ? forms : 1))
            return QStringLiteral("has %1 forms").arg(message.forms.size());
        for (const QString& form : message.forms)
            if (form.trimmed().isEmpty() || form.trimmed() != form)
                return QStringLiteral("is empty or begins or ends with a space");
        // Forms for one and for two may say the number in words.
        if (placeholdersOf(message.forms.last()) != placeholdersOf(message.source))
            return QStringLiteral("has other placeholders");
        return {};
    }

    static void addRows()
    {
        QTest::addColumn<int>("catalogue");
        QTest::addColumn<QString>("language");
        const auto catalogues = CatalogueFiles::all();
        QVERIFY(catalogues.size() >= 5);
        for (int i = 0; i < int(catalogues.size()); ++i)
            for (auto language = pluralForms().keyBegin(); language != pluralForms().keyEnd(); ++language)
                QTest::addRow("%s_%s", qPrintable(catalogues.at(i).name), qPrintable(*language)) << i << *language;
    }

private Q_SLOTS:
    void everyTextOfTheSourcesIsInEveryCatalogueAndNoOther_data()
    {
        QTest::addColumn<int>("catalogue");
        const auto catalogues = CatalogueFiles::all();
        QVERIFY(catalogues.size() >= 5);
        for (int i = 0; i < int(catalogues.size()); ++i)
            QTest::newRow(qPrintable(catalogues.at(i).name)) << i;
    }

    void everyTextOfTheSourcesIsInEveryCatalogueAndNoOther()
    {
        QFETCH(int, catalogue);
        const Catalogue tested = CatalogueFiles::all().at(catalogue);
        const QTemporaryDir copies;
        QStringList arguments{QStringLiteral("-silent"), QStringLiteral("-locations"), QStringLiteral("none"),
                              QStringLiteral("-no-obsolete")};
        arguments += tested.sources;
        arguments.append(QStringLiteral("-ts"));
        for (auto language = pluralForms().keyBegin(); language != pluralForms().keyEnd(); ++language) {
            const QString original = fileOf(tested, *language);
            arguments.append(copies.filePath(QFileInfo(original).fileName()));
            QVERIFY2(QFile::copy(original, arguments.last()), qPrintable(original));
        }
        QCOMPARE(QProcess::execute(QStringLiteral(LUPDATE), arguments), 0);
        for (auto language = pluralForms().keyBegin(); language != pluralForms().keyEnd(); ++language) {
            const QString original = fileOf(tested, *language);
            QVERIFY2(contentOf(copies.filePath(QFileInfo(original).fileName())) == contentOf(original),
                     qPrintable(original + QStringLiteral(" is not current: build the target update_translations")));
        }
    }

    void everyTextIsTranslated_data() { addRows(); }

    void everyTextIsTranslated()
    {
        QFETCH(int, catalogue);
        QFETCH(QString, language);
        const auto messages = messagesOf(CatalogueFiles::all().at(catalogue), language);
        QVERIFY(!messages.isEmpty());
        QStringList faults;
        for (const Message& message : messages) {
            const QString fault = faultOf(message, pluralForms().value(language));
            if (!fault.isEmpty())
                faults.append(message.name() + QLatin1Char(' ') + fault);
        }
        QVERIFY2(faults.isEmpty(), qPrintable(faults.join(QLatin1Char('\n'))));
    }

    /// What looks the same in all languages is named here; anything else that does was forgotten.
    void nothingIsLeftInEnglish_data() { addRows(); }

    void nothingIsLeftInEnglish()
    {
        QFETCH(int, catalogue);
        QFETCH(QString, language);
        static const QRegularExpression latinOnly(QStringLiteral("^(FM|AM|DAB|CD|HD|TA|Qt|%1 °[CF])$"));
        static const QRegularExpression otherScript(QStringLiteral("\\p{Arabic}|\\p{Han}"));
        const bool hasOwnScript = language == QLatin1String("ar") || language.startsWith(QLatin1String("zh"));
        QStringList forgotten;
        for (const Message& message : messagesOf(CatalogueFiles::all().at(catalogue), language))
            if (!latinOnly.match(message.source).hasMatch()
                && otherScript.match(message.forms.value(0)).hasMatch() != hasOwnScript)
                forgotten.append(message.name());
        QVERIFY2(forgotten.isEmpty(), qPrintable(forgotten.join(QLatin1Char('\n'))));
    }

    void everyLocaleFindsItsCatalogues_data()
    {
        QTest::addColumn<QString>("locale");
        const QStringList locales = QStringLiteral(LOCALES).split(QLatin1Char(','));
        QVERIFY(locales.size() >= pluralForms().size());
        for (const QString& locale : locales)
            QTest::newRow(qPrintable(locale)) << locale;
    }

    void everyLocaleFindsItsCatalogues()
    {
        QFETCH(QString, locale);
        const QDir folder(QStringLiteral(TRANSLATIONS_FOLDER));
        for (const Catalogue& catalogue : CatalogueFiles::all()) {
            QTranslator translator;
            const bool loaded =
                catalogue.isProduct
                    ? translator.load(folder.filePath(QStringLiteral("app/%1_%2").arg(catalogue.name, locale)))
                    : translator.load(QLocale(locale), catalogue.name, QStringLiteral("_"), folder.path());
            QVERIFY2(loaded, qPrintable(catalogue.name));
            QVERIFY(!translator.isEmpty());
        }
    }
};

QTEST_GUILESS_MAIN(CataloguesTest)
#include "tst_catalogues.moc"

// SPDX-License-Identifier: MIT
#include <QColor>
#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTest>

#include <cmath>

/// Can the driver read it? The contrast of every text on what it is drawn on, in every palette.
class ThemeTest : public QObject
{
    Q_OBJECT

    static double luminance(const QColor& color)
    {
        const auto linear = [](double part) {
            return part <= 0.03928 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
    }

    static double contrast(const QColor& a, const QColor& b)
    {
        const double first = luminance(a) + 0.05;
        const double second = luminance(b) + 0.05;
        return first > second ? first / second : second / first;
    }

    QJsonObject m_theme;

private Q_SLOTS:
    void initTestCase()
    {
        QFile file(QStringLiteral(":/theme/theme.json"));
        QVERIFY(file.open(QIODevice::ReadOnly));
        m_theme = QJsonDocument::fromJson(file.readAll()).object();
        QVERIFY(!m_theme.isEmpty());
    }

    void textStandsOutFromItsGround_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("ground");
        const auto row = [](const char* text, const char* ground) {
            QTest::addRow("%s on %s", text, ground) << QString::fromLatin1(text) << QString::fromLatin1(ground);
        };
        for (const char* const ground : {"background", "surface", "surfaceHigh", "surfacePressed"}) {
            row("text", ground);
            row("textMuted", ground);
        }
        row("accent", "surface");
        row("accent", "accentSoft");
        row("accentText", "accent");
        row("lightOnDark", "dark");
        row("mutedOnDark", "dark");
        row("signalText", "positive");
        row("signalText", "negative");
    }

    void textStandsOutFromItsGround()
    {
        QFETCH(QString, text);
        QFETCH(QString, ground);
        const QJsonObject palettes = m_theme.value(QLatin1String("palettes")).toObject();
        QCOMPARE(palettes.keys(), QStringList({QStringLiteral("day"), QStringLiteral("night")}));
        for (const QString& name : palettes.keys()) {
            const QJsonObject colors = palettes.value(name).toObject();
            const double ratio =
                contrast(QColor(colors.value(text).toString()), QColor(colors.value(ground).toString()));
            QVERIFY2(ratio >= 4.5, qPrintable(QStringLiteral("%1: %2").arg(name).arg(ratio)));
        }
    }

    void touchTargetsAreAtLeastNineMillimetres()
    {
        // The reference screen: 1280 pixels on a width of 224 mm (10.1 inches).
        const double pixelsPerMillimetre = 1280 / 224.0;
        const QJsonObject values = m_theme.value(QLatin1String("values")).toObject();
        for (const char* const size : {"touchTarget", "rowHeight", "railWidth"})
            QVERIFY2(values.value(QLatin1String(size)).toDouble() >= 9 * pixelsPerMillimetre, size);
    }
};

QTEST_GUILESS_MAIN(ThemeTest)
#include "tst_theme.moc"

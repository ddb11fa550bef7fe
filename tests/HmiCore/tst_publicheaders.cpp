// SPDX-License-Identifier: MIT
#include "publicheaders.h"

#include <QTest>

QStringList& PublicHeader::registered()
{
    static QStringList names;
    return names;
}

class PublicHeadersTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void eachIsEnoughForItself()
    {
        QStringList expected = QStringLiteral(PUBLIC_HEADERS).split(QLatin1Char(','));
        QStringList compiled = PublicHeader::registered();
        expected.sort();
        compiled.sort();
        QCOMPARE(compiled, expected);
    }
};

QTEST_GUILESS_MAIN(PublicHeadersTest)
#include "tst_publicheaders.moc"

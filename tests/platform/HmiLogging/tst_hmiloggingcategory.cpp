// SPDX-License-Identifier: MIT
#include <HmiLogging/HmiLogging>
#include <HmiLogging/HmiLoggingCategory>

#include <QTest>

using HmiLogging::HmiLoggingCategory;

class HmiLoggingCategoryTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { QLoggingCategory::setFilterRules(QString()); }

    void levelIsTheLeastSevereMessageOnByDefault_data()
    {
        QTest::addColumn<int>("level");
        QTest::addColumn<bool>("debug");
        QTest::addColumn<bool>("warning");
        QTest::newRow("below the range") << -3 << true << true;
        QTest::newRow("debug") << 0 << true << true;
        QTest::newRow("warning") << 1 << false << true;
        QTest::newRow("critical") << 2 << false << false;
        QTest::newRow("above the range") << 9 << false << false;
    }

    void levelIsTheLeastSevereMessageOnByDefault()
    {
        QFETCH(int, level);
        const HmiLoggingCategory category("test.level", level);
        QTEST(category.isDebugEnabled(), "debug");
        QTEST(category.isWarningEnabled(), "warning");
        QVERIFY(category.isCriticalEnabled());
    }

    void filterRulesOverrideTheLevel()
    {
        const HmiLoggingCategory category("test.rules", 2);
        QLoggingCategory::setFilterRules(QStringLiteral("test.rules.debug=true"));
        QVERIFY(category.isDebugEnabled());
    }

    void platformCategoriesHaveTheirNames()
    {
        QCOMPARE(HmiLogging::hmitrace().categoryName(), "hmi.trace");
        QCOMPARE(HmiLogging::hmiperformance().categoryName(), "hmi.performance");
        QCOMPARE(&HmiLogging::hmitrace(), &HmiLogging::hmitrace());
    }
};

QTEST_GUILESS_MAIN(HmiLoggingCategoryTest)
#include "tst_hmiloggingcategory.moc"

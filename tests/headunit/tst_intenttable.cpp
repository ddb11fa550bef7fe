// SPDX-License-Identifier: MIT
#include "intenttable.h"
#include "logcapture.h"

#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

namespace {
constexpr int call = 1;
constexpr int show = 2;
constexpr int unknown = 3;
} // namespace

class IntentTableTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    QStringList done;
    QString obstacle;
    std::unique_ptr<IntentTable> table;

    bool request(int intent, const QList<QVariant>& data = {})
    {
        return table->performAction(intent, data, false, QVariant());
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        done.clear();
        obstacle.clear();
        table = std::make_unique<IntentTable>(
            QVector<IntentTable::Entry>{
                {call, [this](const IntentTable::Data& data) { done.append(data.value(0).toString()); },
                 [this] { return obstacle; },
                 [](const IntentTable::Data& data) {
                     return data.value(0).toString().isEmpty() ? QStringLiteral("no number") : QString();
                 }},
                {show, [this](const IntentTable::Data&) { done.append(QStringLiteral("shown")); }, {}, {}}},
            nullptr);
    }
    void cleanup()
    {
        table.reset();
        log.reset();
    }

    void worksWithTheNextTurnOfTheEventLoop()
    {
        QCOMPARE(table->handledActions(), QList<int>({call, show}));
        QVERIFY(request(show));
        QCOMPARE(done, QStringList());
        QCoreApplication::sendPostedEvents();
        QCOMPARE(done, {QStringLiteral("shown")});
    }

    void dataOfTheWrongKindIsRefused()
    {
        for (const QList<QVariant>& data : {QList<QVariant>{}, QList<QVariant>{QVariant()},
                                            QList<QVariant>{QVariantList{1, 2}}, QList<QVariant>{QVariantMap()}}) {
            QVERIFY(!request(call, data));
            QCOMPARE(table->lastError(), QStringLiteral("no number"));
        }
        QVERIFY(request(call, {QStringLiteral("112")}));
        QCoreApplication::sendPostedEvents();
        QCOMPARE(done, {QStringLiteral("112")});
    }

    void obstaclesAreErrorsAndAreTold()
    {
        QSignalSpy changes(table.get(), &IntentTable::actionStatusChanged);
        QVERIFY(table->isActionEnabled(call));
        obstacle = QStringLiteral("a call is running");
        table->update();
        table->update();
        QCOMPARE(changes.size(), 1);
        QCOMPARE(changes.constFirst(), QList<QVariant>({call, false}));
        QVERIFY(!table->isActionEnabled(call));
        QVERIFY(table->isActionEnabled(show));
        QVERIFY(!request(call, {QStringLiteral("112")}));
        QCOMPARE(table->lastError(), obstacle);
        QCoreApplication::sendPostedEvents();
        QCOMPARE(done, QStringList());
    }

    void whatItDoesNotHaveItCannot()
    {
        QVERIFY(!table->isActionEnabled(unknown));
        QVERIFY(!request(unknown));
    }

    void goneBeforeItsTurnItDoesNothing()
    {
        QVERIFY(request(show));
        table.reset();
        QCoreApplication::sendPostedEvents();
        QCOMPARE(done, QStringList());
    }
};

QTEST_GUILESS_MAIN(IntentTableTest)
#include "tst_intenttable.moc"

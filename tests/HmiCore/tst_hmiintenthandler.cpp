// SPDX-License-Identifier: MIT
#include <HmiCore/HmiIntentHandler>

#include <QSignalSpy>
#include <QTest>

using HmiCore::HmiIntentHandler;

namespace {

class PlainHandler : public HmiIntentHandler
{
public:
    PlainHandler()
    {
        addAction(3);
        addAction(1);
        addAction(3);
    }
    bool performAction(int, const QList<QVariant>&, bool, const QVariant&) override { return false; }
};

} // namespace

class HmiIntentHandlerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void keepsItsIntentsInOrderAndTwice() { QCOMPARE(PlainHandler().handledActions(), QList<int>({3, 1, 3})); }

    void isEnabledForWhatItHandles()
    {
        const PlainHandler handler;
        QVERIFY(handler.isActionEnabled(1));
        QVERIFY(handler.isActionEnabled(3));
        QVERIFY(!handler.isActionEnabled(2));
    }

    void hasNoErrorOfItsOwn() { QCOMPARE(PlainHandler().lastError(), QStringLiteral("No Error")); }
};

QTEST_GUILESS_MAIN(HmiIntentHandlerTest)
#include "tst_hmiintenthandler.moc"

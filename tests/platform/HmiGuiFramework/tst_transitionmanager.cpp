// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/TransitionManager>

#include <QQuickItem>
#include <QSignalSpy>
#include <QTest>

using HmiGuiFramework::AppSettings;
using HmiGuiFramework::TransitionManager;

class TransitionManagerTest : public QObject
{
    Q_OBJECT

    struct Stage
    {
        QQuickItem outgoing;
        QQuickItem incoming;
        TransitionManager manager{nullptr, nullptr};

        Stage()
        {
            outgoing.setSize(QSizeF(200, 100));
            incoming.setSize(QSizeF(200, 100));
            incoming.setVisible(false);
        }
    };

private Q_SLOTS:
    void cleanup() { AppSettings::instance()->setRightToLeft(false); }

    void startsWhereTheTransitionSays_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<bool>("reverse");
        QTest::addColumn<bool>("rightToLeft");
        QTest::addColumn<qreal>("x");
        QTest::addColumn<qreal>("opacity");
        QTest::newRow("forward") << QStringLiteral("slide-forward") << false << false << 200. << 1.;
        QTest::newRow("forward, reversed") << QStringLiteral("slide-forward") << true << false << -200. << 1.;
        QTest::newRow("forward, right to left") << QStringLiteral("slide-forward") << false << true << -200. << 1.;
        QTest::newRow("backward") << QStringLiteral("slide-backward") << false << false << -200. << 1.;
        QTest::newRow("backward, reversed, right to left")
            << QStringLiteral("slide-backward") << true << true << -200. << 1.;
        QTest::newRow("fade") << QStringLiteral("fade") << false << false << 0. << 0.;
        QTest::newRow("default is fade") << QString() << true << true << 0. << 0.;
    }

    void startsWhereTheTransitionSays()
    {
        QFETCH(QString, name);
        QFETCH(bool, reverse);
        QFETCH(bool, rightToLeft);
        AppSettings::instance()->setRightToLeft(rightToLeft);
        Stage stage;
        stage.manager.setDuration(60000);
        stage.manager.run(&stage.outgoing, &stage.incoming, name, reverse);
        QVERIFY(stage.manager.isRunning());
        QVERIFY(stage.incoming.isVisible());
        QTEST(stage.incoming.x(), "x");
        QTEST(stage.incoming.opacity(), "opacity");
    }

    void endsWithTheNewItemInPlaceAndTheOldOneHidden()
    {
        Stage stage;
        stage.manager.setDuration(20);
        QSignalSpy finished(&stage.manager, &TransitionManager::finished);
        stage.manager.run(&stage.outgoing, &stage.incoming, QStringLiteral("slide-forward"), false);
        QVERIFY(finished.wait());
        QVERIFY(!stage.manager.isRunning());
        QVERIFY(!stage.outgoing.isVisible());
        QCOMPARE(stage.outgoing.x(), 0.);
        QVERIFY(stage.incoming.isVisible());
        QCOMPARE(stage.incoming.x(), 0.);
        QCOMPARE(stage.incoming.opacity(), 1.);
    }

    void isOverAtOnceWhenThereIsNothingToAnimate_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("duration");
        QTest::addColumn<bool>("withOutgoing");
        QTest::newRow("none") << QStringLiteral("none") << 100 << true;
        QTest::newRow("no duration") << QStringLiteral("fade") << 0 << true;
        QTest::newRow("first view") << QStringLiteral("fade") << 100 << false;
    }

    void isOverAtOnceWhenThereIsNothingToAnimate()
    {
        QFETCH(QString, name);
        QFETCH(int, duration);
        QFETCH(bool, withOutgoing);
        Stage stage;
        stage.manager.setDuration(duration);
        QSignalSpy finished(&stage.manager, &TransitionManager::finished);
        stage.manager.run(withOutgoing ? &stage.outgoing : nullptr, &stage.incoming, name, false);
        QCOMPARE(finished.count(), 1);
        QVERIFY(stage.incoming.isVisible());
        QCOMPARE(stage.outgoing.isVisible(), !withOutgoing);
    }

    void isOverAtOnceWithoutAnimations()
    {
        Stage stage;
        AppSettings::instance()->setAnimations(false);
        stage.manager.run(&stage.outgoing, &stage.incoming, QStringLiteral("fade"), false);
        AppSettings::instance()->setAnimations(true);
        QVERIFY(!stage.manager.isRunning());
        QVERIFY(!stage.outgoing.isVisible());
    }

    void theSameItemStaysVisible()
    {
        Stage stage;
        stage.manager.run(&stage.outgoing, &stage.outgoing, QStringLiteral("fade"), false);
        QVERIFY(stage.outgoing.isVisible());
    }

    void aNewTransitionCompletesTheRunningOne()
    {
        Stage stage;
        QQuickItem third;
        stage.manager.setDuration(60000);
        stage.manager.run(&stage.outgoing, &stage.incoming, QStringLiteral("slide-forward"), false);
        stage.manager.run(&stage.incoming, &third, QStringLiteral("fade"), false);
        QVERIFY(!stage.outgoing.isVisible());
        QCOMPARE(stage.incoming.x(), 0.);
        QVERIFY(stage.manager.isRunning());
    }

    void itemsMayGoWhileTheyMove()
    {
        TransitionManager manager(nullptr, nullptr);
        auto outgoing = std::make_unique<QQuickItem>();
        auto incoming = std::make_unique<QQuickItem>();
        manager.setDuration(20);
        QSignalSpy finished(&manager, &TransitionManager::finished);
        manager.run(outgoing.get(), incoming.get(), QStringLiteral("fade"), false);
        outgoing.reset();
        incoming.reset();
        manager.complete();
        QCOMPARE(finished.count(), 1);
    }

    void unknownDefaultTransitionsAreRefused()
    {
        LogCapture log;
        TransitionManager manager(nullptr, nullptr);
        manager.setDefaultTransition(QStringLiteral("explode"));
        QVERIFY(log.takeOne(QtWarningMsg, QStringLiteral("default transition: there is no transition explode")));
        QCOMPARE(manager.defaultTransition(), QStringLiteral("fade"));
        manager.setDefaultTransition(QStringLiteral("none"));
        QCOMPARE(manager.defaultTransition(), QStringLiteral("none"));
    }
};

QTEST_MAIN(TransitionManagerTest)
#include "tst_transitionmanager.moc"

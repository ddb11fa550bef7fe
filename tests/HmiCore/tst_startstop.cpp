// SPDX-License-Identifier: MIT
#include "headunitlayout.h"

#include <QTest>

/// The process ends cleanly however far its start had come, with the receive threads in whatever state.
class StartStopTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyCycleEndsCleanly()
    {
        HeadUnitLayout layout;
        layout.addModules({QStringLiteral("radio")});
        const QStringList stages{QStringLiteral("constructOnly"), QStringLiteral("initializeOnly"),
                                 QStringLiteral("run")};
        for (int cycle = 0; cycle < 200; ++cycle) {
            const QString stage = stages.at(cycle % stages.size());
            QVERIFY2(layout.run({stage}),
                     qPrintable(QStringLiteral("%1 %2: %3").arg(cycle).arg(stage, layout.error())));
        }
    }
};

QTEST_GUILESS_MAIN(StartStopTest)
#include "tst_startstop.moc"

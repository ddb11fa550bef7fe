// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <HmiGuiFramework/StatusBarController>

using HmiGuiFramework::StatusBarController;

class StatusBarControllerTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void showsATransientAndHidesItAfterItsTime()
    {
        GuiFixture gui;
        StatusBarController controller(&gui.engine, &gui.views, nullptr);
        QSignalSpy changed(&controller, &StatusBarController::transientChanged);
        controller.requestTransientWidget(QStringLiteral("M.Short"), 0);
        QCOMPARE(controller.transient(), QStringLiteral("M.Short"));
        QCOMPARE(controller.transientUrl(), QUrl(QStringLiteral("qrc:/gui/data/View.qml")));
        QVERIFY(changed.wait());
        QCOMPARE(controller.transient(), QString());
        QVERIFY(controller.transientUrl().isEmpty());
    }

    void aGivenTimeCountsInsteadOfTheDescriptors()
    {
        GuiFixture gui;
        StatusBarController controller(&gui.engine, &gui.views, nullptr);
        QSignalSpy changed(&controller, &StatusBarController::transientChanged);
        controller.requestTransientWidget(QStringLiteral("M.Volume"), 10);
        QCOMPARE(changed.count(), 1);
        QVERIFY(changed.wait());
        QCOMPARE(controller.transient(), QString());
    }

    void aNewTransientReplacesTheShownOne()
    {
        GuiFixture gui;
        StatusBarController controller(&gui.engine, &gui.views, nullptr);
        controller.requestTransientWidget(QStringLiteral("M.Short"), 0);
        controller.requestTransientWidget(QStringLiteral("M.Volume"), 0);
        QCOMPARE(controller.transient(), QStringLiteral("M.Volume"));
        controller.dismissTransient();
        QCOMPARE(controller.transient(), QString());
    }

    void unknownAndOrphanedTransientsGiveOneWarningAndChangeNothing()
    {
        GuiFixture gui;
        StatusBarController controller(&gui.engine, &gui.views, nullptr);
        controller.requestTransientWidget(QStringLiteral("M.Volume"), 0);
        controller.requestTransientWidget(QStringLiteral("Nothing"), 0);
        QVERIFY(gui.warned("transient Nothing refused: it is not loaded"));
        controller.requestTransientWidget(QStringLiteral("M.Orphan"), 0);
        QVERIFY(gui.warned("transient M.Orphan refused: there is no component M.Nowhere"));
        QCOMPARE(controller.transient(), QStringLiteral("M.Volume"));
    }

    void collectionHasAllTransientsAndComponents()
    {
        GuiFixture gui;
        const StatusBarController controller(&gui.engine, &gui.views, nullptr);
        const auto collection = controller.transients();
        QCOMPARE(collection.transients.size(), 3);
        const auto volume = collection.transients.value(QStringLiteral("M.Volume"));
        QCOMPARE(volume.identifier, QStringLiteral("M.Volume"));
        QCOMPARE(collection.components.value(volume.componentKey).url, QUrl(QStringLiteral("qrc:/gui/data/View.qml")));
    }
};

QTEST_MAIN(StatusBarControllerTest)
#include "tst_statusbarcontroller.moc"

// SPDX-License-Identifier: MIT
#include "fakesubmodule.h"
#include "logcapture.h"

#include <QAbstractItemModelTester>
#include <QQmlComponent>
#include <QQmlContext>
#include <QMetaProperty>
#include <QTest>

#include <optional>

using namespace HmiCore;
using HmiGuiFramework::HmiAction;
using HmiGuiFramework::HmiActionModel;

class HmiSubmoduleHostTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    HmiStateMachine::HmiState state{QStringLiteral("SETTINGS.Root")};

    static QString texts(const HmiActionModel* model)
    {
        QStringList found;
        for (int row = 0; row < model->rowCount(); ++row)
            found += model->index(row).data(HmiActionModel::TextRole).toString();
        return found.join(QLatin1Char(' '));
    }

private Q_SLOTS:
    void init() { log.emplace(); }
    void cleanup() { log.reset(); }

    void keepsWhatItIsGiven()
    {
        QObject parent;
        const HmiSubmoduleHost* const host = new HmiSubmoduleHost(&state, 12, &parent);
        QCOMPARE(host->hostDomain(), 12);
        QCOMPARE(host->submoduleHostState(), &state);
        QCOMPARE(host->parent(), &parent);
        QVERIFY(host->submoduleEntryActionModel());
        QCOMPARE(host->submoduleEntryActionModel()->parent(), host);
    }

    void theMenuHoldsTheActionsAndSortsThemWhenTold()
    {
        HmiAction last;
        last.setText(QStringLiteral("last"));
        last.setOrder(2);
        HmiAction first;
        first.setText(QStringLiteral("first"));
        first.setOrder(1);
        HmiSubmoduleHost host(&state, 12, nullptr);
        const HmiActionModel* const menu = host.submoduleEntryActionModel();
        const QAbstractItemModelTester tester(host.submoduleEntryActionModel(),
                                              QAbstractItemModelTester::FailureReportingMode::QtTest);
        host.addSubmoduleEntryAction(&last);
        host.addSubmoduleEntryAction(&first);
        QCOMPARE(texts(menu), QStringLiteral("last first"));
        host.sortActionModel();
        QCOMPARE(texts(menu), QStringLiteral("first last"));
    }

    void qmlSeesTheMenu()
    {
        HmiAction action;
        action.setText(QStringLiteral("Sound"));
        HmiSubmoduleHost host(&state, 12, nullptr);
        host.addSubmoduleEntryAction(&action);
        QQmlEngine engine;
        engine.rootContext()->setContextProperty(QStringLiteral("host"), &host);
        QQmlComponent component(&engine);
        component.setData("import QtQml 2.0\nQtObject { property int entries: host.submoduleEntryActionModel.count }",
                          QUrl());
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        QCOMPARE(object->property("entries").toInt(), 1);
        const QMetaObject& meta = HmiSubmoduleHost::staticMetaObject;
        const QMetaProperty property = meta.property(meta.indexOfProperty("submoduleEntryActionModel"));
        QVERIFY(property.isConstant());
        QVERIFY(!property.isWritable());
        QCOMPARE(QByteArray(property.typeName()), QByteArray("HmiGuiFramework::HmiActionModel*"));
    }
};

QTEST_MAIN(HmiSubmoduleHostTest)
#include "tst_hmisubmodulehost.moc"

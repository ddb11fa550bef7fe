// SPDX-License-Identifier: MIT
#include "hmicore.h"
#include "logcapture.h"

#include <HmiLogging/HmiLogging>

#include <QQmlComponent>
#include <QQmlEngine>
#include <QTest>

#include <optional>

using namespace HmiCore;

/// What both implementations of the QML loggers have to do.
class QmlLoggersTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<QQmlEngine> engine;

    QJSValue run(const QString& script) { return engine->evaluate(script, QStringLiteral("script.js")); }

    QString onlyMessage() const
    {
        const QList<LogCapture::Record> records = log->records();
        return records.size() == 1 ? records.first().message : QStringLiteral("%1 messages").arg(records.size());
    }

private Q_SLOTS:
    void init()
    {
        log.emplace(QStringLiteral("hmi.*.debug=true"));
        engine.emplace();
        installCustomLogObjects(&*engine);
    }

    void cleanup()
    {
        engine.reset();
        log.reset();
    }

    void methodsWriteToTheirCategoryAndLevel_data()
    {
        QTest::addColumn<QString>("call");
        QTest::addColumn<QString>("category");
        QTest::addColumn<int>("type");
        QTest::newRow("performance log") << "performanceLogger.log('m')"
                                         << "hmi.performance" << int(QtDebugMsg);
        QTest::newRow("performance debug") << "performanceLogger.debug('m')"
                                           << "hmi.performance" << int(QtDebugMsg);
        QTest::newRow("performance warn") << "performanceLogger.warn('m')"
                                          << "hmi.performance" << int(QtWarningMsg);
        QTest::newRow("trace log") << "traceLogger.log('m')"
                                   << "hmi.trace" << int(QtDebugMsg);
        QTest::newRow("trace debug") << "traceLogger.debug('m')"
                                     << "hmi.trace" << int(QtDebugMsg);
        QTest::newRow("trace warn") << "traceLogger.warn('m')"
                                    << "hmi.trace" << int(QtWarningMsg);
        QTest::newRow("of another logger") << "performanceLogger.log.call(traceLogger, 'm')"
                                           << "hmi.trace" << int(QtDebugMsg);
        QTest::newRow("taken off its logger") << "var f = traceLogger.warn; f('m')"
                                              << "hmi.trace" << int(QtWarningMsg);
        QTest::newRow("called on something else") << "performanceLogger.log.call({ sink: 1 }, 'm')"
                                                  << "hmi.performance" << int(QtDebugMsg);
        QTest::newRow("called on a number") << "traceLogger.log.call(3, 'm')"
                                            << "hmi.trace" << int(QtDebugMsg);
    }

    void methodsWriteToTheirCategoryAndLevel()
    {
        QFETCH(QString, call);
        QFETCH(QString, category);
        QFETCH(int, type);
        const QJSValue result = run(call);
        QVERIFY2(result.isUndefined(), qPrintable(result.toString()));
        QCOMPARE(log->records().size(), 1);
        QCOMPARE(log->take(category, QtMsgType(type)), QStringList(QStringLiteral("m")));
    }

    void argumentsBecomeTheMessage_data()
    {
        QTest::addColumn<QString>("arguments");
        QTest::addColumn<QString>("message");
        QTest::newRow("none") << ""
                              << "";
        QTest::newRow("one") << "'a'"
                             << "a";
        QTest::newRow("mixed") << "'a', 1, [2, 3]"
                               << "a 1 [2,3]";
        QTest::newRow("empty text keeps its blanks") << "'', 'a', ''"
                                                     << " a ";
        QTest::newRow("numbers") << "1.5, -0, NaN, 1e21"
                                 << "1.5 0 NaN 1e+21";
        QTest::newRow("nothing") << "undefined, null, true"
                                 << "undefined null true";
        QTest::newRow("empty array") << "[]"
                                     << "[]";
        QTest::newRow("nested array") << "[1, [2, 3], []]"
                                      << "[1,2,3,]";
        QTest::newRow("nothing in an array") << "[null, undefined, 1]"
                                             << "[,,1]";
        QTest::newRow("array with holes") << "[1, , 3]"
                                          << "[1,,3]";
        QTest::newRow("array that is derived") << "new (class extends Array {})(1, 2)"
                                               << "[1,2]";
        QTest::newRow("object") << "{}, ({ toString: function() { return 'own' } })"
                                << "[object Object] own";
        QTest::newRow("symbol") << "Symbol('s')"
                                << "Symbol(s)";
        QTest::newRow("percent sign") << "'100 %s %n'"
                                      << "100 %s %n";
        QTest::newRow("not ASCII") << "'Gr\u00fc\u00dfe'" << QStringLiteral(u"Gr\u00fc\u00dfe");
        QTest::newRow("text that throws") << "{ toString: function() { throw 'thrown' } }, 'next'"
                                          << "thrown next";
        QTest::newRow("text that throws what throws")
            << "{ toString: function() { throw { toString: function() { throw 1 } } } }, 'next'"
            << " next";
        QTest::newRow("text that throws in an array") << "[1, { toString: function() { throw 'thrown' } }, 3]"
                                                      << "[1,thrown,3]";
        QTest::newRow("getter that throws")
            << "Object.defineProperty([1, 2], 0, { get: function() { throw 'thrown' } })"
            << "[thrown,2]";
        QTest::newRow("no way to make text") << "Object.create(null), 'next'"
                                             << "TypeError: Type error next";
        QTest::newRow("array in itself") << "(function() { var a = [1]; a.push(a, 2); return a })()"
                                         << "[1,,2]";
        QTest::newRow("arrays in each other") << "(function() { var a = [1], b = [2, a]; a.push(b); return a })()"
                                              << "[1,2,]";
        QTest::newRow("array twice, not in itself") << "(function() { var a = [1]; return [a, a] })()"
                                                    << "[1,1]";
        QTest::newRow("deep array")
            << "(function() { var a = ['deep']; for (var i = 0; i < 100000; ++i) a = [a]; return a })()"
            << "[]";
        QTest::newRow("not quite so deep array")
            << "(function() { var a = ['deep']; for (var i = 0; i < 63; ++i) a = [a]; return a })()"
            << "[deep]";
    }

    void argumentsBecomeTheMessage()
    {
        QFETCH(QString, arguments);
        const QJSValue result = run(QStringLiteral("traceLogger.debug(%1)").arg(arguments));
        QVERIFY2(result.isUndefined(), qPrintable(result.toString()));
        QTEST(onlyMessage(), "message");
    }

    void nothingIsWrittenWhenTheLevelIsOff_data()
    {
        QTest::addColumn<QString>("rules");
        QTest::addColumn<QString>("call");
        QTest::newRow("debug") << "hmi.trace.debug=false"
                               << "traceLogger.debug(probe)";
        QTest::newRow("log") << "hmi.trace.debug=false"
                             << "traceLogger.log(probe)";
        QTest::newRow("warning") << "hmi.performance.warning=false"
                                 << "performanceLogger.warn(probe)";
    }

    void nothingIsWrittenWhenTheLevelIsOff()
    {
        QFETCH(QString, rules);
        QFETCH(QString, call);
        QLoggingCategory::setFilterRules(rules);
        run(QStringLiteral("var built = 0; var probe = { toString: function() { ++built; return 'x' } }"));
        QVERIFY(run(call).isUndefined());
        QVERIFY(log->records().isEmpty());
        QCOMPARE(run(QStringLiteral("built")).toInt(), 1); // the message is made nevertheless
    }

    void anEmptyWarningIsAWarning()
    {
        run(QStringLiteral("traceLogger.warn()"));
        QCOMPARE(log->take(QStringLiteral("hmi.trace"), QtWarningMsg), QStringList(QString()));
    }

    void theContextIsThatOfTheCallingQml()
    {
        QQmlComponent component(&*engine);
        component.setData("import QtQml 2.0\n"
                          "QtObject {\n"
                          "    function tell() {\n"
                          "        traceLogger.debug('from a function')\n"
                          "    }\n"
                          "}\n",
                          QUrl(QStringLiteral("qrc:/screens/Teller.qml")));
        const std::unique_ptr<QObject> teller(component.create());
        QVERIFY2(teller, qPrintable(component.errorString()));
        QVERIFY(QMetaObject::invokeMethod(teller.get(), "tell"));
        const QList<LogCapture::Record> records = log->records();
        QCOMPARE(records.size(), 1);
        QCOMPARE(records.first().file, QStringLiteral("qrc:/screens/Teller.qml"));
        QCOMPARE(records.first().function, QStringLiteral("tell"));
        QCOMPARE(records.first().line, 4);
        QCOMPARE(records.first().category, QStringLiteral("hmi.trace"));
    }

    void bindingsAndHandlersAreCallersToo()
    {
        QQmlComponent component(&*engine);
        component.setData("import QtQml 2.0\n"
                          "QtObject {\n"
                          "    property var bound: traceLogger.debug('binding')\n"
                          "    Component.onCompleted: performanceLogger.log('handler')\n"
                          "}\n",
                          QUrl(QStringLiteral("qrc:/screens/Teller.qml")));
        const std::unique_ptr<QObject> teller(component.create());
        QVERIFY2(teller, qPrintable(component.errorString()));
        const QList<LogCapture::Record> records = log->records();
        QCOMPARE(records.size(), 2);
        QCOMPARE(records.at(0).line, 3);
        QCOMPARE(records.at(1).line, 4);
        QVERIFY(records.at(1).function.contains(QStringLiteral("onCompleted")));
    }

    void aCallStraightFromCppHasNoPlace()
    {
        const QJSValue logger = engine->globalObject().property(QStringLiteral("traceLogger"));
        QJSValue debug = logger.property(QStringLiteral("debug"));
        QVERIFY(debug.callWithInstance(logger, {QJSValue(QStringLiteral("m"))}).isUndefined());
        QCOMPARE(onlyMessage(), QStringLiteral("m"));
        QCOMPARE(log->records().first().file, QString());
        QCOMPARE(log->records().first().function, QString());
        QCOMPARE(log->records().first().line, 0);
    }

    void aCallPutOffHasNoPlace()
    {
        QQmlComponent component(&*engine);
        component.setData("import QtQml 2.0\n"
                          "QtObject { Component.onCompleted: Qt.callLater(traceLogger.debug, 'later') }\n",
                          QUrl(QStringLiteral("qrc:/screens/Later.qml")));
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        QTRY_COMPARE(onlyMessage(), QStringLiteral("later"));
        QCOMPARE(log->records().first().line, 0);
    }

    void loggersSurviveTheCollectorAndEachEngineHasItsOwn()
    {
        QQmlEngine second;
        installCustomLogObjects(&second);
        engine->collectGarbage();
        second.collectGarbage();
        run(QStringLiteral("traceLogger.debug('first')"));
        second.evaluate(QStringLiteral("traceLogger.debug('second')"));
        QCOMPARE(log->messages(QStringLiteral("hmi.trace"), QtDebugMsg),
                 QStringList({QStringLiteral("first"), QStringLiteral("second")}));
    }

    void methodsAreOrdinaryButNotListed()
    {
        QCOMPARE(run(QStringLiteral("Object.keys(traceLogger).length")).toInt(), 0);
        QCOMPARE(run(QStringLiteral("traceLogger.log.length + traceLogger.warn.length")).toInt(), 0);
        run(QStringLiteral("traceLogger.log = function() { return 'mine' }"));
        QCOMPARE(run(QStringLiteral("traceLogger.log('m')")).toString(), QStringLiteral("mine"));
        QVERIFY(log->records().isEmpty());
    }
};

QTEST_GUILESS_MAIN(QmlLoggersTest)
#include "tst_qmlloggers.moc"

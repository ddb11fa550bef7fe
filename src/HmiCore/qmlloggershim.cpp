// SPDX-License-Identifier: MIT
#include "qmlloggershim.h"

#include "qmlloggers.h"

#include <QLoggingCategory>
#include <QQmlEngine>

namespace HmiCore {

namespace {

// Called as a plain function, a method writes to the logger that it comes from. Array.prototype.join would exhaust the
// stack on an array that contains itself.
const char* const script = R"js(
(function(deepest) {
    var sinks = new WeakMap()
    function text(value) {
        try {
            return String(value)
        } catch (first) {
            try {
                return String(first)
            } catch (second) {
                return ""
            }
        }
    }
    function elements(array, around) {
        if (around.length >= deepest || around.indexOf(array) >= 0)
            return ""
        var inner = around.concat([array])
        var parts = []
        for (var i = 0; i < array.length; ++i) {
            var element
            try {
                element = array[i]
            } catch (exception) {
                element = exception
            }
            if (element === undefined || element === null)
                parts.push("")
            else
                parts.push(Array.isArray(element) ? elements(element, inner) : text(element))
        }
        return parts.join(",")
    }
    function message(values) {
        var parts = []
        for (var i = 0; i < values.length; ++i)
            parts.push(Array.isArray(values[i]) ? "[" + elements(values[i], []) + "]" : text(values[i]))
        return parts.join(" ")
    }
    function method(home, type) {
        return function() {
            var made = message(arguments)
            var sink = sinks.get(this) || home
            if (sink.isEnabled(type))
                sink.write(type, made, new Error().stack)
        }
    }
    return function(sink) {
        var logger = {}
        var types = { log: 0, debug: 0, warn: 1 }
        for (var name in types)
            Object.defineProperty(logger, name, { value: method(sink, types[name]), writable: true, configurable: true })
        sinks.set(logger, sink)
        return logger
    }
})
)js";

struct Place
{
    QString file;
    QString function;
    int line = 0;
};

// A line of the stack reads "function@file:line".
Place callerIn(const QString& stack)
{
    const QString caller = stack.section(QLatin1Char('\n'), 1, 1);
    const int at = int(caller.indexOf(QLatin1Char('@')));
    const int colon = int(caller.lastIndexOf(QLatin1Char(':')));
    if (at < 0 || colon < at)
        return {};
    const QString line = caller.mid(colon + 1);
    return {caller.mid(at + 1, colon - at - 1), caller.left(at), line.toInt()};
}

} // namespace

QmlLoggerShim::QmlLoggerShim(QLoggingCategory& category, QObject* parent)
    : QObject(parent)
    , m_category(category)
{
}

bool QmlLoggerShim::isEnabled(int type) const
{
    return m_category.isEnabled(type == WarningLog ? QtWarningMsg : QtDebugMsg);
}

void QmlLoggerShim::write(int type, const QString& message, const QString& stack) const
{
    const Place caller = callerIn(stack);
    writeQmlMessage(m_category, static_cast<LogType>(type), message, caller.file, caller.function, caller.line);
}

void installQmlLoggers(QQmlEngine* engine, const QVector<QmlLoggerDefinition>& loggers)
{
    QJSValue makeLogger = engine->evaluate(QString::fromUtf8(script)).call({QJSValue(deepestArray)});
    for (const QmlLoggerDefinition& logger : loggers) {
        auto* const sink = new QmlLoggerShim(logger.category, engine);
        engine->globalObject().setProperty(logger.name, makeLogger.call({engine->newQObject(sink)}));
    }
}

} // namespace HmiCore

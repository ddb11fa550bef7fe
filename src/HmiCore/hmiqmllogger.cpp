// SPDX-License-Identifier: MIT
#include "hmiqmllogger.h"

#include "qmlloggers.h"

#include <private/qv4functionobject_p.h>
#include <private/qv4scopedvalue_p.h>
#include <private/qv4stackframe_p.h>

#include <QQmlEngine>

namespace HmiCore {

DEFINE_OBJECT_VTABLE(HmiQmlLogger);

namespace {

/// An array that is being written, and the arrays around it.
struct Nesting
{
    const QV4::Object* array;
    const Nesting* outer;
    int depth;
};

bool maySpell(const QV4::Object* array, const Nesting* outer)
{
    if (outer && outer->depth >= deepestArray)
        return false;
    for (const Nesting* around = outer; around; around = around->outer)
        if (around->array->d() == array->d())
            return false;
    return true;
}

const QV4::Object* asArray(const QV4::Value& value)
{
    const QV4::Object* const object = value.as<QV4::Object>();
    return object && object->isArrayLike() ? object : nullptr;
}

QString elementsOf(const QV4::Object* array, const Nesting* outer);

QString elementText(const QV4::Value& element, const Nesting* outer)
{
    if (element.isNullOrUndefined())
        return QString();
    if (const QV4::Object* const array = asArray(element))
        return elementsOf(array, outer);
    return element.toQStringNoThrow();
}

// The engine's own conversion of arrays exhausts the stack on an array that contains itself.
QString elementsOf(const QV4::Object* array, const Nesting* outer)
{
    if (!maySpell(array, outer))
        return QString();
    const Nesting nesting{array, outer, outer ? outer->depth + 1 : 1};
    QV4::Scope scope(array->engine());
    QV4::ScopedValue element(scope);
    const qint64 length = array->getLength();
    QString text;
    for (qint64 i = 0; i < length; ++i) {
        if (i > 0)
            text += QLatin1Char(',');
        element = array->get(uint(i));
        if (scope.hasException()) // a getter threw: its exception stands for the element
            element = scope.engine->catchException();
        text += elementText(element, &nesting);
    }
    return text;
}

QString messageFrom(const QV4::Value* argv, int argc)
{
    QString message;
    for (int i = 0; i < argc; ++i) {
        if (i > 0)
            message += QLatin1Char(' ');
        if (const QV4::Object* const array = asArray(argv[i]))
            message += QLatin1Char('[') + elementsOf(array, nullptr) + QLatin1Char(']');
        else
            message += argv[i].toQStringNoThrow();
    }
    return message;
}

QString homeProperty()
{
    return QStringLiteral("logger");
}

QV4::ReturnedValue write(LogType type, const QV4::FunctionObject* method, const QV4::Value* thisObject,
                         const QV4::Value* argv, int argc)
{
    const QString message = messageFrom(argv, argc);
    QV4::Scope scope(method->engine());
    QV4::Scoped<HmiQmlLogger> logger(scope, *thisObject);
    if (!logger) { // called as a plain function
        QV4::ScopedString home(scope, scope.engine->newString(homeProperty()));
        logger = method->get(home);
    }
    if (const QV4::CppStackFrame* const caller = scope.engine->currentStackFrame)
        writeQmlMessage(logger->category(), type, message, caller->source(), caller->function(), caller->lineNumber());
    else // straight from C++
        writeQmlMessage(logger->category(), type, message, QString(), QString(), 0);
    return QV4::Encode::undefined();
}

QV4::ReturnedValue methodDebug(const QV4::FunctionObject* method, const QV4::Value* thisObject, const QV4::Value* argv,
                               int argc)
{
    return write(DebugLog, method, thisObject, argv, argc);
}

QV4::ReturnedValue methodWarn(const QV4::FunctionObject* method, const QV4::Value* thisObject, const QV4::Value* argv,
                              int argc)
{
    return write(WarningLog, method, thisObject, argv, argc);
}

} // namespace

QV4::Heap::HmiQmlLogger* HmiQmlLogger::create(QLoggingCategory& category, QV4::ExecutionEngine* engine)
{
    QV4::Scope scope(engine);
    QV4::Scoped<HmiQmlLogger> logger(scope, engine->memoryManager->allocate<HmiQmlLogger>(&category));
    logger->defineMethod(QStringLiteral("log"), methodDebug);
    logger->defineMethod(QStringLiteral("debug"), methodDebug);
    logger->defineMethod(QStringLiteral("warn"), methodWarn);
    return logger->d();
}

void HmiQmlLogger::defineMethod(const QString& name, QV4::VTable::Call code)
{
    QV4::Scope scope(engine());
    QV4::ScopedString methodName(scope, scope.engine->newIdentifier(name));
    QV4::ScopedFunctionObject method(scope,
                                     QV4::FunctionObject::createBuiltinFunction(scope.engine, methodName, code, 0));
    method->defineReadonlyProperty(homeProperty(), *this);
    defineDefaultProperty(methodName, method);
}

void installQmlLoggers(QQmlEngine* engine, const QVector<QmlLoggerDefinition>& loggers)
{
    QV4::ExecutionEngine* const v4 = engine->handle();
    QV4::Scope scope(v4);
    QV4::ScopedObject object(scope);
    for (const QmlLoggerDefinition& logger : loggers) {
        object = HmiQmlLogger::create(logger.category, v4);
        v4->globalObject->defineDefaultProperty(logger.name, object);
    }
}

} // namespace HmiCore

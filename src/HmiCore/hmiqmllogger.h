// SPDX-License-Identifier: MIT
#pragma once

#include <private/qv4engine_p.h>
#include <private/qv4object_p.h>

#include <QLoggingCategory>

QT_BEGIN_NAMESPACE

namespace QV4 {
namespace Heap {

/// \brief What the engine's garbage-collected heap keeps of a logger.
struct HmiQmlLogger : Object
{
    void init(QLoggingCategory* loggingCategory)
    {
        Object::init();
        category = loggingCategory;
    }
    QLoggingCategory* category;
};

} // namespace Heap
} // namespace QV4

QT_END_NAMESPACE

namespace HmiCore {

/// \brief A JavaScript object whose methods `log`, `debug` and `warn` write to a logging category.
///
/// Made in the heap of an engine and collected by it. Engine's thread only.
struct HmiQmlLogger : QV4::Object
{
    V4_OBJECT2(HmiQmlLogger, QV4::Object)

    /// \brief A new logger; the category is not owned and must outlive the engine.
    static QV4::Heap::HmiQmlLogger* create(QLoggingCategory& category, QV4::ExecutionEngine* engine);

    QLoggingCategory& category() const { return *d()->category; }

private:
    void defineMethod(const QString& name, QV4::VTable::Call code);
};

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QObject>
#include <QString>

namespace HmiGuiFramework {

/// \brief Process-wide registry of framework objects by name. Does not own them; deleted ones are absent. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT DataStore
{
public:
    /// \brief Registers \a object under \a name in place of an earlier one; null removes the entry.
    static void store(QObject* object, const QString& name);

    /// \brief The object of this name, or null when it is absent or of another type.
    template <typename T>
    static T* get(const QString& name)
    {
        return qobject_cast<T*>(find(name));
    }

private:
    static QObject* find(const QString& name);
};

} // namespace HmiGuiFramework

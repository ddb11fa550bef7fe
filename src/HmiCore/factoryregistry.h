// SPDX-License-Identifier: MIT
#pragma once

#include "logcategories.h"

#include <QHash>
#include <QPointer>

namespace HmiCore {

/// Factories of input methods by language. The first one of a language stays; none is owned, and one that is gone is null.
template <typename Factory>
class FactoryRegistry
{
public:
    /// \a refusal is the warning about a second one.
    void add(int language, Factory* factory, const char* refusal)
    {
        if (m_factories.contains(language))
            qCWarning(coreLog) << refusal << language << factory;
        else if (factory)
            m_factories.insert(language, factory);
    }

    Factory* find(int language) const { return m_factories.value(language); }

private:
    QHash<int, QPointer<Factory>> m_factories;
};

} // namespace HmiCore

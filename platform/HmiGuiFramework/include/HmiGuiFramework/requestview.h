// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QString>
#include <QVariant>

namespace HmiGuiFramework {

/// \brief Functor that asks the view manager in the DataStore for a view; connect a signal to it. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT RequestView
{
public:
    /// \brief The arguments of ViewManager::requestView().
    RequestView(const QString& name, const QVariant& data, bool reverse, const QVariant& transition);

    /// \brief Makes the request. Without a view manager it gives one warning.
    void operator()() const;

private:
    QString m_name;
    QVariant m_data;
    bool m_reverse;
    QVariant m_transition;
};

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief Opens modules from the launcher and the rail. GUI thread only.
class ModuleActivation : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    /// \brief Opens the module of \a domain at \a rootView, unless an activation override takes that over.
    Q_INVOKABLE void open(int domain, const QString& rootView) const;
};

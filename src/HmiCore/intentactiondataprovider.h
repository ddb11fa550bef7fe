// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QObject>
#include <QVariant>

namespace HmiCore {

/// \brief Knows the data of an IntentActionRequest at the moment of the request.
class HMICORE_EXPORT IntentActionDataProvider : public QObject
{
    Q_OBJECT

public:
    explicit IntentActionDataProvider(QObject* parent);
    ~IntentActionDataProvider() override;

    /// \brief The data to send now; asked for with each request.
    virtual QList<QVariant> intentData() = 0;
};

} // namespace HmiCore

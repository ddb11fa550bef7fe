// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QObject>
#include <QString>
#include <QVariant>

namespace HmiCore {

/// \brief Performs intents for a module. GUI thread.
///
/// Add the intents in the constructor, then hand the object to HmiIntentManager::registerIntentHandler(). The module
/// owns it and may delete it between requests; it is then passed over.
///
/// The manager calls performAction(), isActionEnabled() and lastError() while it holds its mutex: they must not call the
/// manager again nor throw, and should return at once. What leads to QML, which may ask for a monitor, is best queued.
class HMICORE_EXPORT HmiIntentHandler : public QObject
{
    Q_OBJECT

public:
    explicit HmiIntentHandler(QObject* parent = nullptr);
    ~HmiIntentHandler() override;

    /// \brief Performs \a intent with \a data; \a vrEvent tells that it was spoken, \a vrEventData is then the recogniser's.
    ///
    /// True when it was performed. After false, lastError() says why not. \a data is not checked by anybody before.
    virtual bool performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData) = 0;

    /// \brief Whether \a intent can be performed now. Unless overridden: whether it is one of handledActions().
    virtual bool isActionEnabled(int intent) const;

    /// \brief Why performAction() failed the last time. Unless overridden: "No Error".
    virtual QString lastError() const;

    /// \brief The intents that were added, in that order.
    QList<int> handledActions() const;

Q_SIGNALS:
    /// \brief To be emitted when an own intent becomes possible or impossible.
    void actionStatusChanged(int intent, bool enabled);

protected:
    /// \brief Adds an intent, without looking whether it is there already. No effect on a registration that was made.
    void addAction(int intent);

private:
    QList<int> m_actions;
};

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiIntentHandler>

#include <QStringList>

/// An intent handler that answers as it is told and writes down what it was asked, also into a list shared with others.
class FakeHandler : public HmiCore::HmiIntentHandler
{
    Q_OBJECT

public:
    struct Request
    {
        int intent;
        QList<QVariant> data;
        bool vrEvent;
        QVariant vrEventData;
    };

    FakeHandler(const QString& name, const QList<int>& intents, QStringList* journal = nullptr)
        : m_journal(journal)
    {
        setObjectName(name);
        for (const int intent : intents)
            addAction(intent);
    }

    bool performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData) override
    {
        requests.append({intent, data, vrEvent, vrEventData});
        if (m_journal)
            m_journal->append(objectName());
        return error.isNull();
    }

    bool isActionEnabled(int intent) const override { return enabled && HmiIntentHandler::isActionEnabled(intent); }
    QString lastError() const override { return error; }

    void setEnabled(int intent, bool isEnabled)
    {
        enabled = isEnabled;
        Q_EMIT actionStatusChanged(intent, isEnabled);
    }

    QList<Request> requests;
    QString error; ///< null: it succeeds
    bool enabled = true;

private:
    QStringList* const m_journal;
};

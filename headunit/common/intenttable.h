// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiIntentHandler>

#include <QHash>
#include <QVector>

#include <functional>

/// \brief Performs the intents of a table. GUI thread only.
///
/// What an intent leads to happens soon, not within the request: requests are made with the intent manager locked, and QML
/// that is shown may ask the manager for something.
class IntentTable : public HmiCore::HmiIntentHandler
{
public:
    using Data = QList<QVariant>;

    struct Entry
    {
        int intent;
        std::function<void(const Data& data)> perform;
        /// Why it is not possible now, as shown to the driver; empty, or no function, when it is.
        std::function<QString()> obstacle;
        /// What is wrong with the data; empty, or no function, when it can be used.
        std::function<QString(const Data& data)> problem;
    };

    IntentTable(const QVector<Entry>& entries, QObject* parent);

    bool performAction(int intent, const Data& data, bool vrEvent, const QVariant& vrEventData) override;
    bool isActionEnabled(int intent) const override;
    QString lastError() const override { return m_error; }

    /// \brief Looks at the obstacles again whenever one of \a signals is emitted.
    template <typename Sender, typename... Signals>
    void watch(Sender* sender, Signals... signals)
    {
        (connect(sender, signals, this, &IntentTable::update), ...);
    }

    /// \brief Looks at the obstacles again, and tells of those that came or went.
    void update();

private:
    const Entry* find(int intent) const;

    const QVector<Entry> m_entries;
    QHash<int, bool> m_enabled; ///< as told last
    QString m_error;
};

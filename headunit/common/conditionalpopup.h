// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

#include <functional>

/// \brief Keeps a popup on the screen for as long as a condition holds. GUI thread only.
///
/// It only reacts to changes of the condition: a popup that was asked for otherwise is left alone.
class ConditionalPopup : public QObject
{
public:
    /// \brief \a name is the popup's identifier, which has a popup state of the same name.
    ConditionalPopup(const QString& name, std::function<bool()> condition, QObject* parent);

    /// \brief Looks at the condition again whenever one of \a signals is emitted.
    template <typename Sender, typename... Signals>
    void watch(Sender* sender, Signals... signals)
    {
        (connect(sender, signals, this, &ConditionalPopup::update), ...);
    }

    /// \brief Looks at the condition again.
    void update();

    /// \brief Takes the popup off although the condition still holds; it comes back when the condition holds anew.
    void dismiss();

private:
    const QString m_name;
    const std::function<bool()> m_condition;
    bool m_held = false;
};

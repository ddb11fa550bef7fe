// SPDX-License-Identifier: MIT
#pragma once

#include "guidescriptor.h"

#include <QPointer>
#include <QQuickItem>
#include <QSet>
#include <QTimer>
#include <QVector>

namespace HmiStateMachine {
class NamedState;
class PopupState;
}

namespace HmiGuiFramework {

class ViewCache;

/// The popups that were requested, ordered by priority and age. The topmost is on the screen and its state is active;
/// those beneath wait. Drives the popup states of the state machine.
class PopupStack : public QObject
{
    Q_OBJECT

public:
    explicit PopupStack(ViewCache* cache);
    ~PopupStack() override;

    /// Where popups are shown. They get its size.
    void setArea(QQuickItem* area);

    QString top() const { return m_entries.isEmpty() ? QString() : m_entries.last().descriptor.identifier; }
    QStringList names() const;

    /// Puts a popup on the stack or renews it. False, with \a error, when it would be topmost but cannot be created or entered.
    bool push(const PopupDescriptor& descriptor, HmiStateMachine::PopupState* state, const QVariant& data,
              QString* error);

    void remove(const QString& name);

    /// The machine has entered a popup's state. True when this stack had asked for that.
    bool stateEntered(HmiStateMachine::NamedState* state);

    /// The machine has left a popup's state. If nobody asked for that here, the popup is gone.
    void stateExited(HmiStateMachine::NamedState* state);

    /// Makes the topmost popup's item anew, after the cache was cleared.
    void reload();

Q_SIGNALS:
    void topChanged();

private:
    struct Entry
    {
        PopupDescriptor descriptor;
        QPointer<HmiStateMachine::PopupState> state;
        QVariant data;
    };

    int indexOf(const QString& name) const;
    bool showTop(QString* error);
    void hideShown();
    void leaveRegion(HmiStateMachine::PopupState* state);

    ViewCache* const m_cache;
    QPointer<QQuickItem> m_area;
    QVector<Entry> m_entries;  // last is topmost
    QSet<QObject*> m_expected; // states that were requested and are not entered yet; never followed
    QString m_shown;
    QPointer<HmiStateMachine::PopupState> m_shownState;
    QPointer<QQuickItem> m_item;
    QTimer m_timeout;
};

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#include "popupstack.h"

#include "guicategory.h"
#include "viewcache.h"

#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

using HmiStateMachine::NamedState;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateMachine;

namespace HmiGuiFramework {

PopupStack::PopupStack(ViewCache* cache)
    : m_cache(cache)
{
    m_timeout.setSingleShot(true);
    connect(&m_timeout, &QTimer::timeout, this, [this] { remove(top()); });
}

PopupStack::~PopupStack() = default;

void PopupStack::setArea(QQuickItem* area)
{
    if (m_area)
        m_area->disconnect(this);
    m_area = area;
    const auto fit = [this] {
        if (m_item && m_area)
            m_item->setSize(m_area->size());
    };
    connect(area, &QQuickItem::widthChanged, this, fit);
    connect(area, &QQuickItem::heightChanged, this, fit);
    if (m_item) {
        m_item->setParentItem(area);
        fit();
    }
}

QStringList PopupStack::names() const
{
    QStringList all;
    for (const Entry& entry : m_entries)
        all.append(entry.descriptor.identifier);
    return all;
}

int PopupStack::indexOf(const QString& name) const
{
    return int(names().indexOf(name));
}

bool PopupStack::push(const PopupDescriptor& descriptor, PopupState* state, const QVariant& data, QString* error)
{
    const QVector<Entry> before = m_entries;
    const int known = indexOf(descriptor.identifier);
    if (known >= 0)
        m_entries.remove(known);
    int place = int(m_entries.size());
    while (place > 0 && m_entries.at(place - 1).descriptor.priority > descriptor.priority)
        --place;
    m_entries.insert(place, {descriptor, state, data});
    if (showTop(error))
        return true;
    m_entries = before;
    return false;
}

void PopupStack::remove(const QString& name)
{
    const int index = indexOf(name);
    if (index < 0)
        return;
    const bool wasTop = index == m_entries.size() - 1;
    m_entries.remove(index);
    if (!wasTop)
        return;
    QString error;
    while (!m_entries.isEmpty() && !showTop(&error)) {
        qCWarning(guiCategory).noquote() << "popup" << top() << "dropped:" << error;
        m_entries.removeLast();
    }
    if (m_entries.isEmpty()) {
        leaveRegion(m_shownState);
        hideShown();
        Q_EMIT topChanged();
    }
}

/// Back to where the popups' region starts: no popup.
void PopupStack::leaveRegion(PopupState* state)
{
    auto* const machine = StateMachine::instance();
    if (state && state->machine() == machine && state->parentState() && state->parentState()->initialState())
        machine->requestState(state->parentState()->initialState());
}

bool PopupStack::stateEntered(NamedState* state)
{
    return m_expected.remove(state);
}

void PopupStack::stateExited(NamedState* state)
{
    // Whoever shows another popup or removes this one has changed the top by now.
    if (!m_entries.isEmpty() && state && m_entries.last().state == state)
        remove(top());
}

void PopupStack::reload()
{
    m_item.clear();
    m_shown.clear();
    QString error;
    if (!m_entries.isEmpty() && !showTop(&error)) {
        qCWarning(guiCategory).noquote() << "popup" << top() << "dropped:" << error;
        remove(top());
    }
}

bool PopupStack::showTop(QString* error)
{
    const Entry& entry = m_entries.last();
    if (entry.state.isNull()) {
        *error = QStringLiteral("its state is gone");
        return false;
    }
    QQuickItem* const item = m_cache->item(entry.descriptor.identifier, entry.descriptor.url, error);
    if (!item)
        return false;
    if (!StateMachine::instance()->requestState(entry.state.data())) {
        *error = QStringLiteral("the state machine does not run");
        return false;
    }
    if (!entry.state->active())
        m_expected.insert(entry.state.data());
    if (item->metaObject()->indexOfProperty("popupData") >= 0)
        item->setProperty("popupData", entry.data);
    if (m_shown == entry.descriptor.identifier && m_item == item)
        return true;
    // Within a region the machine leaves the one state for the other by itself.
    if (m_shownState && m_shownState->parentState() != entry.state->parentState())
        leaveRegion(m_shownState);
    hideShown();
    m_shown = entry.descriptor.identifier;
    m_shownState = entry.state;
    m_item = item;
    item->setParentItem(m_area);
    if (m_area)
        item->setSize(m_area->size());
    item->setVisible(true);
    if (entry.descriptor.timeout > 0)
        m_timeout.start(entry.descriptor.timeout);
    Q_EMIT topChanged();
    return true;
}

void PopupStack::hideShown()
{
    m_timeout.stop();
    if (m_item)
        m_item->setVisible(false);
    m_item.clear();
    m_shown.clear();
    m_shownState.clear();
}

} // namespace HmiGuiFramework

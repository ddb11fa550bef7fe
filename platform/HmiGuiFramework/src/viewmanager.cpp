// SPDX-License-Identifier: MIT
#include "viewmanager.h"

#include "appsettings.h"
#include "descriptorparser.h"
#include "guicategory.h"
#include "jsonfile.h"
#include "popupstack.h"
#include "transitionmanager.h"
#include "viewcache.h"

#include <HmiStateMachine/HmiLayeredState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QQmlContext>
#include <QQmlEngine>
#include <QQuickWindow>

using HmiStateMachine::HmiLayeredState;
using HmiStateMachine::NamedState;
using HmiStateMachine::PopupState;
using HmiStateMachine::StateMachine;

namespace HmiGuiFramework {

namespace {

template <typename Descriptor>
Descriptor inVariation(Descriptor descriptor, const QString& variation)
{
    descriptor.url = descriptor.variations.value(variation, descriptor.variations.value(QString()));
    return descriptor;
}

template <typename Descriptor>
void setVariation(QHash<QString, Descriptor>* descriptors, const QString& variation)
{
    for (Descriptor& descriptor : *descriptors)
        descriptor = inVariation(descriptor, variation);
}

void setIfPresent(QObject* object, const char* property, const QVariant& value)
{
    if (object->metaObject()->indexOfProperty(property) >= 0)
        object->setProperty(property, value);
}

template <typename Value>
void add(QHash<QString, Value>* table, const QString& key, const Value& value, const char* kind, const QString& file)
{
    if (table->contains(key))
        qCWarning(guiCategory).noquote() << file << kind << key << "is loaded already; the first one stays";
    else
        table->insert(key, value);
}

} // namespace

ViewManager::ViewManager(QQmlEngine* engine, TransitionManager* transitionManager, QObject* parent)
    : QObject(parent)
    , m_transitionManager(transitionManager)
    , m_stage(std::make_unique<QQuickItem>())
    , m_viewArea(m_stage.get())
    , m_cache(std::make_unique<ViewCache>(engine))
    , m_popups(std::make_unique<PopupStack>(m_cache.get()))
{
    m_popups->setArea(m_stage.get());
    connect(m_popups.get(), &PopupStack::topChanged, this, &ViewManager::currentPopupChanged);
    connect(transitionManager, &TransitionManager::finished, this, &ViewManager::transitionFinished);
    connect(StateMachine::instance(), &StateMachine::stateEntered, this, &ViewManager::stateEntered);
    connect(StateMachine::instance(), &StateMachine::stateExited, this, &ViewManager::stateExited);
    // While the application object still stands: items and window give back what they took from each other.
    connect(engine, &QObject::destroyed, this, [this] {
        m_cache->engineDestroyed();
        if (QQuickWindow* const window = m_stage->window())
            window->destroy();
    });
    connect(AppSettings::instance(), &AppSettings::uiVariationChanged, this, &ViewManager::applyVariation);
    engine->rootContext()->setContextProperty(QStringLiteral("_viewManager"), this);
}

ViewManager::~ViewManager()
{
    m_popups.reset();
    m_cache.reset();
}

void ViewManager::loadModule(const QString& viewDescriptor, const QString& prefixOrId, int flagOrDomain)
{
    const ParsedDescriptor parsed = parseDescriptor(resolvedPath(viewDescriptor), prefixOrId, flagOrDomain);
    for (const QString& error : parsed.errors)
        qCWarning(guiCategory).noquote() << QStringLiteral("view descriptor %1: %2").arg(viewDescriptor, error);
    const QString variation = AppSettings::instance()->uiVariation();
    for (const ViewDescriptor& view : parsed.views)
        add(&m_descriptor.views, view.identifier, inVariation(view, variation), "view", viewDescriptor);
    for (const PopupDescriptor& popup : parsed.popups)
        add(&m_descriptor.popups, popup.identifier, inVariation(popup, variation), "popup", viewDescriptor);
    for (const TransientDescriptor& transient : parsed.transients)
        add(&m_transients.transients, transient.identifier, transient, "transient", viewDescriptor);
    for (const auto& component : parsed.components)
        add(&m_transients.components, component.first, component.second, "component", viewDescriptor);
    if (!parsed.shell.isEmpty())
        setShell(parsed.shell);
}

/// The shell is the frame around the views; its properties `viewArea` and `popupArea` say where they go.
void ViewManager::setShell(const QUrl& url)
{
    QString error;
    QQuickItem* const shell = m_cache->item(QString(), url, &error);
    if (!shell) {
        qCWarning(guiCategory).noquote() << "shell" << url.toString() << "cannot be created:" << error;
        return;
    }
    shell->setParentItem(m_stage.get());
    shell->setVisible(true);
    const auto fit = [this, shell] { shell->setSize(m_stage->size()); };
    connect(m_stage.get(), &QQuickItem::widthChanged, shell, fit);
    connect(m_stage.get(), &QQuickItem::heightChanged, shell, fit);
    fit();
    if (auto* const area = shell->property("viewArea").value<QQuickItem*>())
        m_viewArea = area;
    if (auto* const area = shell->property("popupArea").value<QQuickItem*>())
        m_popups->setArea(area);
    const auto fitView = [this] {
        if (QQuickItem* const view = currentItem())
            view->setSize(m_viewArea->size());
    };
    connect(m_viewArea, &QQuickItem::widthChanged, this, fitView);
    connect(m_viewArea, &QQuickItem::heightChanged, this, fitView);
}

QQuickItem* ViewManager::currentItem() const
{
    return m_currentView.isEmpty() ? nullptr : m_cache->existing(m_currentView);
}

QString ViewManager::currentPopup() const
{
    return m_popups->top();
}

bool ViewManager::refuse(const QString& name, const QString& reason)
{
    qCWarning(guiCategory).noquote() << QStringLiteral("request for \"%1\" refused: %2").arg(name.left(128), reason);
    Q_EMIT requestRefused(name, reason);
    return false;
}

/// The view that is shown once \a state has been entered: its own, or that of the innermost initial state.
QString ViewManager::viewOf(NamedState* state) const
{
    QString view;
    for (QAbstractState* inner = state; inner;) {
        if (auto* const named = qobject_cast<NamedState*>(inner); named && m_descriptor.views.contains(named->name()))
            view = named->name();
        auto* const compound = qobject_cast<QState*>(inner);
        inner = compound ? compound->initialState() : nullptr;
    }
    return view;
}

bool ViewManager::requestView(const QString& name, const QVariant& data, bool reverse, const QVariant& transition)
{
    NamedState* const state = StateMachine::instance()->findState(name);
    if (!state)
        return refuse(name, m_descriptor.views.contains(name) ? QStringLiteral("the view has no state of its name")
                                                              : QStringLiteral("there is no such view or state"));
    const QString view = viewOf(state);
    if (view.isEmpty())
        return refuse(name, QStringLiteral("the state leads to no view"));
    const QString transitionName = transition.toString();
    if (!transitionName.isEmpty() && !TransitionManager::isTransition(transitionName))
        return refuse(name, QStringLiteral("there is no transition \"%1\"").arg(transitionName.left(64)));
    QString error;
    QQuickItem* const item = m_cache->item(view, m_descriptor.views.value(view).url, &error);
    if (!item)
        return refuse(name, error);
    if (!StateMachine::instance()->requestState(state))
        return refuse(name, QStringLiteral("the state machine does not run"));
    if (state->active()) {
        if (data.isValid() && view == m_currentView)
            setIfPresent(item, "viewData", data);
        return true;
    }
    m_requests.insert(view, {data, reverse, transitionName});
    return true;
}

void ViewManager::requestViews(const QStringList& names)
{
    const bool idle = m_batch.isEmpty() && m_batchView.isEmpty();
    m_batch += names;
    if (idle)
        requestNextOfBatch();
}

void ViewManager::requestNextOfBatch()
{
    m_batchView.clear();
    while (!m_batch.isEmpty() && m_batchView.isEmpty()) {
        const QString name = m_batch.takeFirst();
        NamedState* const state = StateMachine::instance()->findState(name);
        const bool shownAlready = state && state->active();
        if (requestView(name) && !shownAlready)
            m_batchView = viewOf(state);
    }
}

bool ViewManager::back()
{
    NamedState* const state = StateMachine::instance()->findState(m_currentView);
    for (QState* ancestor = state ? state->parentState() : nullptr; ancestor; ancestor = ancestor->parentState()) {
        auto* const layered = qobject_cast<HmiLayeredState*>(ancestor);
        if (layered && layered->back()) {
            m_goingBack = true;
            return true;
        }
    }
    return false;
}

void ViewManager::stateEntered(NamedState* state)
{
    if (m_descriptor.popups.contains(state->name()) && qobject_cast<PopupState*>(state)) {
        if (!m_popups->stateEntered(state) && currentPopup() != state->name())
            requestPopup(state->name());
        return;
    }
    if (!m_descriptor.views.contains(state->name()))
        return;
    // One step of the machine may enter a state and its children; only the innermost view is shown.
    const bool scheduled = !m_nextView.isEmpty();
    m_nextView = state->name();
    if (!scheduled)
        QMetaObject::invokeMethod(this, &ViewManager::showNextView, Qt::QueuedConnection);
}

void ViewManager::stateExited(NamedState* state)
{
    if (!qobject_cast<PopupState*>(state) || currentPopup() != state->name())
        return;
    // The machine may be on its way back into it within this step.
    QMetaObject::invokeMethod(
        this,
        [this, state = QPointer<NamedState>(state)] {
            if (state && !state->active())
                m_popups->stateExited(state);
        },
        Qt::QueuedConnection);
}

void ViewManager::showNextView()
{
    if (m_transitionManager)
        m_transitionManager->complete(); // the view that is still coming in counts as shown
    const QString name = std::exchange(m_nextView, QString());
    const Request request = m_requests.take(name);
    const bool reverse = request.reverse || std::exchange(m_goingBack, false);
    const ViewDescriptor descriptor = m_descriptor.views.value(name);
    QString error;
    QQuickItem* const incoming = m_cache->item(name, descriptor.url, &error);
    if (!incoming) {
        qCWarning(guiCategory).noquote() << "view" << name << "cannot be created:" << error;
        if (name == m_batchView)
            requestNextOfBatch();
        return;
    }
    if (request.data.isValid())
        setIfPresent(incoming, "viewData", request.data);
    QQuickItem* const outgoing = currentItem();
    incoming->setParentItem(m_viewArea);
    incoming->setSize(m_viewArea->size());
    const bool changed = name != m_currentView;
    m_currentView = name;
    if (changed)
        Q_EMIT currentViewChanged();
    if (m_transitionManager)
        m_transitionManager->run(outgoing, incoming,
                                 request.transition.isEmpty() ? descriptor.transition : request.transition, reverse);
}

void ViewManager::transitionFinished()
{
    if (m_currentView.isEmpty())
        return;
    QStringList pinned = m_popups->names();
    pinned.append({m_currentView, m_nextView, QString()});
    for (const ViewDescriptor& view : std::as_const(m_descriptor.views))
        if (view.keepAlive)
            pinned.append(view.identifier);
    m_cache->trim(AppSettings::instance()->viewCacheSize(), pinned);
    Q_EMIT viewShown(m_currentView);
    if (m_currentView == m_batchView)
        requestNextOfBatch();
}

bool ViewManager::requestPopup(const QString& name, const QVariant& data)
{
    if (!m_descriptor.popups.contains(name))
        return refuse(name, QStringLiteral("there is no such popup"));
    auto* const state = qobject_cast<PopupState*>(StateMachine::instance()->findState(name));
    if (!state)
        return refuse(name, QStringLiteral("the popup has no popup state of its name"));
    QString error;
    if (!m_popups->push(m_descriptor.popups.value(name), state, data, &error))
        return refuse(name, error);
    return true;
}

void ViewManager::closePopup(const QString& name)
{
    m_popups->remove(name);
}

void ViewManager::reloadViews()
{
    if (m_transitionManager)
        m_transitionManager->complete();
    // The shell stays: it holds the areas that everything else is shown in.
    m_cache->trim(0, {QString()});
    if (!m_currentView.isEmpty()) {
        m_nextView = m_currentView;
        showNextView();
    }
    m_popups->reload();
}

void ViewManager::applyVariation()
{
    setVariation(&m_descriptor.views, AppSettings::instance()->uiVariation());
    setVariation(&m_descriptor.popups, AppSettings::instance()->uiVariation());
    reloadViews();
    Q_EMIT uiVariationChanged();
}

void ViewManager::currentViewIdle()
{
    QQuickItem* const view = currentItem();
    if (view && view->metaObject()->indexOfMethod("viewIdle()") >= 0)
        QMetaObject::invokeMethod(view, "viewIdle");
}

} // namespace HmiGuiFramework

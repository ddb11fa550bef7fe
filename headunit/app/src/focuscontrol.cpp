// SPDX-License-Identifier: MIT
#include "focuscontrol.h"

#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>

#include <QEvent>
#include <QQuickItem>
#include <QQuickWindow>

#include <algorithm>

using AL2HMIBridge::GlobalSource;
using AL2HMIBridge::KeySource;
using HmiGuiFramework::AppSettings;
using HmiGuiFramework::ViewManager;

namespace {

constexpr int tuneUp = 54;
constexpr int tuneDown = 55;
constexpr int tunePress = 110;
constexpr int restAfter = 10000; // ms

const char* const focused = "focused";

ViewManager* viewManager()
{
    return HmiGuiFramework::DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
}

bool isFlickable(const QQuickItem* item)
{
    return item->inherits("QQuickFlickable");
}

bool takesFocus(const QQuickItem* item)
{
    const QVariant active = item->property("active");
    return item->property(focused).isValid() && (!active.isValid() || active.toBool()) && item->width() > 0;
}

bool hasOperation(const QObject* object, const char* signature)
{
    return object->metaObject()->indexOfMethod(signature) >= 0;
}

/// Rows of a list are made in the order in which they come into sight.
void sortByPlace(QList<QQuickItem*>& items)
{
    const bool mirrored = AppSettings::instance()->rightToLeft();
    std::stable_sort(items.begin(), items.end(), [mirrored](const QQuickItem* a, const QQuickItem* b) {
        if (!qFuzzyCompare(1 + a->y(), 1 + b->y()))
            return a->y() < b->y();
        return mirrored ? a->x() > b->x() : a->x() < b->x();
    });
}

void collect(QQuickItem* item, QList<QQuickItem*>& found)
{
    if (!item->isVisible() || !item->isEnabled() || qFuzzyIsNull(item->opacity()))
        return;
    if (takesFocus(item)) {
        found.append(item);
    }
    QList<QQuickItem*> children = item->childItems();
    const QQuickItem* const view = item->parentItem();
    const bool isList = view && view->inherits("QQuickItemView");
    if (isList)
        sortByPlace(children);
    const QVariant reachable = isList ? view->property("reachable") : QVariant();
    for (QQuickItem* const child : std::as_const(children))
        if (!reachable.isValid() || child->y() + child->height() <= reachable.toDouble() + 1)
            collect(child, found);
}

/// Moves what scrolls so that the item is seen whole, with a piece of the one beside it.
void bringIntoSight(QQuickItem* item)
{
    for (QQuickItem* view = item->parentItem(); view; view = view->parentItem()) {
        if (!isFlickable(view))
            continue;
        const QRectF place = item->mapRectToItem(view, QRectF(0, 0, item->width(), item->height()));
        const auto scroll = [view](const char* property, double start, double end, double size) {
            const double margin = std::min(end - start, (size - (end - start)) / 2) / 2;
            const double by = start < margin ? start - margin : end > size - margin ? end - size + margin : 0;
            view->setProperty(property, view->property(property).toDouble() + by);
        };
        if (view->property("contentHeight").toDouble() > view->height())
            scroll("contentY", place.top(), place.bottom(), view->height());
        if (view->property("contentWidth").toDouble() > view->width())
            scroll("contentX", place.left(), place.right(), view->width());
        QMetaObject::invokeMethod(view, "returnToBounds");
    }
}

QPointF middleOf(const QQuickItem* item)
{
    return item->mapToScene(QPointF(item->width() / 2, item->height() / 2));
}

int nearest(const QList<QQuickItem*>& items, const QPointF& place)
{
    const auto distance = [&place](const QQuickItem* item) { return (middleOf(item) - place).manhattanLength(); };
    const auto found = std::min_element(items.cbegin(), items.cend(), [&](const QQuickItem* a, const QQuickItem* b) {
        return distance(a) < distance(b);
    });
    return int(found - items.cbegin());
}

} // namespace

FocusControl::FocusControl(QObject* parent)
    : QObject(parent)
{
    m_rest.setSingleShot(true);
    m_rest.setInterval(restAfter);
    connect(&m_rest, &QTimer::timeout, this, &FocusControl::leave);
    connect(KeySource::instance(), &KeySource::keyEvent, this, &FocusControl::handleKey);
}

void FocusControl::attach(QQuickWindow* window)
{
    m_window = window;
    window->installEventFilter(this);
    // Queued: what comes is on the screen by then.
    connect(viewManager(), &ViewManager::viewShown, this, &FocusControl::lookAgain, Qt::QueuedConnection);
    connect(viewManager(), &ViewManager::currentPopupChanged, this, &FocusControl::lookAgain, Qt::QueuedConnection);
}

void FocusControl::handleKey(int key, int state)
{
    if (key == tunePress && state == KeySource::KeyShortReleased)
        press();
    else if ((key == tuneUp || key == tuneDown) && state == KeySource::KeyStepped)
        turn(key == tuneUp ? 1 : -1);
}

/// Popups first, then the view, the status bar and the rail: from what matters now to what is always there.
QList<QQuickItem*> FocusControl::items() const
{
    QList<QQuickItem*> found;
    const auto layer = [](const char* property) {
        QQuickItem* const stage = viewManager()->stage();
        const auto children = stage->childItems();
        for (const QQuickItem* const shell : children)
            if (auto* const item = qvariant_cast<QQuickItem*>(shell->property(property)))
                return item;
        return static_cast<QQuickItem*>(nullptr);
    };
    QQuickItem* const popups = layer("popupArea");
    if (popups) {
        collect(popups, found);
        const auto children = popups->childItems();
        const bool covered = std::any_of(children.cbegin(), children.cend(), [](const QQuickItem* popup) {
            return popup->isVisible() && !popup->property("leavesViewInUse").toBool();
        });
        if (covered)
            return found;
    }
    for (const char* const property : {"viewArea", "statusArea", "railArea"})
        if (QQuickItem* const item = layer(property))
            collect(item, found);
    return found;
}

void FocusControl::begin()
{
    m_inUse = true;
    GlobalSource::instance()->reserveTuneKnob(true);
    Q_EMIT inUseChanged();
    focus(items().value(0));
}

void FocusControl::leave()
{
    m_rest.stop();
    if (!m_inUse)
        return;
    m_inUse = false;
    focus(nullptr);
    GlobalSource::instance()->reserveTuneKnob(false);
    Q_EMIT inUseChanged();
}

void FocusControl::turn(int steps)
{
    if (!m_inUse)
        return;
    m_rest.start();
    if (m_adjusting && m_item) {
        QMetaObject::invokeMethod(m_item, "adjust", Q_ARG(QVariant, steps));
        return;
    }
    const QList<QQuickItem*> all = items();
    if (all.isEmpty())
        return;
    // A list that is filled anew has other items in the same places.
    const int at = m_item ? int(all.indexOf(m_item)) : nearest(all, m_place);
    focus(all.at(at < 0 ? 0 : std::clamp(at + steps, 0, int(all.size()) - 1)));
}

void FocusControl::press()
{
    m_rest.start();
    if (!m_inUse)
        return begin();
    if (!m_item)
        return focus(items().value(0));
    if (hasOperation(m_item, "adjust(QVariant)"))
        setAdjusting(!m_adjusting);
    else if (hasOperation(m_item, "activate()"))
        QMetaObject::invokeMethod(m_item, "activate");
    else
        QMetaObject::invokeMethod(m_item, "clicked");
}

void FocusControl::focus(QQuickItem* item)
{
    if (m_item)
        m_item->setProperty(focused, false);
    setAdjusting(false);
    m_item = item;
    if (!item)
        return;
    item->setProperty(focused, true);
    bringIntoSight(item);
    m_place = middleOf(item);
}

void FocusControl::setAdjusting(bool adjusting)
{
    if (adjusting == m_adjusting)
        return;
    m_adjusting = adjusting;
    Q_EMIT adjustingChanged();
}

/// Another screen, or a popup more or less: the knob is at what is there.
void FocusControl::lookAgain()
{
    if (!m_inUse)
        return;
    const QList<QQuickItem*> all = items();
    if (!all.contains(m_item))
        focus(all.value(0));
}

bool FocusControl::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::MouseButtonPress || event->type() == QEvent::TouchBegin)
        leave();
    return QObject::eventFilter(watched, event);
}

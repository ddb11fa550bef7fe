// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QObject>
#include <QPointF>
#include <QPointer>
#include <QTimer>

QT_BEGIN_NAMESPACE
class QQuickItem;
class QQuickWindow;
QT_END_NAMESPACE

/// \brief Lets the tune knob use every screen. GUI thread only.
///
/// A press of the knob begins: the first item of the screen that takes a `focused` gets it, and the vehicle is told not to tune. Steps
/// lead to the items after and before, in the order in which they are written down, lists by their rows; a press activates
/// the item, or lets one that has `adjust(steps)` be turned until the next press. A touch, or ten seconds without the knob, end it.
///
/// An item takes part with a property `focused`, unless its `active` is false; it is activated by its operation `activate()` or else its
/// signal `clicked()`. A popup keeps the knob to itself unless it has a true `leavesViewInUse`.
class FocusControl : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool inUse READ isInUse NOTIFY inUseChanged)
    Q_PROPERTY(bool adjusting READ isAdjusting NOTIFY adjustingChanged)

public:
    explicit FocusControl(QObject* parent);

    /// \brief Takes charge of what \a window, which outlives it, shows.
    void attach(QQuickWindow* window);

    bool isInUse() const { return m_inUse; }
    bool isAdjusting() const { return m_adjusting; } ///< the knob turns a value
    QQuickItem* item() const { return m_item; }      ///< at which the knob is, or null

    void turn(int steps);
    void press();
    void leave();

    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    void inUseChanged();
    void adjustingChanged();

private:
    void handleKey(int key, int state);
    void begin();
    void focus(QQuickItem* item);
    void setAdjusting(bool adjusting);
    void lookAgain();
    QList<QQuickItem*> items() const;

    QPointer<QQuickWindow> m_window;
    QPointer<QQuickItem> m_item;
    QPointF m_place; ///< where it is, or was last
    QTimer m_rest;
    bool m_inUse = false;
    bool m_adjusting = false;
};

// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"

#include <QObject>
#include <QPointer>
#include <QString>

QT_BEGIN_NAMESPACE
class QParallelAnimationGroup;
class QQmlEngine;
class QQuickItem;
QT_END_NAMESPACE

namespace HmiGuiFramework {

/// \brief Animates the change from one view to the next. GUI thread only.
///
/// Transitions by name: "none", "fade", "slide-forward" (the new view comes from where reading ends) and
/// "slide-backward"; both slides are mirrored while AppSettings::rightToLeft is set. Without AppSettings::animations every
/// change is immediate.
class HMIGUIFRAMEWORK_EXPORT TransitionManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool running READ isRunning NOTIFY runningChanged)
    Q_PROPERTY(int duration READ duration WRITE setDuration NOTIFY durationChanged)
    Q_PROPERTY(
        QString defaultTransition READ defaultTransition WRITE setDefaultTransition NOTIFY defaultTransitionChanged)

public:
    /// \brief How one view follows another; the slides are mirrored with the layout.
    enum Transition { None, Fade, SlideForward, SlideBackward };
    Q_ENUM(Transition)

    TransitionManager(QQmlEngine* engine, QObject* parent);
    ~TransitionManager() override;

    /// \brief Whether this is the name of a transition.
    static bool isTransition(const QString& name);

    bool isRunning() const { return m_animation != nullptr; } ///< whether a transition is on the screen

    int duration() const { return m_duration; } ///< milliseconds; 220 by default
    void setDuration(int milliseconds);         ///< 0 or less turns all animation off

    QString defaultTransition() const { return m_defaultTransition; } ///< "fade" at first
    void setDefaultTransition(const QString& name);                   ///< unknown names are refused with a warning

    /// \brief Replaces \a outgoing by \a incoming; either may be null. A running transition is completed at once.
    ///
    /// \a name is a transition's name or empty for the default one; \a reverse turns a slide round. When done, the
    /// outgoing item is invisible, the incoming one visible at (0, 0) and opaque, and finished() is emitted (at once
    /// when there is nothing to animate).
    void run(QQuickItem* outgoing, QQuickItem* incoming, const QString& name, bool reverse);

    /// \brief Brings a running transition to its end now.
    void complete();

Q_SIGNALS:
    void runningChanged();
    void durationChanged();
    void defaultTransitionChanged();
    void finished(); ///< the next item is on the screen alone

private:
    Transition effective(const QString& name, bool reverse) const;
    void settle();

    QPointer<QQuickItem> m_outgoing;
    QPointer<QQuickItem> m_incoming;
    QParallelAnimationGroup* m_animation = nullptr;
    int m_duration = 220;
    QString m_defaultTransition;
};

} // namespace HmiGuiFramework

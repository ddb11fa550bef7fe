// SPDX-License-Identifier: MIT
#include "transitionmanager.h"

#include "appsettings.h"
#include "guicategory.h"

#include <QHash>
#include <QParallelAnimationGroup>
#include <QPropertyAnimation>
#include <QQuickItem>

namespace HmiGuiFramework {

namespace {

const QHash<QString, TransitionManager::Transition>& transitionsByName()
{
    static const QHash<QString, TransitionManager::Transition> byName{
        {QStringLiteral("none"), TransitionManager::None},
        {QStringLiteral("fade"), TransitionManager::Fade},
        {QStringLiteral("slide-forward"), TransitionManager::SlideForward},
        {QStringLiteral("slide-backward"), TransitionManager::SlideBackward},
    };
    return byName;
}

void animate(QParallelAnimationGroup* group, QQuickItem* item, const char* property, qreal from, qreal to)
{
    auto* const animation = new QPropertyAnimation(item, property, group);
    animation->setStartValue(from);
    animation->setEndValue(to);
    animation->setEasingCurve(QEasingCurve::OutCubic);
    item->setProperty(property, from);
    group->addAnimation(animation);
}

} // namespace

TransitionManager::TransitionManager(QQmlEngine*, QObject* parent)
    : QObject(parent)
    , m_defaultTransition(QStringLiteral("fade"))
{
}

TransitionManager::~TransitionManager() = default;

bool TransitionManager::isTransition(const QString& name)
{
    return transitionsByName().contains(name);
}

void TransitionManager::setDuration(int milliseconds)
{
    if (milliseconds == m_duration)
        return;
    m_duration = milliseconds;
    Q_EMIT durationChanged();
}

void TransitionManager::setDefaultTransition(const QString& name)
{
    if (!isTransition(name)) {
        qCWarning(guiCategory).noquote() << "default transition: there is no transition" << name.left(64);
        return;
    }
    if (name == m_defaultTransition)
        return;
    m_defaultTransition = name;
    Q_EMIT defaultTransitionChanged();
}

TransitionManager::Transition TransitionManager::effective(const QString& name, bool reverse) const
{
    if (m_duration <= 0 || !AppSettings::instance()->animations())
        return None;
    const Transition transition = transitionsByName().value(isTransition(name) ? name : m_defaultTransition);
    if (transition != SlideForward && transition != SlideBackward)
        return transition;
    const bool forward = (transition == SlideForward) != reverse;
    return forward ? SlideForward : SlideBackward;
}

void TransitionManager::run(QQuickItem* outgoing, QQuickItem* incoming, const QString& name, bool reverse)
{
    complete();
    m_outgoing = outgoing == incoming ? nullptr : outgoing;
    m_incoming = incoming;
    const Transition transition = effective(name, reverse);
    if (transition == None || !outgoing || !incoming || outgoing == incoming) {
        settle();
        return;
    }

    auto* const group = new QParallelAnimationGroup(this);
    if (transition == Fade) {
        incoming->setZ(outgoing->z() + 1);
        animate(group, incoming, "opacity", 0, 1);
    } else {
        const bool fromRight = (transition == SlideForward) != AppSettings::instance()->rightToLeft();
        const qreal distance = incoming->width() * (fromRight ? 1 : -1);
        animate(group, incoming, "x", distance, 0);
        animate(group, outgoing, "x", 0, -distance);
    }
    for (int i = 0; i < group->animationCount(); ++i)
        static_cast<QPropertyAnimation*>(group->animationAt(i))->setDuration(m_duration);
    incoming->setVisible(true);
    m_animation = group;
    connect(group, &QAbstractAnimation::finished, this, &TransitionManager::complete);
    group->start();
    Q_EMIT runningChanged();
}

void TransitionManager::complete()
{
    if (!m_animation)
        return;
    m_animation->stop();
    m_animation->deleteLater();
    m_animation = nullptr;
    settle();
    Q_EMIT runningChanged();
}

void TransitionManager::settle()
{
    if (m_outgoing) {
        m_outgoing->setVisible(false);
        m_outgoing->setX(0);
    }
    if (m_incoming) {
        m_incoming->setX(0);
        m_incoming->setZ(0);
        m_incoming->setOpacity(1);
        m_incoming->setVisible(true);
    }
    m_outgoing.clear();
    m_incoming.clear();
    Q_EMIT finished();
}

} // namespace HmiGuiFramework

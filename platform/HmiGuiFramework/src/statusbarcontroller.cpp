// SPDX-License-Identifier: MIT
#include "statusbarcontroller.h"

#include "guicategory.h"
#include "viewmanager.h"

namespace HmiGuiFramework {

StatusBarController::StatusBarController(QQmlEngine*, ViewManager* viewManager, QObject* parent)
    : QObject(parent)
    , m_viewManager(viewManager)
{
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &StatusBarController::dismissTransient);
}

StatusBarController::~StatusBarController() = default;

TransientCollection StatusBarController::transients() const
{
    return m_viewManager->transients();
}

void StatusBarController::requestTransientWidget(const QString& identifier, int timeout)
{
    const TransientCollection known = transients();
    const auto found = known.transients.constFind(identifier);
    if (found == known.transients.constEnd()) {
        qCWarning(guiCategory).noquote() << "transient" << identifier.left(128) << "refused: it is not loaded";
        return;
    }
    const QUrl url = known.components.value(found->componentKey).url;
    if (url.isEmpty()) {
        qCWarning(guiCategory).noquote() << "transient" << identifier << "refused: there is no component"
                                         << found->componentKey;
        return;
    }
    m_timer.start(timeout > 0 ? timeout : found->timeout);
    show(identifier, url);
}

void StatusBarController::dismissTransient()
{
    m_timer.stop();
    show(QString(), QUrl());
}

void StatusBarController::show(const QString& identifier, const QUrl& url)
{
    if (identifier == m_transient && url == m_url)
        return;
    m_transient = identifier;
    m_url = url;
    Q_EMIT transientChanged();
}

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#include "hmiaction.h"

namespace HmiGuiFramework {

HmiAction::HmiAction(QObject* parent)
    : QObject(parent)
{
}

HmiAction::~HmiAction() = default;

void HmiAction::setText(const QString& text)
{
    if (text == m_text)
        return;
    m_text = text;
    Q_EMIT textChanged();
}

void HmiAction::setIcon(const QString& icon)
{
    if (icon == m_icon)
        return;
    m_icon = icon;
    Q_EMIT iconChanged();
}

void HmiAction::setOrder(int order)
{
    if (order == m_order)
        return;
    m_order = order;
    Q_EMIT orderChanged();
}

void HmiAction::setEnabled(bool enabled)
{
    if (enabled == m_enabled)
        return;
    m_enabled = enabled;
    Q_EMIT enabledChanged();
}

void HmiAction::trigger()
{
    if (m_enabled)
        Q_EMIT triggered();
}

} // namespace HmiGuiFramework

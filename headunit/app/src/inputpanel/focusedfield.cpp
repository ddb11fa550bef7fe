// SPDX-License-Identifier: MIT
#include "focusedfield.h"

#include <QGuiApplication>
#include <QInputMethodEvent>
#include <QKeyEvent>
#include <QQuickItem>
#include <QTextCharFormat>

namespace {

bool takesText(QObject* object)
{
    QInputMethodQueryEvent query(Qt::ImEnabled);
    return object && QCoreApplication::sendEvent(object, &query) && query.value(Qt::ImEnabled).toBool();
}

} // namespace

FocusedField::FocusedField(QObject* parent)
    : QObject(parent)
{
    connect(qGuiApp, &QGuiApplication::focusObjectChanged, this, &FocusedField::follow);
    follow(QGuiApplication::focusObject());
}

bool FocusedField::isTyping()
{
    return takesText(QGuiApplication::focusObject());
}

void FocusedField::follow(QObject* focus)
{
    QObject* const field = takesText(focus) ? focus : nullptr;
    if (field == m_field)
        return;
    if (m_field)
        disconnect(m_field, nullptr, this, nullptr);
    m_field = field;
    if (field)
        connect(field, &QObject::destroyed, this, [this] { follow(nullptr); });
    if (auto* const item = qobject_cast<QQuickItem*>(field))
        connect(item, &QQuickItem::visibleChanged, this, &FocusedField::leave); // whose screen goes
    Q_EMIT changed();
}

QVariant FocusedField::ask(Qt::InputMethodQuery query) const
{
    QInputMethodQueryEvent event(query);
    return m_field && QCoreApplication::sendEvent(m_field, &event) ? event.value(query) : QVariant();
}

Qt::InputMethodHints FocusedField::hints() const
{
    return Qt::InputMethodHints(ask(Qt::ImHints).toInt());
}

QString FocusedField::textBeforeCursor() const
{
    return ask(Qt::ImSurroundingText).toString().left(ask(Qt::ImCursorPosition).toInt());
}

double FocusedField::bottomOn(const QQuickItem* layer) const
{
    const auto* const item = qobject_cast<QQuickItem*>(m_field);
    return item && layer && layer->isAncestorOf(item) ? item->mapToItem(layer, QPointF(0, item->height())).y() : 0;
}

void FocusedField::commit(const QString& text)
{
    QInputMethodEvent event;
    event.setCommitString(text);
    if (m_field)
        QCoreApplication::sendEvent(m_field, &event);
}

void FocusedField::setPreliminary(const QString& text)
{
    QTextCharFormat underlined;
    underlined.setFontUnderline(true);
    QInputMethodEvent event(text, {{QInputMethodEvent::TextFormat, 0, int(text.size()), underlined}});
    if (m_field)
        QCoreApplication::sendEvent(m_field, &event);
}

void FocusedField::press(Qt::Key key)
{
    for (const QEvent::Type type : {QEvent::KeyPress, QEvent::KeyRelease}) {
        QKeyEvent event(type, key, Qt::NoModifier);
        if (m_field)
            QCoreApplication::sendEvent(m_field, &event);
    }
}

void FocusedField::leave()
{
    if (auto* const item = qobject_cast<QQuickItem*>(m_field))
        item->setFocus(false);
    follow(nullptr);
}

// SPDX-License-Identifier: MIT
#include "keyboard.h"

#include "focusedfield.h"

#include <HmiVehicle/keycatalogue.h>

#include <QKeyEvent>
#include <QKeySequence>
#include <QWindow>

#include <algorithm>
#include <iterator>
#include <utility>

namespace {

enum Kind { Button, DialStep };

struct Shortcut
{
    Qt::Key key;
    int hardKey;
    Kind kind = Button;
};

// Arrows, digits and letters that lie where they say what they do; those of the steering wheel in the two lower rows.
const Shortcut shortcuts[] = {
    {Qt::Key_Left, 6},
    {Qt::Key_Right, 7},
    {Qt::Key_Up, 8},
    {Qt::Key_Down, 9},
    {Qt::Key_PageUp, 54},
    {Qt::Key_PageDown, 55},
    {Qt::Key_Plus, 54, DialStep},
    {Qt::Key_Minus, 55, DialStep},
    {Qt::Key_1, 22},
    {Qt::Key_2, 23},
    {Qt::Key_3, 24},
    {Qt::Key_4, 25},
    {Qt::Key_5, 26},
    {Qt::Key_6, 27},
    {Qt::Key_Space, 83},
    {Qt::Key_S, 13},
    {Qt::Key_C, 15},
    {Qt::Key_X, 47},
    {Qt::Key_T, 35},
    {Qt::Key_M, 48},
    {Qt::Key_P, 12},
    {Qt::Key_A, 49},
    {Qt::Key_E, 50},
    {Qt::Key_Comma, 77},
    {Qt::Key_Period, 78},
    {Qt::Key_F2, 106},
    {Qt::Key_F3, 105},
    {Qt::Key_F4, 104},
    {Qt::Key_F5, 100},
    {Qt::Key_F6, 101},
    {Qt::Key_F7, 102},
    {Qt::Key_F8, 103},
    {Qt::Key_Return, 110},
    {Qt::Key_F11, 60},
    {Qt::Key_F12, 41},
    {Qt::Key_V, 10},
    {Qt::Key_J, 88},
    {Qt::Key_L, 89},
    {Qt::Key_B, 90},
    {Qt::Key_N, 91},
    {Qt::Key_G, 79},
    {Qt::Key_H, 80},
};

const Shortcut* find(int key)
{
    const auto* const found = std::find_if(std::begin(shortcuts), std::end(shortcuts),
                                           [key](const Shortcut& shortcut) { return shortcut.key == key; });
    return found == std::end(shortcuts) ? nullptr : found;
}

} // namespace

Keyboard::Keyboard(QWindow* window, Target target)
    : QObject(window)
    , m_target(std::move(target))
{
    window->installEventFilter(this);
}

Keyboard::~Keyboard()
{
    releaseAll();
}

QString Keyboard::help()
{
    QString text;
    for (const Shortcut& shortcut : shortcuts) {
        const HmiVehicle::KeyInfo* const key = HmiVehicle::KeyCatalogue::instance().find(shortcut.hardKey);
        if (!key)
            continue;
        text += QStringLiteral("  %1 %2").arg(QKeySequence(shortcut.key).toString(), -6).arg(key->text);
        if (shortcut.kind == DialStep)
            text += QStringLiteral(", one step");
        if (key->group == HmiVehicle::KeyInfo::SteeringWheel)
            text += QStringLiteral(" (steering wheel)");
        text += QLatin1Char('\n');
    }
    return text;
}

bool Keyboard::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        return press(*static_cast<QKeyEvent*>(event));
    case QEvent::KeyRelease:
        return release(*static_cast<QKeyEvent*>(event));
    case QEvent::FocusOut:
    case QEvent::Hide:
        releaseAll();
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

bool Keyboard::press(const QKeyEvent& event)
{
    const Shortcut* const shortcut = find(event.key());
    const bool isCommand = event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    if (!shortcut || isCommand || FocusedField::isTyping())
        return false;
    if (event.isAutoRepeat() || m_held.contains(event.key()))
        return true;
    if (shortcut->kind == DialStep) {
        m_target.turn(shortcut->hardKey, 1);
        return true;
    }
    m_held.insert(event.key(), shortcut->hardKey);
    m_target.press(shortcut->hardKey);
    return true;
}

/// Whatever was pressed before comes up, also when meanwhile something is typed or a modifier is held.
bool Keyboard::release(const QKeyEvent& event)
{
    if (event.isAutoRepeat())
        return m_held.contains(event.key());
    const auto held = m_held.constFind(event.key());
    if (held == m_held.constEnd())
        return false;
    const int hardKey = held.value();
    m_held.erase(held);
    m_target.release(hardKey);
    return true;
}

void Keyboard::releaseAll()
{
    const auto held = std::exchange(m_held, {});
    for (const int hardKey : held)
        m_target.release(hardKey);
}

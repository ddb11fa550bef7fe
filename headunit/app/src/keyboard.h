// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QObject>

#include <functional>

QT_BEGIN_NAMESPACE
class QKeyEvent;
class QWindow;
QT_END_NAMESPACE

/// \brief Lets the keyboard of a PC stand in for the vehicle's hard keys. GUI thread only.
///
/// A key that goes down or comes up is a hard key that does; how long it is held is the vehicle's business. Text fields have
/// precedence, and keys with Ctrl, Alt or Meta are left alone. When the window is no longer in use, all keys come up.
class Keyboard : public QObject
{
public:
    /// \brief What happens to the vehicle's keys, by their numbers.
    struct Target
    {
        std::function<void(int key)> press;
        std::function<void(int key)> release;
        std::function<void(int key, int steps)> turn; ///< a dial goes on
    };

    /// \brief Listens to \a window, which must outlive it.
    Keyboard(QWindow* window, Target target);
    ~Keyboard() override;

    /// \brief All keys and what they do, a line each, for the command line's help.
    static QString help();

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool press(const QKeyEvent& event);
    bool release(const QKeyEvent& event);
    void releaseAll();

    const Target m_target;
    QHash<int, int> m_held; ///< hard keys by the keys of the keyboard that hold them
};

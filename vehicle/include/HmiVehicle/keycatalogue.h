// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QString>

namespace HmiVehicle {

/// \brief One hard key of the vehicle.
struct KeyInfo
{
    enum Group { FrontPanel, SteeringWheel };
    enum Kind { Button, Rotary };

    int id = 0;   ///< number on the wire
    QString name; ///< what scripts and key maps call it, such as "swc_seek_up"
    QString text; ///< English text for a person
    Group group = FrontPanel;
    Kind kind = Button;
    int opposite = 0;  ///< key that turning the other way means, 0 for none
    int longPress = 0; ///< milliseconds after which it counts as held
    int repeat = 0;    ///< milliseconds between repeats while it is held, 0 for none
};

/// \brief Keys that mean something when they are held together.
struct KeyCombination
{
    int id = 0; ///< number on the wire
    QString name;
    QString text;
    QList<int> keys;
    int hold = 0; ///< milliseconds
};

/// \brief The vehicle's hard keys and key combinations. Read only; any thread.
class KeyCatalogue
{
public:
    static const KeyCatalogue& instance();

    const QList<KeyInfo>& keys() const { return m_keys; }
    const QList<KeyCombination>& combinations() const { return m_combinations; }

    /// \brief Null when no key has this number or name.
    const KeyInfo* find(int id) const;
    const KeyInfo* find(const QString& name) const;

    /// \brief The number that \a text means: a key's name, or a number from 0 as text, of a known key or not. -1 for neither.
    int idFrom(const QString& text) const;

    /// \brief When a key counts as held that says nothing else, in milliseconds.
    int longPress() const { return m_longPress; }

private:
    KeyCatalogue();

    QList<KeyInfo> m_keys;
    QList<KeyCombination> m_combinations;
    int m_longPress = 0;
};

} // namespace HmiVehicle

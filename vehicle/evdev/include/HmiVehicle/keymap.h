// SPDX-License-Identifier: MIT
#pragma once

#include <QHash>
#include <QString>

namespace HmiVehicle {

/// \brief Which hard key of the vehicle a key or dial of an input device is.
class KeyMap
{
public:
    /// \brief The map that comes with the vehicle: a keyboard's media keys, digits and arrows.
    static KeyMap shipped();

    /// \brief Reads a map. False when it is wrong; then nothing changes and errorString() names file and line or field.
    bool load(const QString& fileName);
    QString errorString() const { return m_error; }

    /// \brief The vehicle's key for a code of the type EV_KEY, -1 for none.
    int keyFor(unsigned int code) const { return m_keys.value(code, -1); }
    /// \brief The vehicle's key that a step up of a dial is, for a code of the type EV_REL; -1 for none.
    int dialFor(unsigned int code) const { return m_dials.value(code, -1); }

private:
    QString read(const QByteArray& content);

    QHash<unsigned int, int> m_keys;
    QHash<unsigned int, int> m_dials;
    QString m_error;
};

} // namespace HmiVehicle

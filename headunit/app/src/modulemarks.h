// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QVariantMap>

/// \brief How many things wait in which module, as modules tell it by the intent `ShowModuleMark`. GUI thread only.
class ModuleMarks : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QVariantMap marks READ marks NOTIFY changed)

public:
    explicit ModuleMarks(QObject* parent);

    QVariantMap marks() const { return m_marks; } ///< numbers by the modules' ids

Q_SIGNALS:
    void changed();

private:
    QVariantMap m_marks;
};

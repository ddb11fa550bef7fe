// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief Whether a phone projects its screen, which one, and in which way. GUI thread only.
///
/// The one place in this module that asks the vehicle about it: who decides something by the phone that is there asks here.
class ProjectionPresence : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool connected READ isConnected NOTIFY changed)
    Q_PROPERTY(Kind kind READ kind NOTIFY changed)
    Q_PROPERTY(QString phoneName READ phoneName NOTIFY changed)
    Q_PROPERTY(bool offered READ isOffered NOTIFY changed)

public:
    enum Kind {
        None,
        Cable, ///< on the cable
        Air,   ///< without one
    };
    Q_ENUM(Kind)

    explicit ProjectionPresence(QObject* parent);

    bool isConnected() const { return kind() != None; }
    Kind kind() const;
    QString phoneName() const; ///< empty without a phone, or when it has none
    bool isOffered() const;    ///< in the region that the vehicle is made for

Q_SIGNALS:
    void changed();
};

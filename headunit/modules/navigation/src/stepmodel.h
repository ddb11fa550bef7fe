// SPDX-License-Identifier: MIT
#pragma once

#include "route.h"

#include <QAbstractListModel>

/// \brief The manoeuvres of a route that lie ahead. GUI thread only.
class StepModel : public QAbstractListModel
{
    Q_OBJECT

public:
    enum Role {
        Icon = Qt::UserRole + 1,
        Instruction, ///< what to do
        StreetName,  ///< that is driven on from there; may be empty
        Distance,    ///< from the manoeuvre before, or from the vehicle, as text
    };

    explicit StepModel(QObject* parent);

    void setSteps(const QVector<RouteStep>& steps);
    /// \brief The vehicle is \a metres from the start, and \a next the first step that lies ahead of it.
    void moveTo(int next, double metres);
    /// \brief Asks for all texts again, in another language or unit.
    void retranslate();

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

private:
    QVector<RouteStep> m_steps;
    int m_first = 0;
    double m_driven = 0; ///< metres
};

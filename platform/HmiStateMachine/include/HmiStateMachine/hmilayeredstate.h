// SPDX-License-Identifier: MIT
#pragma once

#include "hmistate.h"

#include <QPointer>
#include <QVector>

namespace HmiStateMachine {

/// \brief A state whose child states lie on each other like layers, the entered one on top.
///
/// The initial state is always the lowest layer. Entering a child that lies deeper takes off the layers above it. Leaving the layered state keeps the stack, so that
/// coming back shows the layer that was left; \ref reset() forgets it. GUI thread only.
class HMISTATEMACHINE_EXPORT HmiLayeredState : public HmiState
{
    Q_OBJECT
    Q_PROPERTY(int depth READ depth NOTIFY depthChanged)

public:
    /// \brief As NamedState.
    explicit HmiLayeredState(const Identifier& name, QState* parent = nullptr);
    ~HmiLayeredState() override;

    /// \brief Number of layers on the stack: 0 before the first child was entered.
    int depth() const { return int(m_layers.size()); }

    /// \brief The child entered last, or null.
    NamedState* topLayer() const;

public Q_SLOTS:
    /// \brief Requests the layer beneath the top one. False, without effect, when there is none.
    bool back();

    /// \brief Forgets all layers: the next entry goes to the initial state.
    void reset();

Q_SIGNALS:
    void depthChanged();

private:
    friend class NamedState;
    void childEntered(NamedState* child);

    QVector<QPointer<NamedState>> m_layers;
};

} // namespace HmiStateMachine

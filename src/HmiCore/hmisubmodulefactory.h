// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QList>
#include <QObject>
#include <QString>

namespace HmiCore {

struct TargetState;

/// \brief Builds a submodule into the states of modules that ask for it. Modules derive from it. GUI thread only.
///
/// Register it with HmiSubmoduleProvider::registerSubmoduleFactory().
class HMICORE_EXPORT HmiSubmoduleFactory : public QObject
{
    Q_OBJECT

public:
    explicit HmiSubmoduleFactory(QObject* parent = nullptr);
    ~HmiSubmoduleFactory() override;

    /// \brief Name for log lines.
    virtual QString submoduleName() const = 0;

    /// \brief View descriptor that is loaded for each target; empty for none.
    virtual QString viewDescriptorFile() const = 0;

    /// \brief Builds the submodule's states into `target.state`.
    virtual void create(const TargetState& target) = 0;

    /// \brief Loads the views, if there is a view manager, and builds the states.
    ///
    /// A target whose state has the name of a view that was built before is refused with a warning: requesters that
    /// give their state's name as the view name get the submodule once.
    void createSubmodule(const TargetState& target);

private:
    QList<QString> m_createdIn;
};

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <HmiStateMachine/Identifier>
#include <HmiStateMachine/StateLevel>

#include <QList>
#include <QObject>
#include <QPair>
#include <QString>
#include <QUrl>

QT_BEGIN_NAMESPACE
class QAbstractTransition;
class QQmlContext;
QT_END_NAMESPACE

namespace HmiStateMachine {
class HmiState;
class NamedState;
class PopupState;
} // namespace HmiStateMachine

namespace HmiCore {

/// \brief What one HMI module is to the core: its name, views, states and QML types. Modules derive from it.
///
/// Made by a module plugin, then registered by the application, which calls createRootState(), registerTypes() and
/// setupRootContext() once each, in this order. It must live as long as the process. GUI thread only.
class HMICORE_EXPORT HmiModuleIntegration : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString moduleName READ moduleName CONSTANT)
    Q_PROPERTY(QUrl iconUrl READ iconUrl NOTIFY iconUrlChanged)
    Q_PROPERTY(int modulePriority READ modulePriority CONSTANT)
    Q_PROPERTY(QString viewDescriptorFile READ viewDescriptorFile CONSTANT)
    Q_PROPERTY(HmiStateMachine::Identifier rootStateIdentifier READ rootStateIdentifier CONSTANT)
    Q_PROPERTY(bool enabled READ enabled WRITE setEnabled NOTIFY enabledChanged)
    Q_PROPERTY(bool blocked READ blocked WRITE setBlocked NOTIFY blockedChanged)

public:
    /// \brief The kind of a module. Modules may use further values for kinds of their own.
    enum ModuleType : int {
        BackgroundModule = 0, ///< registered, but in no menu
        RootModule = 1,       ///< shown in the module model and so in the main menu
    };

    /// \brief An enabled module that is not blocked. \a parent owns it.
    HmiModuleIntegration(ModuleType type, QObject* parent);
    ~HmiModuleIntegration() override;

    /// \brief Prefix of the module's views; moduleName() in upper case unless overridden.
    virtual QString moduleId() const;

    /// \brief Name of the module, not translated.
    virtual QString moduleName() const = 0;

    /// \brief Place in the menu, smallest first; the module with the smallest value of all is the home of a new car.
    virtual int modulePriority() const = 0;

    /// \brief The number by which the system refers to the module, assigned by the modules; 0 unless overridden.
    virtual int moduleDomain() const;

    /// \brief Path of the view descriptor that is loaded for the module.
    virtual QString viewDescriptorFile() const = 0;

    /// \brief Name of the module's root state, which is also that of its first view.
    virtual HmiStateMachine::Identifier rootStateIdentifier() const = 0;

    /// \brief The module's icon in the menu; an empty URL unless overridden.
    virtual QUrl iconUrl() const;

    /// \brief Transitions that lead into this module from anywhere; none unless overridden. Not owned by the caller.
    virtual QList<QPair<HmiStateMachine::StateLevel, QAbstractTransition*>> moduleRootHierarchyTransitions() const;

    /// \brief Popups of this module that may come up anywhere; none unless overridden. Not owned by the caller.
    virtual QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>
    moduleRootHierarchyPopupStates() const;

    /// \brief Registers the module's QML types; does nothing unless overridden.
    virtual void registerTypes();

    /// \brief Builds the module's states below \a modulesRootState and returns their root, or null when it has none.
    ///
    /// The state tree owns the states.
    virtual HmiStateMachine::NamedState* createRootState(HmiStateMachine::HmiState* modulesRootState) = 0;

    /// \brief Publishes the module's objects to QML.
    virtual void setupRootContext(QQmlContext* rootContext) = 0;

    ModuleType type() const { return m_type; } ///< as given to the constructor
    bool enabled() const { return m_enabled; } ///< whether the module is shown in the module model; initially true
    bool blocked() const { return m_blocked; } ///< whether the menu shows the module as out of use; initially false

public Q_SLOTS:
    /// \brief Shows the module in the module model or hides it. Emits only on a change.
    void setEnabled(bool arg);

protected Q_SLOTS:
    /// \brief Marks the module as out of use, or back in use. Emits only on a change.
    void setBlocked(bool arg);

Q_SIGNALS:
    /// \brief To be emitted by modules when iconUrl() gives something else than before.
    void iconUrlChanged(QUrl arg);
    void enabledChanged(bool arg);
    void blockedChanged(bool arg);

private:
    const ModuleType m_type;
    bool m_enabled = true;
    bool m_blocked = false;
};

} // namespace HmiCore

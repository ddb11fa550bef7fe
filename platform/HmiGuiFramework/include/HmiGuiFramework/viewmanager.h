// SPDX-License-Identifier: MIT
#pragma once

#include "guidescriptor.h"
#include "hmiguiframework_export.h"
#include "transientcollection.h"

#include <QObject>
#include <QPointer>
#include <QQuickItem>
#include <QStringList>
#include <QVariant>

#include <memory>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiStateMachine {
class NamedState;
}

namespace HmiGuiFramework {

class PopupStack;
class TransitionManager;
class ViewCache;

/// \brief Shows views and popups and drives the state machine with them. GUI thread only.
///
/// Views and popups come from descriptor files (docs/view-descriptors.md). A view belongs to the state of the same
/// name: entering the state, for whatever reason, shows the view; a request for the view enters the state. Views are
/// created when first shown; the most recent ones are kept. QML knows the manager as "_viewManager".
class HMIGUIFRAMEWORK_EXPORT ViewManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString currentView READ currentView NOTIFY currentViewChanged)
    Q_PROPERTY(QQuickItem* currentItem READ currentItem NOTIFY currentViewChanged)
    Q_PROPERTY(QString currentPopup READ currentPopup NOTIFY currentPopupChanged)
    Q_PROPERTY(QQuickItem* stage READ stage CONSTANT)

public:
    ViewManager(QQmlEngine* engine, TransitionManager* transitionManager, QObject* parent);
    ~ViewManager() override;

    /// \brief A copy of all loaded views and popups, with the URLs of the variation in force.
    GuiDescriptor guiDescriptor() const { return m_descriptor; }

    /// \brief A copy of all loaded status-bar transients and their components.
    TransientCollection transients() const { return m_transients; }

    /// \brief Loads a descriptor file; its views, popups and transients are named \a prefixOrId, dot, own name.
    ///
    /// With an empty \a prefixOrId they keep their own names. \a flagOrDomain is kept with each view. The path is a file,
    /// a resource (":/…" or "qrc:/…"), or relative to AppSettings::mainFolderPath. A descriptor that cannot be read or
    /// parsed gives one warning and loads nothing; a faulty entry gives one warning naming file and field, and the
    /// rest is loaded; a name that is loaded already stays as it was.
    void loadModule(const QString& viewDescriptor, const QString& prefixOrId, int flagOrDomain);

    QString currentView() const
    {
        return m_currentView;
    }                                ///< identifier of the view on the screen; empty before the first
    QQuickItem* currentItem() const; ///< its item, or null before the first
    QString currentPopup() const;    ///< identifier of the topmost popup, or empty
    QQuickItem* stage() const { return m_stage.get(); } ///< what the window shows; owned by the manager

    /// \brief Asks for a view by its name, or by that of a state that leads to a view.
    ///
    /// Ends with the view on the screen and its state entered. \a data goes to the view's property `viewData`, if it has
    /// one; \a reverse turns a slide round; \a transition names one instead of the view's own. False, with one warning
    /// and without any other effect, when view or state do not exist, the view cannot be created, or the machine does
    /// not run.
    Q_INVOKABLE bool requestView(const QString& name, const QVariant& data = QVariant(), bool reverse = false,
                                 const QVariant& transition = QVariant());

    /// \brief Asks for several views, each as soon as the one before is on the screen or was refused.
    void requestViews(const QStringList& names);

    /// \brief Goes to the layer beneath the current view, with the transition reversed.
    ///
    /// That of the innermost layered state which has one; false, without effect, when none has.
    Q_INVOKABLE bool back();

    /// \brief Puts a popup on the stack; the topmost one is shown and its state entered. Asked for again it moves up and
    /// gets the new \a data. False, with one warning, when popup or state do not exist or it cannot be created.
    Q_INVOKABLE bool requestPopup(const QString& name, const QVariant& data = QVariant());

    /// \brief Takes a popup off the stack; the next one, if any, is shown. Unknown names are ignored.
    Q_INVOKABLE void closePopup(const QString& name);

    /// \brief Drops all views and popups that are not on the screen and shows those that are anew, for example after
    /// a change of the variation.
    void reloadViews();

public Q_SLOTS:
    /// \brief Tells the current view that the user is idle: its function `viewIdle()` is called, if it has one.
    void currentViewIdle();

Q_SIGNALS:
    /// \brief Another variation of the UI is in force; the URLs in guiDescriptor() have changed.
    void uiVariationChanged();

    void currentViewChanged();
    void currentPopupChanged();

    /// \brief The view is on the screen and its transition is over.
    void viewShown(const QString& name);

    /// \brief A request for a view or popup was refused; \a reason is an English sentence for developers.
    void requestRefused(const QString& name, const QString& reason);

private:
    struct Request
    {
        QVariant data;
        bool reverse = false;
        QString transition;
    };

    bool refuse(const QString& name, const QString& reason);
    QString viewOf(HmiStateMachine::NamedState* state) const;
    void stateEntered(HmiStateMachine::NamedState* state);
    void stateExited(HmiStateMachine::NamedState* state);
    void showNextView();
    void transitionFinished();
    void requestNextOfBatch();
    void applyVariation();
    void setShell(const QUrl& url);

    const QPointer<TransitionManager> m_transitionManager;
    GuiDescriptor m_descriptor;
    TransientCollection m_transients;
    std::unique_ptr<QQuickItem> m_stage;
    QPointer<QQuickItem> m_viewArea;
    std::unique_ptr<ViewCache> m_cache;
    std::unique_ptr<PopupStack> m_popups;
    QHash<QString, Request> m_requests;
    QString m_currentView;
    QString m_nextView;
    QStringList m_batch;
    QString m_batchView;
    bool m_goingBack = false;
};

} // namespace HmiGuiFramework

// SPDX-License-Identifier: MIT
#pragma once

#include "hmiguiframework_export.h"
#include "transientcollection.h"

#include <QObject>
#include <QTimer>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiGuiFramework {

class ViewManager;

/// \brief Shows short notices (transients) in the status bar, one at a time. GUI thread only.
///
/// QML knows it as "_statusBarController" and loads \ref transientUrl while \ref transient is not empty.
class HMIGUIFRAMEWORK_EXPORT StatusBarController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString transient READ transient NOTIFY transientChanged)
    Q_PROPERTY(QUrl transientUrl READ transientUrl NOTIFY transientChanged)

public:
    StatusBarController(QQmlEngine* engine, ViewManager* viewManager, QObject* parent);
    ~StatusBarController() override;

    /// \brief A copy of all loaded transients.
    TransientCollection transients() const;

    QString transient() const { return m_transient; } ///< identifier of the notice that is shown, or empty
    QUrl transientUrl() const { return m_url; }       ///< QML file that draws it, or empty

    /// \brief Shows a transient for \a timeout milliseconds; 0 or less for the time in its descriptor.
    ///
    /// It replaces the one that is shown; asked for again its time starts anew. An unknown transient or one without a
    /// component gives one warning and changes nothing.
    Q_INVOKABLE void requestTransientWidget(const QString& identifier, int timeout);

public Q_SLOTS:
    /// \brief Hides the transient that is shown, if any.
    void dismissTransient();

Q_SIGNALS:
    void transientChanged();

private:
    void show(const QString& identifier, const QUrl& url);

    ViewManager* const m_viewManager;
    QTimer m_timer;
    QString m_transient;
    QUrl m_url;
};

} // namespace HmiGuiFramework

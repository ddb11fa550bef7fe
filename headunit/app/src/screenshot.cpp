// SPDX-License-Identifier: MIT
#include "screenshot.h"

#include <AL2HMIBridge/BridgeConnection>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiStateMachine/StateMachine>

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QQuickItemGrabResult>
#include <QTextStream>
#include <QTimer>

#include <utility>

using AL2HMIBridge::BridgeConnection;
using HmiGuiFramework::DataStore;
using HmiGuiFramework::ViewManager;
using HmiStateMachine::StateMachine;

namespace {

constexpr int patience =
    10000; // ms until a vehicle that does not answer or a view that does not appear counts as missing

ViewManager* viewManager()
{
    return DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
}

/// Calls \a next once as soon as \a isDone, which may change with \a signal of \a sender.
template <typename Sender, typename Signal, typename Condition, typename Next>
void whenever(Sender* sender, Signal signal, QObject* context, Condition isDone, Next next)
{
    if (isDone()) {
        QMetaObject::invokeMethod(context, next, Qt::QueuedConnection);
        return;
    }
    auto* const once = new QObject(context);
    QObject::connect(sender, signal, once, [once, context, isDone, next] {
        if (!isDone())
            return;
        once->deleteLater();
        once->disconnect();
        QMetaObject::invokeMethod(context, next, Qt::QueuedConnection);
    });
}

} // namespace

Screenshot::Screenshot(const QString& file, const QString& view, QObject* parent)
    : QObject(parent)
    , m_file(file)
    , m_view(view)
{
}

bool Screenshot::isKnown(const QString& view, QString* message)
{
    const auto descriptor = viewManager()->guiDescriptor();
    if (descriptor.popups.contains(view) || StateMachine::instance()->findState(view))
        return true;
    QStringList known = descriptor.views.keys();
    known += descriptor.popups.keys();
    known.sort();
    *message =
        QStringLiteral("there is no view '%1'; there are: %2").arg(view.left(128), known.join(QStringLiteral(", ")));
    return false;
}

void Screenshot::start()
{
    auto* const bridge = BridgeConnection::instance();
    QTimer::singleShot(patience, this, [this, bridge] {
        fail(1, bridge->synchronised() ? QStringLiteral("the view did not appear")
                                       : QStringLiteral("no vehicle has told its state"));
    });
    whenever(
        bridge, &BridgeConnection::synchronisedChanged, this, [bridge] { return bridge->synchronised(); },
        [this] { showView(); });
}

void Screenshot::showView()
{
    auto* const views = viewManager();
    const auto isOnScreen = [this, views] {
        if (m_view.isEmpty())
            return !views->currentView().isEmpty();
        return views->currentView() == m_view || views->currentPopup() == m_view
               || views->currentView().startsWith(m_view + QLatin1Char('.'));
    };
    if (views->guiDescriptor().popups.contains(m_view)) {
        whenever(views, &ViewManager::currentPopupChanged, this, isOnScreen, [this] { shoot(); });
        if (!isOnScreen() && !views->requestPopup(m_view))
            fail(1, QStringLiteral("the popup '%1' cannot be shown").arg(m_view));
        return;
    }
    whenever(views, &ViewManager::viewShown, this, isOnScreen, [this] { shoot(); });
    if (!m_view.isEmpty() && !views->requestView(m_view))
        fail(1, QStringLiteral("the view '%1' cannot be shown").arg(m_view));
}

void Screenshot::shoot()
{
    const auto grab = viewManager()->stage()->grabToImage();
    if (!grab) {
        fail(1, QStringLiteral("nothing can be drawn"));
        return;
    }
    connect(grab.data(), &QQuickItemGrabResult::ready, this, [this, grab] {
        QDir().mkpath(QFileInfo(m_file).absolutePath());
        if (std::as_const(*grab).saveToFile(m_file))
            QCoreApplication::exit(0);
        else
            fail(1, QStringLiteral("'%1' cannot be written").arg(m_file));
    });
}

void Screenshot::fail(int exitCode, const QString& message)
{
    QTextStream(stderr) << "headunit: " << message << '\n';
    QCoreApplication::exit(exitCode);
}

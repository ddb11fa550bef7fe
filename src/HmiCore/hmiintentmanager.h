// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"
#include "hmiintentmonitor.h"

#include <QList>
#include <QMultiHash>
#include <QMutex>
#include <QObject>
#include <QPointer>
#include <QString>
#include <QVariant>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

class HmiIntentHandler;

/// \brief Brings requests for something that some module can do to the modules that can do it.
///
/// QML knows it as the singleton `HmiIntents` of the module of the same name. Requests come from any thread, one at a
/// time; handlers are called, and signals emitted, in the requesting thread with the mutex held. From there, no operation of
/// the manager may be called again: the thread would wait for itself.
class HMICORE_EXPORT HmiIntentManager : public QObject
{
    Q_OBJECT

public:
    /// \brief What can be asked for. The numbers never change; modules' own intents begin at UserType.
    enum HmiIntent {
        GoHome = 0,
        MakePhoneCall = 1,
        Navigate = 2,
        ShowNavigationDetour = 3,
        SiriusSubscriptions = 4,
        BluetoothDeviceSettings = 5,
        NavigationSettings = 6,
        PhoneSettings = 7,
        ShowNavigationMenu = 8,
        ShowTravelLinkIncidentInfo = 9,
        ShowTravelLinkMovies = 10,
        ShowTravelLinkFuelStations = 11,
        ShowTransportModeClimateScreen = 12,
        CheckBluetoothPowerStatus = 13,
        AddBluetoothDevice = 14,
        ViewBluetoothDevices = 15,
        ShowNavigationWeatherWaypoints = 16,
        SelectTravelLinkWeatherWaypoint = 17,
        ShowTravelLinkTraffic = 18,
        ShowTravelLinkWeather = 19,
        ShowNavPOIByAddress = 20,
        EnterValetMode = 21,
        CDStateSync = 22,
        ChangeAudioSource = 23,
        Apps403PopupRequest = 24,
        ShowCurrentAudioPrimary = 25,
        AutomaticUpdateDecisionRequest = 26,
        AutomaticUpdateDecisionRequestReset = 27,
        AddPhone = 28,
        ShowEAFault = 29,
        ShowCustosPopup = 30,
        RequestSettings = 31,
        ShowBluetoothAlerts = 32,
        ChangeKeyboardLayout = 33,
        OpenPairwayMediaApp = 34,
        ShowEAOffTM = 35,
        NavTBTTransientShown = 36,
        NavTBTTransientHidden = 37,
        EditSiriusAlerts = 38,
        ShowNavWaypoints = 39,
        RVCStatusCheck = 40,
        ShowNavPOIMoreInfoFuelPrices = 41,
        ShowNavPOIMoreInfoShowtimes = 42,
        SuspendMediaPlayback = 43,
        ResumeMediaPlayback = 44,
        ShowNavPOIById = 45,
        ShowSoundSettings = 46,
        PhoneSiriNotEnabled = 47,
        ShowMessageCenter = 48,
        InitialModuleIntent = 49,
        ShowProjection = 50,
        ShowAddedProjectionDevice = 51,
        CancelAnnouncement = 52,
        DisplayPhoneConnectingStatus = 53,
        ShowClimate = 54,
        ShowApps = 55,
        ShowPhone = 56,
        ShowTrafficMessageCenter = 57,
        ShowTrafficCenterIncidentInfo = 58,
        ShowNavigationFaultPopup = 59,
        ShowNavigationSdCardFaultPopup = 60,
        DisplayPhoneAttemptingReconnect = 61,
        SaveNavPOIToFavorites = 62,
        RequestDisplayOff = 63,
        RequestDisplayToggle = 64,
        ExitDisplayOffMode = 65,
        ShowMobileNavApps = 66,
        PhoneBookStatusCheck = 67,
        PhoneManageContactsSettings = 68,
        ShowChargeSettings = 69,
        AddDeviceViewRequest = 70,
        SelectPairwayMediaApp = 71,
        ShowEUChinaDisclaimerPopup = 72,
        UserType = 128,
    };
    Q_ENUM(HmiIntent)

    /// \brief The one manager, made on the first call, in the GUI thread, as a child of the application object.
    static HmiIntentManager* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* intentManagerProvider(QQmlEngine*, QJSEngine*);

    ~HmiIntentManager() override;

    /// \brief Offers \a handler, which is not owned, its intents from now on, before those registered earlier.
    ///
    /// Registered twice, it is asked twice. Any thread.
    void registerIntentHandler(HmiIntentHandler* handler);

    /// \brief Whether a handler was ever registered for \a intent, be it gone by now. Any thread.
    bool canPerformAction(int intent);

    /// \brief Asks the handlers of \a intent, the newest first, to perform it: all of them, or with \a exclusive until one does.
    ///
    /// True when one did. The signals tell what happened, and warnings what did not. Any thread.
    Q_INVOKABLE bool requestAction(int intent, const QList<QVariant>& data = QList<QVariant>(), bool exclusive = false,
                                   bool vrEvent = false, const QVariant& vrEventData = QVariant());

    /// \brief The monitor of \a intent, owned by the manager; null, with a warning, when nobody handles the intent.
    ///
    /// It knows the handlers that were registered when it was first asked for. GUI thread.
    Q_INVOKABLE HmiCore::HmiIntentMonitor* intentMonitor(int intent);

Q_SIGNALS:
    void aboutToBeHandled(int intent);                     ///< handlers are going to be asked
    void handled(int intent);                              ///< at least one performed it
    void handlingFailed(int intent, const QString& error); ///< none did; their errors, a line each
    void noHandlerFound(int intent);                       ///< none was ever registered

private:
    explicit HmiIntentManager(QObject* parent);

    QMultiHash<int, QPointer<HmiIntentHandler>> m_handlers;
    QHash<int, QPointer<HmiIntentMonitor>> m_monitors;
    QMutex m_mutex;
};

} // namespace HmiCore

// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <AL2HMIBridge/KeySource>

#include <QObject>

#include <cstdint>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief Decides what the vehicle's hard keys do: which call of the application layer, or which intent.
///
/// It keeps nothing in mind: each event is decided on what the sources say at that moment. QML knows it as the singleton
/// `HardKeyController` of the module `HmiCore`, for its signals. GUI thread only.
class HMICORE_EXPORT HardKeyController : public QObject
{
    Q_OBJECT

public:
    /// \brief The one controller, made on the first call as a child of the application object. Keys count from then on.
    static HardKeyController* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* hardKeyControllerProvider(QQmlEngine*, QJSEngine*);

    ~HardKeyController() override;

Q_SIGNALS:
    // Short presses tell of the key whatever came of it, long ones only of a seek that was sent.
    void swcSeekDownLongPress();   ///< the steering wheel's seek-down key is held
    void swcSeekDownLongRelease(); ///< it came up after that
    void swcSeekUpLongPress();     ///< the steering wheel's seek-up key is held
    void swcSeekUpLongRelease();   ///< it came up after that
    void swcSeekDownShortPress();  ///< the steering wheel's seek-down key was pressed
    void swcSeekUpShortPress();    ///< the steering wheel's seek-up key was pressed

private Q_SLOTS:
    void onHardKeyReceived(uint32_t l_keyId, int r_keyState);
    void onKeyComboEvent(int keyComboId, int keyState);

private:
    using KeyState = AL2HMIBridge::KeySource::KeyState;
    struct Rules;

    explicit HardKeyController(QObject* parent);

    void cancelVROnKeyPressed(unsigned int keyId, int keyState);
    void cancelTTSOnKeyPressed(unsigned int keyId, int keyState);
    void cancelAutoStoreUpdate(unsigned int keyId, int keyState);
    void requestBeepForStoringPreset();
    void handleHardKeysAtProjection(int keyId, KeyState keyState);
    void handleComboKeysForNativeHmi(int keyId, KeyState keyState);
    void processSWCSeekDownShortPress();
    void processSWCSeekUpShortPress();
    void processSWCSeekDownLongPress();
    void processSWCSeekUpLongPress();
    void processSWCSeekDownLongRelease();
    void processSWCSeekUpLongRelease();
    void processCombinedSeekLeftKey();
    void processCombinedSeekRightKey();
};

} // namespace HmiCore

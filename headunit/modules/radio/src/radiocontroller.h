// SPDX-License-Identifier: MIT
#pragma once

#include <AL2HMIBridge/TunerSource>

#include <QObject>
#include <QVector>

/// \brief The tuner that the radio's screens show and operate. GUI thread only.
class RadioController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QStringList bands READ bands CONSTANT)
    Q_PROPERTY(int band READ band NOTIFY bandChanged)
    Q_PROPERTY(AL2HMIBridge::TunerSource* tuner READ tuner NOTIFY bandChanged)

public:
    explicit RadioController(QObject* parent);

    QStringList bands() const;                ///< names in the order in which they are offered
    int band() const { return m_band; }       ///< index into bands()
    AL2HMIBridge::TunerSource* tuner() const; ///< the tuner of the band

    /// \brief Makes a band the audio source. Values outside bands() are ignored.
    Q_INVOKABLE void selectBand(int band);

    Q_INVOKABLE void seekUp();
    Q_INVOKABLE void seekDown();

    /// \brief Presets count from 1 in the active bank, as on the front panel.
    Q_INVOKABLE void recallPreset(int preset);
    Q_INVOKABLE void storePreset(int preset);

Q_SIGNALS:
    void bandChanged();

private:
    void followAudioSource();

    int m_band = 0;
};

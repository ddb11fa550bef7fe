// SPDX-License-Identifier: MIT
#pragma once

#include <AL2HMIBridge/TunerSource>

#include <QObject>
#include <QVector>

/// \brief The tuner that the radio's screens show and operate. GUI thread only.
class RadioController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QStringList bands READ bands NOTIFY retranslated)
    Q_PROPERTY(int band READ band NOTIFY bandChanged)
    Q_PROPERTY(AL2HMIBridge::TunerSource* tuner READ tuner NOTIFY bandChanged)
    Q_PROPERTY(bool fm READ isFm NOTIFY bandChanged)
    Q_PROPERTY(bool satellite READ isSatellite NOTIFY bandChanged)
    Q_PROPERTY(bool hasAnnouncements READ hasAnnouncements NOTIFY bandChanged)
    Q_PROPERTY(int bankCount READ bankCount CONSTANT)
    Q_PROPERTY(QString announcer READ announcer NOTIFY announcementChanged)
    Q_PROPERTY(QString announcement READ announcement NOTIFY announcementChanged)

public:
    explicit RadioController(QObject* parent);

    QStringList bands() const;                ///< names in the order in which they are offered
    int band() const { return m_band; }       ///< index into bands()
    AL2HMIBridge::TunerSource* tuner() const; ///< the tuner of the band
    bool isFm() const;
    bool isSatellite() const;
    bool hasAnnouncements() const; ///< stations of the band may announce the traffic
    int bankCount() const;         ///< banks of six presets that a tuner has
    bool heard() const;            ///< a tuner is the audio source

    AL2HMIBridge::TunerSource* announcing() const; ///< the tuner that plays an announcement, null without one
    QString announcer() const;                     ///< its band and station
    QString announcement() const;                  ///< who speaks

    /// \brief Makes a band the audio source. Values outside bands() are ignored.
    Q_INVOKABLE void selectBand(int band);

    Q_INVOKABLE void seekUp();
    Q_INVOKABLE void seekDown();

    /// \brief Presets count from 1 in the active bank, as on the front panel.
    Q_INVOKABLE void recallPreset(int preset);
    Q_INVOKABLE void storePreset(int preset);

    /// \brief Shows the next bank, after the last one the first.
    Q_INVOKABLE void selectNextBank();

    /// \brief As the front panel's key does while nothing is announced.
    Q_INVOKABLE void toggleTrafficAnnouncements();

    /// \brief As the front panel's key does while something is announced.
    Q_INVOKABLE void cancelAnnouncement();

Q_SIGNALS:
    void retranslated();
    void bandChanged();
    void announcementChanged();

private:
    void followAudioSource();

    int m_band = 0;
};

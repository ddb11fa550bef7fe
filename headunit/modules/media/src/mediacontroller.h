// SPDX-License-Identifier: MIT
#pragma once

#include "librarymodel.h"

#include <QObject>
#include <QStringList>

/// \brief What the media screens show and operate: the player, the disc, or what a projected phone plays. GUI thread only.
class MediaController : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QStringList kinds READ kinds NOTIFY changed)
    Q_PROPERTY(Kind kind READ kind NOTIFY changed)
    Q_PROPERTY(bool heard READ heard NOTIFY changed)
    Q_PROPERTY(bool available READ available NOTIFY changed)
    Q_PROPERTY(bool playing READ playing NOTIFY changed)
    Q_PROPERTY(QString icon READ icon NOTIFY changed)
    Q_PROPERTY(QString title READ title NOTIFY changed)
    Q_PROPERTY(QString artist READ artist NOTIFY changed)
    Q_PROPERTY(QString album READ album NOTIFY changed)
    Q_PROPERTY(QString notice READ notice NOTIFY changed)
    Q_PROPERTY(int position READ position NOTIFY progressed)
    Q_PROPERTY(int duration READ duration NOTIFY progressed)
    Q_PROPERTY(LibraryModel* library READ library CONSTANT)

public:
    enum Kind { Player, Disc, Projection };
    Q_ENUM(Kind)

    explicit MediaController(QObject* parent);

    /// \brief Whether an audio source, as GlobalSource numbers them, is of this module.
    static bool isMedia(int audioSource);

    QStringList kinds() const;           ///< names of what can be shown, in the order of Kind
    Kind kind() const { return m_kind; } ///< what is shown: what is heard, or was heard last
    bool heard() const;                  ///< what is shown is the audio source
    bool available() const;              ///< there is something to play; otherwise notice() says why not
    bool playing() const;
    QString icon() const;
    QString title() const;
    QString artist() const;
    QString album() const;
    QString notice() const;
    int position() const; ///< seconds
    int duration() const; ///< seconds; 0 when it is not known
    LibraryModel* library() const { return m_library; }

    /// \brief Makes another kind the audio source. One that is not in kinds() is ignored.
    Q_INVOKABLE void selectKind(int kind);

    /// \brief What is not heard becomes the audio source, and so plays.
    Q_INVOKABLE void togglePlayPause();
    Q_INVOKABLE void next();
    Q_INVOKABLE void previous();

    /// \brief Moves within the track of the player; other kinds cannot.
    Q_INVOKABLE void seekTo(int seconds);

    /// \brief Plays a row of the player's library, or a track of the disc, counted from 1.
    Q_INVOKABLE void playLibraryRow(int row);
    Q_INVOKABLE void playDiscTrack(int track);

Q_SIGNALS:
    void changed();
    void progressed();

private:
    void follow();

    LibraryModel* const m_library;
    Kind m_kind = Player;
};

// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief What is heard now, whichever source it comes from. GUI thread only.
class NowPlaying : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString source READ source NOTIFY changed)
    Q_PROPERTY(QString icon READ icon NOTIFY changed)
    Q_PROPERTY(QString title READ title NOTIFY changed)
    Q_PROPERTY(QString subtitle READ subtitle NOTIFY changed)
    Q_PROPERTY(bool pausable READ pausable NOTIFY changed)
    Q_PROPERTY(bool playing READ playing NOTIFY changed)

public:
    explicit NowPlaying(QObject* parent);

    QString source() const;   ///< name of the audio source
    QString icon() const;     ///< name of the icon of its kind
    QString title() const;    ///< station or track
    QString subtitle() const; ///< radio text or artist
    bool pausable() const;    ///< it has a key to play and pause, and does not run on by itself
    bool playing() const;     ///< it is not paused

    /// \brief The next or previous station or track of the source.
    Q_INVOKABLE void next();
    Q_INVOKABLE void previous();

Q_SIGNALS:
    void changed();
};

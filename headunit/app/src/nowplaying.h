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

public:
    explicit NowPlaying(QObject* parent);

    QString source() const { return m_source; }     ///< name of the audio source
    QString icon() const;                           ///< name of the icon of its kind
    QString title() const { return m_title; }       ///< station or track
    QString subtitle() const { return m_subtitle; } ///< radio text or artist

    /// \brief The next or previous station or track of the source.
    Q_INVOKABLE void next();
    Q_INVOKABLE void previous();

Q_SIGNALS:
    void changed();

private:
    void update();

    QString m_source;
    QString m_title;
    QString m_subtitle;
};

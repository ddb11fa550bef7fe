// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

/// \brief The next turn, as a navigation tells it by intents while another screen than its own is shown. GUI thread only.
///
/// `NavTBTTransientShown` brings the name of an icon, the distance and the street, each as text; `NavTBTTransientHidden` ends it.
class TurnHint : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool shown READ isShown NOTIFY changed)
    Q_PROPERTY(QString icon READ icon NOTIFY changed)
    Q_PROPERTY(QString distance READ distance NOTIFY changed)
    Q_PROPERTY(QString street READ street NOTIFY changed)

public:
    explicit TurnHint(QObject* parent);

    bool isShown() const { return !m_icon.isEmpty(); }
    QString icon() const { return m_icon; }
    QString distance() const { return m_distance; } ///< in the market's unit
    QString street() const { return m_street; }     ///< may be empty

Q_SIGNALS:
    void changed();

private:
    void show(const QString& icon, const QString& distance, const QString& street);

    QString m_icon;
    QString m_distance;
    QString m_street;
};

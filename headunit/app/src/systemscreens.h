// SPDX-License-Identifier: MIT
#pragma once

#include <QObject>
#include <QString>

class Display;
class IntentTable;

/// \brief What lies over all modules, and the intents that belong to none: standby, dark display, valet mode, voice, a
/// projected phone's screen, and the notice of an intent that could not be performed. GUI thread only.
class SystemScreens : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString notice READ notice NOTIFY noticeChanged)
    Q_PROPERTY(bool dark READ isDark NOTIFY darkChanged)

public:
    explicit SystemScreens(QObject* parent);

    QString notice() const { return m_notice; } ///< why the last intent that failed could not be performed
    bool isDark() const; ///< the screen shows nothing of the HMI: standby, dark display or valet mode

Q_SIGNALS:
    void noticeChanged();
    void darkChanged();

private:
    void addPopups();
    IntentTable* makeIntents();
    void switchOnWithAnyKey(int key, int state) const;
    void toggleDisplay() const;
    void leaveProjection() const;
    void showNotice(const QString& error);
    void dropNotice();

    Display* const m_display;
    IntentTable* const m_intents;
    QString m_notice;
};

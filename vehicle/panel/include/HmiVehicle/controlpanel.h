// SPDX-License-Identifier: MIT
#pragma once

#include "HmiVehicle/keyinput.h"

#include <QJsonArray>
#include <QObject>
#include <QString>
#include <QStringList>

#include <memory>

QT_BEGIN_NAMESPACE
class QQuickWindow;
QT_END_NAMESPACE

namespace HmiVehicle {

class Journal;
class StatesModel;
class VehicleService;

/// \brief The vehicle's controls in a window: front panel, steering wheel, switches, and what went on. GUI thread only.
///
/// The service must live in the same thread and outlive the panel.
class ControlPanel : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QObject* journal READ journal CONSTANT)
    Q_PROPERTY(QObject* states READ states CONSTANT)
    Q_PROPERTY(QStringList actions READ actions CONSTANT)
    Q_PROPERTY(bool decisionsWanted READ decisionsWanted WRITE setDecisionsWanted NOTIFY decisionsWantedChanged)

public:
    explicit ControlPanel(VehicleService& service, QObject* parent = nullptr);
    /// \brief Closes the window; what is held comes up.
    ~ControlPanel() override;

    /// \brief Opens the window. False, after saying why on standard error, when it cannot be made.
    bool show();
    /// \brief Null until show().
    QQuickWindow* window() const;

    /// \brief Writes the window as a picture, once it is drawn. False, after saying why, when that fails. Needs no display.
    bool savePicture(const QString& file) const;

    QObject* journal() const;
    QObject* states() const;

    /// \brief What can happen to the vehicle by itself, as texts of buttons; trigger() takes their index.
    QStringList actions() const;
    Q_INVOKABLE void trigger(int action);

    /// \brief Whether HMIs are asked to report what they decide.
    bool decisionsWanted() const;
    void setDecisionsWanted(bool wanted);

    /// \name A finger on a key
    /// @{
    Q_INVOKABLE void press(int key);
    Q_INVOKABLE void release(int key);
    Q_INVOKABLE void turn(int key, int steps);
    Q_INVOKABLE void releaseAll();
    Q_INVOKABLE int longPressTime(int key) const; ///< milliseconds
    Q_INVOKABLE QString keyText(int key) const;
    /// @}

Q_SIGNALS:
    void decisionsWantedChanged();
    /// \brief A key was sent to the HMI, by whoever pressed it.
    void keySent(int key, int state);

private:
    struct Window;

    void noteCall(const QByteArray& line);
    void noteKey(int key, int state);

    VehicleService& m_service;
    const KeyInput::Owner m_owner;
    std::unique_ptr<Journal> m_journal;
    const QJsonArray m_actions;
    std::unique_ptr<StatesModel> m_states;
    std::unique_ptr<Window> m_window;
};

} // namespace HmiVehicle

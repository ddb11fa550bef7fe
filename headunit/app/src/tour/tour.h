// SPDX-License-Identifier: MIT
#pragma once

#include "tourfile.h"

#include <QElapsedTimer>
#include <QObject>
#include <QRectF>
#include <QTimer>

#include <functional>

QT_BEGIN_NAMESPACE
class QQuickItem;
QT_END_NAMESPACE

namespace HmiVehicle {
class EmbeddedVehicle;
}

/// \brief Leads through the head unit: drives the vehicle and the screen by the steps of a file, and looks whether the screen shows what it
/// should. GUI thread only.
///
/// Each step waits until it can be done, at most ten seconds; then the tour has failed.
class Tour : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString caption READ caption NOTIFY captionChanged)

public:
    struct Options
    {
        QString pictures; ///< folder for the pictures of the steps "shot"; empty for none
        int pace = 0;     ///< milliseconds between steps that a person is to see
    };

    /// \brief \a vehicle outlives it.
    Tour(const TourFile& file, HmiVehicle::EmbeddedVehicle& vehicle, const Options& options, QObject* parent);

    void start();

    QString caption() const { return m_caption; } ///< the note that was read last

Q_SIGNALS:
    void captionChanged();
    /// \brief The tour is over; \a failure is empty, or says where and why it ended early.
    void finished(const QString& failure);

private:
    /// What a step does. False: not yet.
    using Try = std::function<bool(const QJsonObject& line)>;

    void tryStep();
    void next();
    QString stateOfTheScreen() const;
    const Try* find(const QString& verb) const;
    void addVehicleSteps();
    void addScreenSteps();
    void addChecks();
    bool isSettled(QQuickItem* item);
    bool typeNext(const QJsonObject& line);
    bool write(const QJsonObject& line);
    bool choose(const QJsonObject& line);
    bool shoot(const QJsonObject& line);
    bool shows(const QJsonObject& line) const;

    const QVector<TourFile::Step> m_steps;
    HmiVehicle::EmbeddedVehicle& m_vehicle;
    const Options m_options;
    QHash<QString, Try> m_tries;
    QString m_caption;
    QTimer m_timer;
    QElapsedTimer m_waited;
    QRectF m_place;      ///< of the item that is about to be touched, as it was seen last
    int m_frames = 0;    ///< that were drawn so far
    int m_lookedAt = -1; ///< the frame then
    int m_step = 0;
    int m_typed = 0;        ///< characters of the step "type"
    bool m_drawing = false; ///< a picture is on its way
};

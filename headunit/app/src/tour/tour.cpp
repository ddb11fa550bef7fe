// SPDX-License-Identifier: MIT
#include "tour.h"

#include "focuscontrol.h"
#include "inputpanel.h"
#include "screenhand.h"

#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiIntentManager>
#include <HmiGuiFramework/DataStore>
#include <HmiGuiFramework/ViewManager>
#include <HmiVehicle/embeddedvehicle.h>
#include <HmiVehicle/keycatalogue.h>

#include <QCoreApplication>
#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>
#include <QMetaEnum>
#include <QQuickItem>
#include <QQuickItemGrabResult>
#include <QQuickWindow>

#include <algorithm>
#include <utility>

using HmiCore::HmiIntentManager;
using HmiGuiFramework::ViewManager;
using HmiVehicle::EmbeddedVehicle;
using HmiVehicle::KeyCatalogue;
using HmiVehicle::KeyInput;
using HmiVehicle::Vehicle;

namespace {

constexpr int patience = 10000; // ms
constexpr int lookEvery = 20;   // ms
constexpr int longPress = 1200; // ms of the vehicle's time

ViewManager* viewManager()
{
    return HmiGuiFramework::DataStore::get<ViewManager>(QStringLiteral("ViewManager"));
}

QString text(const QJsonObject& line, const char* field)
{
    return line.value(QLatin1String(field)).toString();
}

int keyOf(const QJsonObject& line, const char* field)
{
    return KeyCatalogue::instance().idFrom(text(line, field));
}

/// A press that is seen by the HMI, whatever time the vehicle has.
void pressKey(Vehicle& vehicle, int key, bool isLong)
{
    static const KeyInput::Owner owner = KeyInput::newOwner();
    vehicle.keys().press(key, owner);
    if (isLong)
        vehicle.advance(longPress);
    vehicle.keys().release(key, owner);
}

} // namespace

Tour::Tour(const TourFile& file, EmbeddedVehicle& vehicle, const Options& options, QObject* parent)
    : QObject(parent)
    , m_steps(file.steps())
    , m_vehicle(vehicle)
    , m_options(options)
{
    addVehicleSteps();
    addScreenSteps();
    addChecks();
    m_timer.setSingleShot(true);
    connect(&m_timer, &QTimer::timeout, this, &Tour::tryStep);
}

void Tour::start()
{
    connect(viewManager()->stage()->window(), &QQuickWindow::frameSwapped, this, [this] { ++m_frames; });
    m_waited.start();
    m_timer.start(0);
}

void Tour::tryStep()
{
    const TourFile::Step& step = m_steps.at(m_step);
    if (m_tries.value(step.verb)(step.line))
        return next();
    if (m_waited.elapsed() < patience)
        return m_timer.start(lookEvery);
    Q_EMIT finished(QStringLiteral("%1: %2 did not come; %3")
                        .arg(step.where, QString::fromUtf8(QJsonDocument(step.line).toJson(QJsonDocument::Compact)),
                             stateOfTheScreen()));
}

void Tour::next()
{
    const bool isSeen = m_steps.at(m_step).verb != QLatin1String("shot");
    m_typed = 0;
    m_lookedAt = -1;
    m_waited.restart();
    if (++m_step == m_steps.size())
        Q_EMIT finished(QString());
    else
        m_timer.start(isSeen ? m_options.pace : 0);
}

QString Tour::stateOfTheScreen() const
{
    QStringList texts = ScreenHand::texts(ScreenHand::find(QString()));
    return QStringLiteral("the view is %1, the popup \"%2\", and one reads: %3")
        .arg(viewManager()->currentView(), viewManager()->currentPopup(), texts.join(QStringLiteral(" | ")).left(600));
}

void Tour::addVehicleSteps()
{
    const auto drive = [this](std::function<void(Vehicle&)> action) {
        m_vehicle.run(std::move(action));
        return true;
    };
    m_tries.insert(QStringLiteral("key"), [drive](const QJsonObject& line) {
        const int key = keyOf(line, "key");
        const bool isLong = text(line, "how") == QLatin1String("long");
        return drive([key, isLong](Vehicle& vehicle) { pressKey(vehicle, key, isLong); });
    });
    m_tries.insert(QStringLiteral("turn"), [drive](const QJsonObject& line) {
        const int key = keyOf(line, "turn");
        const int steps = line.value(QLatin1String("steps")).toInt(1);
        return drive([key, steps](Vehicle& vehicle) { vehicle.keys().turn(key, steps, KeyInput::newOwner()); });
    });
    m_tries.insert(QStringLiteral("set"), [drive](const QJsonObject& line) {
        const QStringList field = text(line, "set").split(QLatin1Char('.'));
        const QJsonValue value = line.value(QLatin1String("to"));
        return drive([field, value](Vehicle& vehicle) { vehicle.setState(field.at(0), field.at(1), value); });
    });
    m_tries.insert(QStringLiteral("ring"), [drive](const QJsonObject& line) {
        const QString number = text(line, "ring");
        return drive([number](Vehicle& vehicle) { vehicle.ring(number); });
    });
    m_tries.insert(QStringLiteral("announce"), [drive](const QJsonObject& line) {
        const QString announcement = text(line, "announce");
        return drive([announcement](Vehicle& vehicle) { vehicle.startTrafficAnnouncement(announcement); });
    });
    m_tries.insert(QStringLiteral("language"), [drive](const QJsonObject& line) {
        const int language = AL2HMIBridge::LanguageModel::instance()->idForLocale(text(line, "language"));
        return language >= 0 && drive([language](Vehicle& vehicle) {
                   vehicle.setState(QStringLiteral("GlobalSource"), QStringLiteral("systemLanguage"), language);
               });
    });
    m_tries.insert(QStringLiteral("vehicle"), [this](const QJsonObject& line) {
        if (text(line, "vehicle") == QLatin1String("on"))
            m_vehicle.start();
        else
            m_vehicle.stop();
        return true;
    });
}

void Tour::addScreenSteps()
{
    m_tries.insert(QStringLiteral("note"), [this](const QJsonObject& line) {
        m_caption = text(line, "note");
        Q_EMIT captionChanged();
        return true;
    });
    m_tries.insert(QStringLiteral("intent"), [](const QJsonObject& line) {
        const auto intents = QMetaEnum::fromType<HmiIntentManager::HmiIntent>();
        return HmiIntentManager::instance()->requestAction(
            intents.keyToValue(text(line, "intent").toLatin1().constData()),
            line.value(QLatin1String("with")).toArray().toVariantList());
    });
    m_tries.insert(QStringLiteral("tap"), [this](const QJsonObject& line) {
        QQuickItem* const item = ScreenHand::find(text(line, "tap"));
        const QVariant active = item ? item->property("active") : QVariant(false);
        if ((active.isValid() && !active.toBool()) || !isSettled(item))
            return false;
        ScreenHand::tap(item);
        return true;
    });
    m_tries.insert(QStringLiteral("type"), [this](const QJsonObject& line) { return typeNext(line); });
    m_tries.insert(QStringLiteral("write"), [this](const QJsonObject& line) { return write(line); });
    m_tries.insert(QStringLiteral("choose"), [this](const QJsonObject& line) { return choose(line); });
    m_tries.insert(QStringLiteral("shot"), [this](const QJsonObject& line) { return shoot(line); });
}

void Tour::addChecks()
{
    m_tries.insert(QStringLiteral("view"),
                   [](const QJsonObject& line) { return viewManager()->currentView() == text(line, "view"); });
    m_tries.insert(QStringLiteral("popup"),
                   [](const QJsonObject& line) { return viewManager()->currentPopup() == text(line, "popup"); });
    m_tries.insert(QStringLiteral("item"), [this](const QJsonObject& line) { return shows(line); });
    m_tries.insert(QStringLiteral("focus"), [](const QJsonObject& line) {
        const auto* const control = QCoreApplication::instance()->findChild<FocusControl*>();
        return control && control->item() && control->item()->objectName() == text(line, "focus");
    });
}

/// What is laid out only when it is drawn, or still moves, would be missed by a touch: so it has to be in the same place in two frames.
bool Tour::isSettled(QQuickItem* item)
{
    if (!item)
        return false;
    const QRectF place = item->mapRectToScene(QRectF(0, 0, item->width(), item->height()));
    if (m_lookedAt >= 0 && m_frames == m_lookedAt)
        return false; // until the next frame
    const bool settled = m_lookedAt >= 0 && place == m_place;
    m_place = place;
    m_lookedAt = settled ? -1 : m_frames;
    item->window()->update();
    return settled;
}

/// A character each time, so that the keys have followed.
bool Tour::typeNext(const QJsonObject& line)
{
    const QString characters = text(line, "type");
    QQuickItem* const key = ScreenHand::findKey(characters.mid(m_typed, 1));
    if (!isSettled(key))
        return false;
    ScreenHand::tap(key);
    m_waited.restart();
    return ++m_typed == characters.size();
}

bool Tour::write(const QJsonObject& line)
{
    QQuickItem* const pad = ScreenHand::find(QStringLiteral("writingArea"));
    const auto* const panel = QCoreApplication::instance()->findChild<InputPanel*>();
    if (!panel || !isSettled(pad))
        return false;
    const double box = pad->width() / panel->boxes();
    const double left = line.value(QLatin1String("box")).toInt() * box;
    const QJsonArray strokes = line.value(QLatin1String("write")).toArray();
    for (const QJsonValue& stroke : strokes) {
        QVector<QPointF> points;
        const QJsonArray pairs = stroke.toArray();
        for (const QJsonValue& pair : pairs)
            points.append(QPointF(left + pair.toArray().at(0).toDouble() * box / 100,
                                  pair.toArray().at(1).toDouble() * pad->height() / 100));
        if (!points.isEmpty())
            ScreenHand::draw(pad, points);
    }
    return true;
}

bool Tour::choose(const QJsonObject& line)
{
    const auto* const panel = QCoreApplication::instance()->findChild<InputPanel*>();
    const auto index = panel ? panel->candidates().indexOf(text(line, "choose")) : -1;
    QQuickItem* const item = index < 0 ? nullptr : ScreenHand::find(QStringLiteral("candidate%1").arg(index));
    if (!isSettled(item))
        return false;
    ScreenHand::tap(item);
    return true;
}

/// \c gone: it is not on the screen; \c shows: a text in it; else it only has to be there.
bool Tour::shows(const QJsonObject& line) const
{
    QQuickItem* const item = ScreenHand::find(text(line, "item"));
    if (line.value(QLatin1String("gone")).toBool())
        return !item;
    if (!item || !line.contains(QLatin1String("shows")))
        return item;
    const QString wanted = text(line, "shows");
    const QStringList texts = ScreenHand::texts(item);
    return std::any_of(texts.cbegin(), texts.cend(), [&wanted](const QString& text) { return text.contains(wanted); });
}

bool Tour::shoot(const QJsonObject& line)
{
    if (m_options.pictures.isEmpty())
        return true;
    if (std::exchange(m_drawing, true))
        return false;
    const auto grab = viewManager()->stage()->grabToImage();
    const QString file = QDir(m_options.pictures).filePath(text(line, "shot") + QStringLiteral(".png"));
    if (!grab) {
        Q_EMIT finished(QStringLiteral("%1 cannot be drawn").arg(file));
        return false;
    }
    connect(grab.data(), &QQuickItemGrabResult::ready, this, [this, grab, file] {
        m_drawing = false;
        if (!QDir().mkpath(m_options.pictures) || !std::as_const(*grab).saveToFile(file))
            return Q_EMIT finished(QStringLiteral("%1 cannot be written").arg(file));
        m_timer.stop();
        next();
    });
    return false;
}

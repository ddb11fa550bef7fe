// SPDX-License-Identifier: MIT
#include "HmiVehicle/controlpanel.h"

#include "HmiVehicle/keycatalogue.h"
#include "HmiVehicle/vehicleservice.h"

#include "actions.h"
#include "expectation.h"
#include "journal.h"
#include "resource.h"
#include "statesmodel.h"

#include <QEventLoop>
#include <QJsonDocument>
#include <QQmlApplicationEngine>
#include <QQmlContext>
#include <QQuickItem>
#include <QQuickItemGrabResult>
#include <QQuickWindow>
#include <QTextStream>

namespace HmiVehicle {

namespace {

QJsonObject table()
{
    return readResource(QStringLiteral(":/panel/panel.json"));
}

/// What only helps developers is no news to them.
bool isNews(const QString& source)
{
    return source != QLatin1String("DeveloperSource");
}

QString stateText(int state)
{
    const char* const texts[] = {"pressed", "stepped", "short", "held", "released", "combined"};
    return state >= 0 && state < int(std::size(texts)) ? QLatin1String(texts[state]) : QString::number(state);
}

} // namespace

struct ControlPanel::Window
{
    QQmlApplicationEngine engine;
    QQuickWindow* window = nullptr; // of the engine
};

ControlPanel::ControlPanel(VehicleService& service, QObject* parent)
    : QObject(parent)
    , m_service(service)
    , m_owner(KeyInput::newOwner())
    , m_journal(std::make_unique<Journal>())
    , m_actions(table().value(QLatin1String("actions")).toArray())
    , m_states(std::make_unique<StatesModel>(
          table().value(QLatin1String("states")).toArray(),
          [&service](const QString& source) { return service.vehicle().state(source); },
          [&service](const QString& source, const QString& field, const QJsonValue& value) {
              return service.vehicle().setState(source, field, value);
          }))
{
    connect(&service, &VehicleService::stateChanged, m_states.get(), &StatesModel::update);
    connect(&service, &VehicleService::stateChanged, this, [this](const QString& source) {
        if (source == QLatin1String("DeveloperSource"))
            Q_EMIT decisionsWantedChanged();
    });
    connect(&service, &VehicleService::called, this, &ControlPanel::noteCall);
    connect(&service, &VehicleService::keySent, this, &ControlPanel::noteKey);
    connect(&service, &VehicleService::keySent, this, &ControlPanel::keySent);
    connect(&service, &VehicleService::combinationSent, this, [this](int combination, int state) {
        m_journal->add(Journal::Key, QStringLiteral("combination %1 %2").arg(combination).arg(stateText(state)));
    });
    connect(&service, &VehicleService::decisionReported, m_journal.get(),
            [this](const QString& text) { m_journal->add(Journal::Decision, text); });
}

ControlPanel::~ControlPanel()
{
    m_window.reset();
    releaseAll();
}

bool ControlPanel::show()
{
    m_window = std::make_unique<Window>();
    m_window->engine.rootContext()->setContextProperty(QStringLiteral("controls"), this);
    m_window->engine.load(QUrl(QStringLiteral("qrc:/panel/qml/Panel.qml")));
    m_window->window = qobject_cast<QQuickWindow*>(m_window->engine.rootObjects().value(0));
    return m_window->window != nullptr;
}

QQuickWindow* ControlPanel::window() const
{
    return m_window ? m_window->window : nullptr;
}

bool ControlPanel::savePicture(const QString& file) const
{
    m_journal->flush();
    QEventLoop loop;
    QObject::connect(window(), &QQuickWindow::frameSwapped, &loop, &QEventLoop::quit);
    window()->update();
    loop.exec(); // the first frame gives the content its size
    const auto grabbed = window()->contentItem()->grabToImage();
    if (grabbed) {
        QObject::connect(grabbed.data(), &QQuickItemGrabResult::ready, &loop, &QEventLoop::quit);
        loop.exec();
        if (grabbed->image().save(file))
            return true;
    }
    QTextStream(stderr) << "vehicle-sim: cannot write " << file << '\n';
    return false;
}

QObject* ControlPanel::journal() const
{
    return m_journal.get();
}

QObject* ControlPanel::states() const
{
    return m_states.get();
}

QStringList ControlPanel::actions() const
{
    QStringList texts;
    for (const QJsonValue& action : qAsConst(m_actions))
        texts.append(action.toObject().value(QLatin1String("text")).toString());
    return texts;
}

void ControlPanel::trigger(int action)
{
    const QJsonObject entry = m_actions.at(action).toObject();
    const QStringList arguments = entry.value(QLatin1String("with")).toVariant().toStringList();
    if (const Action* const found = findAction(entry.value(QLatin1String("do")).toString()))
        found->happen(m_service.vehicle(), arguments);
}

bool ControlPanel::decisionsWanted() const
{
    return m_service.vehicle()
        .state(QStringLiteral("DeveloperSource"))
        .value(QLatin1String("decisionsWanted"))
        .toBool();
}

void ControlPanel::setDecisionsWanted(bool wanted)
{
    m_service.vehicle().setState(QStringLiteral("DeveloperSource"), QStringLiteral("decisionsWanted"), wanted);
}

void ControlPanel::press(int key)
{
    m_service.vehicle().keys().press(key, m_owner);
}

void ControlPanel::release(int key)
{
    m_service.vehicle().keys().release(key, m_owner);
}

void ControlPanel::turn(int key, int steps)
{
    m_service.vehicle().keys().turn(key, steps, m_owner);
}

void ControlPanel::releaseAll()
{
    m_service.vehicle().keys().releaseAll(m_owner);
}

int ControlPanel::longPressTime(int key) const
{
    return m_service.vehicle().keys().longPressTime(key);
}

QString ControlPanel::keyText(int key) const
{
    const KeyInfo* const info = KeyCatalogue::instance().find(key);
    return info ? info->text : QString();
}

void ControlPanel::noteCall(const QByteArray& line)
{
    const QJsonObject call = QJsonDocument::fromJson(line).object();
    const QString source = call.value(QLatin1String("source")).toString();
    if (isNews(source))
        m_journal->add(Journal::Call, callText(source, call.value(QLatin1String("call")).toString(),
                                               call.value(QLatin1String("args")).toArray()));
}

void ControlPanel::noteKey(int key, int state)
{
    const QString text = keyText(key);
    m_journal->add(Journal::Key,
                   QStringLiteral("key %1 %2%3")
                       .arg(key)
                       .arg(stateText(state), text.isEmpty() ? QString() : QStringLiteral(" (%1)").arg(text)));
}

} // namespace HmiVehicle

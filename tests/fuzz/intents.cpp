// SPDX-License-Identifier: MIT
// Intents: handlers that come, go, fail and die while they are asked; compared with a plain list of who is there.
#include "forgottenintents.h"
#include "fuzzing.h"

#include <HmiCore/HmiIntentHandler>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentMonitor>

#include <QPointer>
#include <QSet>

#include <map>
#include <memory>
#include <vector>

using namespace HmiCore;
using Fuzzing::check;
using Fuzzing::Input;

namespace {

constexpr int firstIntent = HmiIntentManager::UserType;
constexpr int intentCount = 6;
constexpr int mostHandlers = 12;

QString entry(const char* what, int first, int second = -1)
{
    return QStringLiteral("%1 %2 %3").arg(QLatin1String(what)).arg(first).arg(second);
}

class World;

class Handler : public HmiIntentHandler
{
public:
    Handler(World& world, int number, const QList<int>& intents)
        : m_world(world)
        , m_number(number)
    {
        for (const int intent : intents)
            addAction(intent);
    }

    bool performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData) override;
    bool isActionEnabled(int intent) const override
    {
        return !m_disabled.contains(intent) && HmiIntentHandler::isActionEnabled(intent);
    }
    QString lastError() const override { return QStringLiteral("error %1").arg(m_number); }

    void setEnabled(int intent, bool enabled)
    {
        if (enabled)
            m_disabled.remove(intent);
        else
            m_disabled.insert(intent);
        Q_EMIT actionStatusChanged(intent, enabled);
    }

private:
    World& m_world;
    const int m_number;
    QSet<int> m_disabled;
};

/// What a handler does when it is asked. It belongs to the test, so that it can be told when the handler is gone.
struct Behaviour
{
    bool performs = true;
    bool diesThen = false; ///< deletes itself while it is asked
    int kills = -1;        ///< deletes another one then
    int changes = -1;      ///< tells then that this intent of its own is impossible
};

/// Handlers and what they did; and beside it what they should have done.
class World
{
public:
    explicit World(Input& input)
        : m_input(input)
    {
        HmiIntentManager* const manager = HmiIntentManager::instance();
        const auto note = [this](const char* what) {
            return [this, what](int intent) { seen.append(entry(what, intent)); };
        };
        m_listening.push_back(QObject::connect(manager, &HmiIntentManager::aboutToBeHandled, note("about")));
        m_listening.push_back(QObject::connect(manager, &HmiIntentManager::handled, note("handled")));
        m_listening.push_back(QObject::connect(manager, &HmiIntentManager::noHandlerFound, note("nobody")));
        m_listening.push_back(
            QObject::connect(manager, &HmiIntentManager::handlingFailed, [this](int intent, const QString& errors) {
                seen.append(entry("failed", intent) + errors);
            }));
    }

    ~World()
    {
        for (const QMetaObject::Connection& connection : m_listening)
            QObject::disconnect(connection);
        Fuzzing::forgetIntents();
    }

    void run()
    {
        while (!m_input.atEnd()) {
            step();
            compareMonitors();
        }
    }

    Behaviour& behaviour(int number) { return m_behaviours[number]; }

    void remove(int number)
    {
        if (!m_handlers.count(number))
            return;
        const std::unique_ptr<Handler> gone = std::move(m_handlers[number]);
        m_handlers.erase(number);
        for (auto& enabled : m_enabled)
            enabled.second.remove(number);
        for (auto& watched : m_watched)
            watched.second.remove(number); // another one may get its number
    }

    void setEnabled(int number, int intent, bool enabled)
    {
        const auto handler = m_handlers.find(number);
        if (handler == m_handlers.end())
            return;
        const bool watched = m_watched.count(intent) && m_watched.at(intent).contains(number);
        handler->second->setEnabled(intent, enabled);
        if (watched && enabled)
            m_enabled[intent].insert(number);
        if (watched && !enabled)
            m_enabled[intent].remove(number);
    }

    QStringList seen;

private:
    int intent() { return firstIntent + m_input.below(intentCount); }
    int someone() { return m_input.below(mostHandlers); }

    void step()
    {
        switch (m_input.below(8)) {
        case 0:
        case 1:
            return addHandler();
        case 2:
            return remove(someone());
        case 3:
            return registerAgain();
        case 4:
            return watch(intent());
        case 5: {
            const int number = someone();
            return setEnabled(number, intent(), m_input.yes());
        }
        default:
            return request();
        }
    }

    void addHandler()
    {
        const int number = someone();
        if (m_handlers.count(number))
            return;
        QList<int> intents;
        for (int count = m_input.below(4); count > 0; --count)
            intents.append(intent());
        Behaviour& behaviour = m_behaviours[number];
        const int kind = m_input.below(16);
        behaviour.performs = !(kind & 1);
        behaviour.diesThen = (kind & 14) == 2;
        behaviour.kills = (kind & 14) == 4 ? someone() : -1;
        behaviour.changes = (kind & 14) == 6 ? intent() : -1;
        m_handlers[number] = std::make_unique<Handler>(*this, number, intents);
        enlist(number);
    }

    void registerAgain()
    {
        const int number = someone();
        if (m_handlers.count(number))
            enlist(number);
    }

    void enlist(int number)
    {
        HmiIntentManager::instance()->registerIntentHandler(m_handlers[number].get());
        const QList<int> intents = m_handlers[number]->handledActions();
        for (const int intent : intents)
            m_registered[intent].insert(m_registered[intent].begin(), m_handlers[number].get());
    }

    void watch(int intent)
    {
        HmiIntentMonitor* const monitor = HmiIntentManager::instance()->intentMonitor(intent);
        check((monitor != nullptr) == !m_registered[intent].empty(), "a monitor for what anybody ever handled");
        if (!monitor || m_watched.count(intent))
            return;
        for (const auto& handler : m_handlers) {
            if (!handler.second->handledActions().contains(intent))
                continue;
            m_watched[intent].insert(handler.first);
            if (handler.second->isActionEnabled(intent))
                m_enabled[intent].insert(handler.first);
        }
        m_watched[intent];
    }

    void compareMonitors()
    {
        for (int intent = firstIntent; intent < firstIntent + intentCount; ++intent) {
            check(HmiIntentManager::instance()->canPerformAction(intent) == !m_registered[intent].empty(),
                  "can be performed when anybody was ever registered");
            if (m_watched.count(intent))
                check(HmiIntentManager::instance()->intentMonitor(intent)->enabled() == !m_enabled[intent].isEmpty(),
                      "a monitor says whether anybody can", QString::number(intent));
        }
    }

    void request()
    {
        const int intent = this->intent();
        const int kind = m_input.below(4);
        const bool exclusive = kind & 1;
        const bool spoken = kind & 2;
        QStringList expected;
        const bool expectedResult = foretell(intent, exclusive, &expected);
        seen.clear();
        const QList<QVariant> data{intent, QStringLiteral("data")};
        const bool result = HmiIntentManager::instance()->requestAction(intent, data, exclusive, spoken,
                                                                        spoken ? QVariant(3) : QVariant());
        check(seen == expected, "the newest is asked first, all of them or until one performs",
              seen.join(QLatin1String("; ")) + QLatin1String(" instead of ") + expected.join(QLatin1String("; ")));
        check(result == expectedResult, "handled when one performed it");
    }

    /// What a request has to lead to; nothing is changed.
    bool foretell(int intent, bool exclusive, QStringList* expected) const
    {
        const auto registered = m_registered.find(intent);
        if (registered == m_registered.end() || registered->second.empty()) {
            expected->append(entry("nobody", intent));
            return false;
        }
        expected->append(entry("about", intent));
        QSet<int> gone;
        bool isHandled = false;
        QString errors;
        for (const QPointer<Handler>& handler : registered->second) {
            const int number = numberOf(handler);
            if (number < 0 || gone.contains(number))
                continue;
            const Behaviour& behaviour = m_behaviours.at(number);
            expected->append(entry("asked", number, intent));
            if (behaviour.kills >= 0)
                gone.insert(behaviour.kills);
            if (behaviour.diesThen)
                gone.insert(number);
            isHandled = isHandled || behaviour.performs;
            if (!behaviour.performs) {
                errors += errors.isEmpty() ? QString() : QStringLiteral("\n");
                errors += gone.contains(number) ? QString() : QStringLiteral("error %1").arg(number);
            }
            if (exclusive && isHandled)
                break;
        }
        expected->append(isHandled ? entry("handled", intent) : entry("failed", intent) + errors);
        return isHandled;
    }

    int numberOf(const Handler* handler) const
    {
        for (const auto& known : m_handlers)
            if (known.second.get() == handler)
                return known.first;
        return -1;
    }

    Input& m_input;
    std::vector<QMetaObject::Connection> m_listening;
    std::map<int, std::unique_ptr<Handler>> m_handlers;
    std::map<int, Behaviour> m_behaviours;
    std::map<int, std::vector<QPointer<Handler>>>
        m_registered;                   ///< by intent, the newest first; null for those that are gone
    std::map<int, QSet<int>> m_watched; ///< who was there when the monitor was made
    std::map<int, QSet<int>> m_enabled;
};

bool Handler::performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData)
{
    check(data == QList<QVariant>{intent, QStringLiteral("data")}, "data is passed on");
    check(vrEventData.isValid() == vrEvent, "so is what the recogniser says");
    World& world = m_world; // this may be gone before the end
    const int number = m_number;
    const Behaviour behaviour = world.behaviour(number);
    world.seen.append(entry("asked", number, intent));
    if (behaviour.changes >= 0)
        world.setEnabled(number, behaviour.changes, false);
    if (behaviour.kills >= 0)
        world.remove(behaviour.kills);
    if (behaviour.diesThen)
        world.remove(number);
    return behaviour.performs;
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    Input input(data, size);
    World(input).run();
    return 0;
}

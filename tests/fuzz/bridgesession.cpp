// SPDX-License-Identifier: MIT
// A head unit's core while an application layer talks to it, restarts, hangs up and says wrong things.
//
// An input is what the peers send, with bytes between 0 and 8 for what else happens; see the table of steps.
#include "fuzzing.h"

#include "bridgemodel.h"
#include "recordinginitializer.h"

#include <AL2HMIBridge/BridgeConnection>
#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/DeveloperSource>
#include <AL2HMIBridge/GlobalSource>
#include <AL2HMIBridge/KeySource>
#include <AL2HMIBridge/LanguageModel>
#include <AL2HMIBridge/TouchInputReceiverThread>
#include <HmiCore/HardKeyController>
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiLanguageBundleModel>
#include <HmiCore/HmiLanguagePackCollection>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiGuiFramework/AppSettings>

#include <array>
#include <cstdlib>
#include <memory>

using namespace AL2HMIBridge;
using namespace HmiCore;
using Fuzzing::check;

namespace {

constexpr BridgeEndpoint::Channel channels[] = {BridgeEndpoint::Messages, BridgeEndpoint::Priority,
                                                BridgeEndpoint::Touch};
constexpr int refusalBurst = 100; ///< of one connection within a second; further ones are counted only

int s_refusals = 0;

void countRefusal(const QString& message)
{
    if (message.startsWith(QLatin1String("Line refused on ")))
        ++s_refusals;
}

/// The application, started without modules, and what listens to the sources in it.
struct HeadUnit
{
    HeadUnit(int& argc, char** argv)
        : application(argc, argv)
    {
        HmiGuiFramework::AppSettings::mainFolderPath = QStringLiteral(CONFIGURATION "/");
        application.initialize(&initializer);
        HmiMarketPropertyStore::instance()->loadConfiguration(QStringLiteral(CONFIGURATION "/markets"),
                                                              QStringLiteral("config.json"));
        HardKeyController::instance();
        languages = std::make_unique<HmiLanguageBundleModel>();
        const auto note = [this](const char* name) {
            return [this, name](int first, int second) {
                events.append(QStringLiteral("%1 %2 %3").arg(QLatin1String(name)).arg(first).arg(second));
            };
        };
        QObject::connect(KeySource::instance(), &KeySource::keyEvent, &application, note("keyEvent"));
        QObject::connect(KeySource::instance(), &KeySource::keyComboEvent, &application, note("keyComboEvent"));
        const auto noteFence = [this](int number) { events.append(QStringLiteral("fence %1").arg(number)); };
        QObject::connect(KeySource::instance(), &KeySource::fence, &application, noteFence);
        QObject::connect(DeveloperSource::instance(), &DeveloperSource::fence, &application, noteFence);
        QObject::connect(application.findChild<TouchInputReceiverThread*>(),
                         &TouchInputReceiverThread::passThroughViewTouched, &application,
                         [this] { events.append(QStringLiteral("passThroughViewTouched")); });
    }

    RecordingInitializer initializer;
    HmiApplication application;
    std::unique_ptr<HmiLanguageBundleModel> languages;
    QStringList events;
};

std::unique_ptr<HeadUnit> s_headUnit;

/// Of what the peers say, each line by itself; a line ends with the connection too.
bool repeatsKeys(const QByteArray& input)
{
    QByteArray line;
    for (const char byte : input) {
        if (byte == '\n' || (byte >= 2 && byte <= 4)) {
            if (Fuzzing::repeatsKeys(line))
                return true;
            line.clear();
        } else if (uint8_t(byte) > 8) {
            line += byte;
        }
    }
    return Fuzzing::repeatsKeys(line);
}

/// One input on its way.
class Session
{
public:
    void step(uint8_t what, uint8_t next = 0)
    {
        switch (what) {
        case 0: // a piece ends
            return send();
        case 1: // to the next channel
            send();
            m_channel = channels[(m_channel + 1) % 3];
            return;
        case 2: // hangs up
            send();
            m_peers[m_channel].reset();
            return m_model.hangUp(m_channel);
        case 3: // connects anew
            return connectPeer();
        case 4: // and with an empty snapshot
            connectPeer();
            m_piece = "{\"protocol\":1,\"peer\":\"application-layer\"}\n";
            m_piece += m_channel == BridgeEndpoint::Messages ? "{\"snapshot\":\"complete\"}\n" : "";
            return send();
        case 5: // the HMI calls
            send();
            GlobalSource::instance()->setAudioSource(GlobalSource::ALAudioSource(next), next);
            return;
        case 6: // the event loop turns
            send();
            QCoreApplication::sendPostedEvents();
            QCoreApplication::processEvents();
            return compare();
        case 7: // a third of the longest line that there may be
            m_piece += QByteArray(360 * 1024, ' ');
            return send();
        default: // the language of the HMI follows
            send();
            s_headUnit->languages->setCandidateLanguage(GlobalSource::instance()->systemLanguage());
            return;
        }
    }

    void append(uint8_t byte) { m_piece += char(byte); }

    void finish()
    {
        send();
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        compare();
        for (const auto channel : channels) {
            m_peers[channel].reset();
            m_model.hangUp(channel);
        }
        compare();
    }

private:
    void connectPeer()
    {
        send();
        m_peers[m_channel].reset();
        m_model.hangUp(m_channel);
        m_peers[m_channel] = std::make_unique<BridgeTester::Peer>(m_channel);
        m_model.connectPeer(m_channel);
    }

    void send()
    {
        const QByteArray piece = std::exchange(m_piece, QByteArray());
        if (piece.isEmpty() || !m_peers[m_channel])
            return;
        const bool stays = m_peers[m_channel]->send(piece);
        check(stays == m_model.receive(m_channel, piece), "a peer stays while it speaks the protocol");
        if (!stays)
            m_peers[m_channel].reset();
    }

    void compare() const
    {
        const QString difference = m_model.difference();
        check(difference.isEmpty(), "the sources say what the last good messages did", difference);
        check(s_headUnit->events == m_model.events(), "events arrive once and in order",
              s_headUnit->events.join(QLatin1String("; ")) + QLatin1String(" instead of ")
                  + m_model.events().join(QLatin1String("; ")));
        check(s_refusals == m_model.refusals() || m_model.refusals() > refusalBurst,
              "one warning for each refused line",
              QStringLiteral("%1 instead of %2").arg(s_refusals).arg(m_model.refusals()));
        const BridgeConnection* const connection = BridgeConnection::instance();
        for (const auto channel : channels)
            check(connection->channelConnected(channel) == m_model.greeted(channel), "who greeted is connected");
        check(connection->synchronised() == m_model.synchronised(), "a whole snapshot synchronises");
        compareLanguages();
    }

    /// What the core says of the languages is what the vehicle offers, as far as the market has it.
    void compareLanguages() const
    {
        const auto offered = m_model.value(QStringLiteral("GlobalSource"), QStringLiteral("supportedLanguages"));
        const int country = m_model.value(QStringLiteral("GlobalSource"), QStringLiteral("destinationCountry")).toInt();
        const QString bundle =
            HmiMarketPropertyStore::instance()->getProperty(country, QStringLiteral("languageBundle")).toString();
        const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
        for (const int language : packs->bundleLanguageIds(bundle))
            check(packs->supported(language) == offered.value<QList<int>>().contains(language),
                  "a language of the market is supported when it is offered", QString::number(language));
        check(!packs->supported(-2), "no language, no support");
    }

    BridgeModel& m_model = model();
    std::array<std::unique_ptr<BridgeTester::Peer>, 3> m_peers;
    BridgeEndpoint::Channel m_channel = BridgeEndpoint::Messages;
    QByteArray m_piece;

    static BridgeModel& model()
    {
        static BridgeModel model;
        model.reset();
        return model;
    }
};

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv, Fuzzing::Application::Own);
    BridgeEndpoint::setConnector([](BridgeEndpoint::Channel) { return -1; }); // the threads find nobody
    s_headUnit = std::make_unique<HeadUnit>(*argc, *argv);
    std::atexit([] { s_headUnit.reset(); }); // before what Qt keeps for the process
    Fuzzing::readLog(countRefusal);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    if (repeatsKeys(Fuzzing::Input(data, size).rest()))
        return 0;
    static BridgeTester tester;
    BridgeTester::resetState();
    BridgeTester::takeCalls();
    s_headUnit->events.clear();
    s_refusals = 0;

    Session session;
    session.step(4);
    Fuzzing::Input input(data, size);
    for (int longLines = 0; !input.atEnd();) {
        const uint8_t byte = input.byte();
        if (byte > 8)
            session.append(byte);
        else if (byte != 7 || ++longLines <= 4)
            session.step(byte, byte == 5 ? input.byte() : 0);
    }
    session.finish();
    return 0;
}

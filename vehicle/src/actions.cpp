// SPDX-License-Identifier: MIT
#include "actions.h"

#include "HmiVehicle/vehicle.h"

#include <algorithm>

namespace HmiVehicle {

namespace {

constexpr int longestText = 1024;

QString quoted(const char* text)
{
    return QString::fromUtf8(text);
}

std::vector<Action> makeActions()
{
    using Words = const QStringList&;
    return {
        {quoted("ring"),
         {quoted("number")},
         quoted("A call comes in."),
         [](Vehicle& vehicle, Words words) { vehicle.ring(words.at(0)); }},
        {quoted("announce"),
         {quoted("text"), quoted("[AM|FM|DAB]")},
         quoted("A traffic announcement comes, when they are wanted; on FM if nothing else is said."),
         [](Vehicle& vehicle, Words words) {
             vehicle.startTrafficAnnouncement(words.at(0), words.value(1, quoted("FM")));
         }},
        {quoted("answer"),
         {},
         quoted("The other end answers."),
         [](Vehicle& vehicle, Words) { vehicle.answerFarEnd(); }},
        {quoted("hang_up"),
         {},
         quoted("The other end hangs up."),
         [](Vehicle& vehicle, Words) { vehicle.hangUpFarEnd(); }},
        {quoted("phone"),
         {quoted("on|off")},
         quoted("A phone is connected, or none."),
         [](Vehicle& vehicle, Words words) { vehicle.setPhoneConnected(words.at(0) == quoted("on")); }},
        {quoted("ring_projected"),
         {},
         quoted("The projected phone rings."),
         [](Vehicle& vehicle, Words) { vehicle.ringProjectedPhone(); }},
        {quoted("hear"),
         {quoted("text")},
         quoted("Somebody speaks to the voice session."),
         [](Vehicle& vehicle, Words words) { vehicle.hear(words.at(0)); }},
        {quoted("speak"),
         {quoted("text")},
         quoted("A text is spoken."),
         [](Vehicle& vehicle, Words words) { vehicle.speak(words.at(0)); }},
        {quoted("hd"),
         {quoted("on|off")},
         quoted("The digital signal of the FM station is back, or lost."),
         [](Vehicle& vehicle, Words words) { vehicle.setDigitalReception(words.at(0) == quoted("on")); }},
        {quoted("eject"), {}, quoted("The disc comes out."), [](Vehicle& vehicle, Words) { vehicle.ejectDisc(); }},
        {quoted("insert"), {}, quoted("A disc is put in."), [](Vehicle& vehicle, Words) { vehicle.insertDisc(); }},
        {quoted("touch"),
         {},
         quoted("The view behind the HMI is touched."),
         [](Vehicle& vehicle, Words) { vehicle.touchBehindHmi(); }},
        {quoted("project"),
         {quoted("off|wired|wireless")},
         quoted("A phone's screen is projected, or none."),
         [](Vehicle& vehicle, Words words) {
             const QStringList modes{quoted("off"), quoted("wired"), quoted("wireless")};
             vehicle.setProjectionMode(int(modes.indexOf(words.at(0))));
         }},
    };
}

} // namespace

int Action::fewest() const
{
    return int(std::count_if(arguments.cbegin(), arguments.cend(),
                             [](const QString& argument) { return !argument.startsWith(QLatin1Char('[')); }));
}

const std::vector<Action>& allActions()
{
    static const std::vector<Action> actions = makeActions();
    return actions;
}

const Action* findAction(const QString& name)
{
    const auto& actions = allActions();
    const auto found =
        std::find_if(actions.begin(), actions.end(), [&name](const Action& action) { return action.name == name; });
    return found == actions.end() ? nullptr : &*found;
}

QString checkAction(const Action& action, const QStringList& arguments)
{
    if (arguments.size() < action.fewest() || arguments.size() > action.arguments.size())
        return QStringLiteral("'do %1' takes %2")
            .arg(action.name, action.arguments.isEmpty() ? QStringLiteral("nothing more")
                                                         : action.arguments.join(QStringLiteral(", ")));
    for (int i = 0; i < arguments.size(); ++i) {
        QString meaning = action.arguments.at(i);
        meaning.remove(QLatin1Char('[')).remove(QLatin1Char(']'));
        const QStringList choices = meaning.split(QLatin1Char('|'));
        if (choices.size() > 1 && !choices.contains(arguments.at(i)))
            return QStringLiteral("'%1' is none of %2")
                .arg(arguments.at(i).left(64), choices.join(QStringLiteral(", ")));
        if (arguments.at(i).size() > longestText)
            return QStringLiteral("a text of 'do %1' is too long").arg(action.name);
    }
    return QString();
}

} // namespace HmiVehicle

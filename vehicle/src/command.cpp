// SPDX-License-Identifier: MIT
#include "command.h"

#include "HmiVehicle/keycatalogue.h"
#include "HmiVehicle/keyinput.h"
#include "actions.h"
#include "calltable.h"

#include <QJsonArray>

#include <iterator>

namespace HmiVehicle {

namespace {

constexpr int largestTime = 24 * 3600 * 1000;
constexpr int largestNumber = 2147483647;

using Parser = QString (*)(const QStringList& words, Command* command);

QString numberFrom(const QString& word, int least, int greatest, int* number)
{
    bool isNumber = false;
    const int value = word.toInt(&isNumber);
    if (!isNumber || value < least || value > greatest)
        return QStringLiteral("'%1' is not a number from %2 to %3").arg(word.left(64)).arg(least).arg(greatest);
    *number = value;
    return QString();
}

QString keyFrom(const QString& word, int greatest, int* key)
{
    *key = KeyCatalogue::instance().idFrom(word);
    if (*key >= 0 && *key <= greatest)
        return QString();
    return QStringLiteral("'%1' is neither the name of a key nor a number from 0 to %2")
        .arg(word.left(64))
        .arg(greatest);
}

QString parseKey(const QStringList& words, Command* command)
{
    const QString& how = words.at(1);
    const bool isRaw = how == QLatin1String("state");
    const QString problem = keyFrom(words.at(0), isRaw ? largestNumber : KeyInput::largestKey, &command->key);
    if (!problem.isEmpty())
        return problem;
    if (how == QLatin1String("short") && words.size() == 2) {
        command->verb = Command::ShortKey;
        return QString();
    }
    if (how == QLatin1String("long")) {
        command->verb = Command::LongKey;
        return words.size() == 2 ? QString() : numberFrom(words.at(2), 1, largestTime, &command->number);
    }
    command->verb = Command::RawKey;
    return isRaw && words.size() == 3
               ? numberFrom(words.at(2), 0, largestNumber, &command->number)
               : QStringLiteral("a key is pressed 'short', 'long' [ms], or sent as 'state' number");
}

template <Command::Verb verb>
QString parsePress(const QStringList& words, Command* command)
{
    command->verb = verb;
    return keyFrom(words.at(0), KeyInput::largestKey, &command->key);
}

QString parseTurn(const QStringList& words, Command* command)
{
    command->verb = Command::Turn;
    command->number = 1;
    const QString problem = keyFrom(words.at(0), KeyInput::largestKey, &command->key);
    return !problem.isEmpty() || words.size() == 1
               ? problem
               : numberFrom(words.at(1), -KeyInput::maximumSteps, KeyInput::maximumSteps, &command->number);
}

QString parseCombination(const QStringList& words, Command* command)
{
    command->verb = Command::Combination;
    command->number = KeyCombined;
    const QString problem = numberFrom(words.at(0), 0, largestNumber, &command->key);
    return !problem.isEmpty() || words.size() == 1 ? problem
                                                   : numberFrom(words.at(1), 0, largestNumber, &command->number);
}

QString parseField(const QString& word, Command* command)
{
    command->source = word.section(QLatin1Char('.'), 0, 0);
    command->name = word.section(QLatin1Char('.'), 1);
    return CallTable::instance().typeOf(command->source, command->name).isEmpty()
               ? QStringLiteral("there is no state '%1'").arg(word.left(128))
               : QString();
}

QString parseSet(const QStringList& words, Command* command)
{
    command->verb = Command::Set;
    const QString problem = parseField(words.at(0), command);
    if (!problem.isEmpty())
        return problem;
    command->value = valueFromWord(words.at(1), CallTable::instance().typeOf(command->source, command->name));
    return CallTable::instance().checkState(command->source, command->name, command->value);
}

QString parseGet(const QStringList& words, Command* command)
{
    command->verb = Command::Get;
    return parseField(words.at(0), command);
}

QString parseDo(const QStringList& words, Command* command)
{
    command->verb = Command::Do;
    command->name = words.at(0);
    command->details = words.mid(1);
    const Action* const action = findAction(command->name);
    return action ? checkAction(*action, command->details)
                  : QStringLiteral("nothing called '%1' can happen").arg(command->name.left(64));
}

QString parseExpect(const QStringList& words, Command* command)
{
    command->verb = Command::Expect;
    return Expectation::parse(words.join(QLatin1Char(' ')), &command->expectation);
}

QString parseAdvance(const QStringList& words, Command* command)
{
    command->verb = Command::Advance;
    return numberFrom(words.at(0), 0, largestTime, &command->number);
}

QString parseForget(const QStringList&, Command* command)
{
    command->verb = Command::Forget;
    return QString();
}

/// How a command is written. In scenarios the verb's value is the first word and the named ones follow.
struct Grammar
{
    const char* verb;
    int fewest; ///< words after the verb
    int most;
    const char* members[2]; ///< of a scenario's line; the last one may be a list
    Parser parse;
    const char* usage;
    const char* brief;
};

constexpr int anyNumber = 64;

const Grammar grammars[] = {
    {"key", 2, 3, {"how", "ms"}, parseKey, "key KEY short|long [MS]|state N", "press a key; KEY is a name or number"},
    {"press",
     1,
     1,
     {},
     parsePress<Command::Press>,
     "press KEY",
     "a key goes down; it comes up at the latest with the end"},
    {"release", 1, 1, {}, parsePress<Command::Release>, "release KEY", "it comes up"},
    {"turn", 1, 2, {"steps"}, parseTurn, "turn KEY [STEPS]", "a dial steps; below 0 the other way"},
    {"combo", 1, 2, {"state"}, parseCombination, "combo ID [STATE]", "a key combination is complete"},
    {"set", 2, 2, {"to"}, parseSet, "set SOURCE.FIELD VALUE", "switch something in the vehicle"},
    {"get", 1, 1, {}, parseGet, "get SOURCE.FIELD", "print a state"},
    {"do", 1, anyNumber, {"with"}, parseDo, "do ACTION [ARGUMENT]...", "let something happen"},
    {"expect",
     1,
     anyNumber,
     {},
     parseExpect,
     "expect SOURCE.CALL(ARGUMENTS)|SOURCE.FIELD == VALUE|none|hmi",
     "wait for a call (* is any argument), a state, no further call, an HMI"},
    {"advance", 1, 1, {}, parseAdvance, "advance MS", "let the vehicle's time pass at once"},
    {"forget", 0, 1, {}, parseForget, "forget", "expect nothing of the calls so far"},
};

const Grammar* grammarOf(const QString& verb)
{
    for (const Grammar& grammar : grammars)
        if (verb == QLatin1String(grammar.verb))
            return &grammar;
    return nullptr;
}

bool isText(QChar quote, const QString& text, int* i, QString* word)
{
    while (++*i < text.size() && text.at(*i) != quote) {
        if (quote == QLatin1Char('"') && text.at(*i) == QLatin1Char('\\') && *i + 1 < text.size())
            ++*i;
        *word += text.at(*i);
    }
    return *i < text.size();
}

/// What follows is JSON, in which quotes mean something.
bool takesTheRest(const QStringList& words)
{
    return words == QStringList(QStringLiteral("expect")) || (words.size() == 2 && words.at(0) == QLatin1String("set"));
}

QString wordFromMember(const QJsonValue& value)
{
    return value.isString() ? value.toString() : wordFromValue(value);
}

} // namespace

bool Command::isVerb(const QString& word)
{
    return grammarOf(word);
}

QString Command::parse(const QStringList& words, Command* command)
{
    *command = Command();
    const Grammar* const grammar = grammarOf(words.value(0));
    if (!grammar)
        return QStringLiteral("there is no command '%1'").arg(words.value(0).left(64));
    const QStringList rest = words.mid(1);
    if (rest.size() < grammar->fewest || rest.size() > grammar->most)
        return QStringLiteral("write: ") + QString::fromUtf8(grammar->usage);
    return grammar->parse(rest, command);
}

QString Command::wordsOf(const QJsonObject& line, QStringList* words)
{
    const QStringList members = line.keys();
    const Grammar* grammar = nullptr;
    for (const QString& member : members) {
        const Grammar* const found = grammarOf(member);
        if (found && grammar)
            return QStringLiteral("'%1' and '%2' are two commands").arg(QLatin1String(grammar->verb), member);
        grammar = found ? found : grammar;
    }
    if (!grammar)
        return QStringLiteral("no command in it");
    QStringList known{QLatin1String(grammar->verb), QStringLiteral("note")};
    if (grammar->parse == parseExpect)
        known.append(QStringLiteral("within"));
    *words = QStringList{known.at(0), wordFromMember(line.value(known.at(0)))};
    for (const char* const name : grammar->members) {
        const QJsonValue value = name ? line.value(QLatin1String(name)) : QJsonValue(QJsonValue::Undefined);
        known.append(QLatin1String(name));
        const QJsonArray list = value.isArray() && grammar->parse == parseDo ? value.toArray() : QJsonArray{value};
        for (const auto& entry : list)
            if (!entry.isUndefined() && !value.isUndefined())
                words->append(grammar->parse == parseSet ? wordFromValue(entry) : wordFromMember(entry));
    }
    for (const QString& member : members)
        if (!known.contains(member))
            return QStringLiteral("'%1' does not belong to '%2'").arg(member.left(64), known.at(0));
    return QString();
}

QString Command::split(const QString& text, QStringList* words)
{
    QString word;
    bool isWord = false;
    for (int i = 0; i < text.size(); ++i) {
        const QChar character = text.at(i);
        if (!isWord && !character.isSpace() && takesTheRest(*words)) {
            words->append(text.mid(i).trimmed());
            return QString();
        }
        if (character == QLatin1Char('"') || character == QLatin1Char('\'')) {
            isWord = true;
            if (!isText(character, text, &i, &word))
                return QStringLiteral("a quote is not closed");
        } else if (!character.isSpace()) {
            isWord = true;
            word += character;
        } else if (isWord) {
            words->append(word);
            word.clear();
            isWord = false;
        }
    }
    if (isWord)
        words->append(word);
    return QString();
}

QString Command::usage()
{
    QString text;
    for (const Grammar& grammar : grammars)
        text +=
            QStringLiteral("  %1\n      %2\n").arg(QString::fromUtf8(grammar.usage), QString::fromUtf8(grammar.brief));
    text += QStringLiteral("\nActions:\n");
    for (const Action& action : allActions())
        text += QStringLiteral("  do %1\n      %2\n")
                    .arg((QStringList{action.name} + action.arguments).join(QLatin1Char(' ')), action.brief);
    return text;
}

} // namespace HmiVehicle

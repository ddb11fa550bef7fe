// SPDX-License-Identifier: MIT
#include "expectation.h"

#include "calltable.h"

#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>

namespace HmiVehicle {

namespace {

const auto anyArgument = QStringLiteral("{}"); ///< no call has an argument like this
const QLatin1String beginsWith("begins");      ///< field of the object that stands for all texts with this beginning

/// `1, *, "a*", "b"*` as JSON, with a marker for each star outside of quotes: alone, or behind the beginning of a text.
QString withMarkers(const QString& list)
{
    QString result;
    bool quoted = false;
    int text = 0; ///< where the last one begins
    for (int i = 0; i < list.size(); ++i) {
        const QChar character = list.at(i);
        if (character == QLatin1Char('"')) {
            quoted = !quoted;
            text = quoted ? int(result.size()) : text;
        }
        if (quoted && character == QLatin1Char('\\') && i + 1 < list.size()) {
            result += character;
            result += list.at(++i);
        } else if (!quoted && character == QLatin1Char('*') && result.endsWith(QLatin1Char('"'))) {
            result = QStringLiteral("%1{\"%2\":%3}").arg(result.left(text), beginsWith, result.mid(text));
        } else if (!quoted && character == QLatin1Char('*')) {
            result += anyArgument;
        } else {
            result += character;
        }
    }
    return result;
}

QString parseCall(const QRegularExpressionMatch& match, Expectation* expectation)
{
    expectation->kind = Expectation::Call;
    const QString list = QLatin1Char('[') + withMarkers(match.captured(3)) + QLatin1Char(']');
    QJsonParseError error;
    expectation->arguments = QJsonDocument::fromJson(list.toUtf8(), &error).array();
    if (error.error != QJsonParseError::NoError)
        return QStringLiteral("the arguments in '%1' are not JSON values or *").arg(expectation->text.left(200));
    const int count = CallTable::instance().argumentCount(expectation->source, expectation->name);
    if (count < 0)
        return QStringLiteral("there is no call %1.%2()").arg(expectation->source, expectation->name);
    if (count != expectation->arguments.size())
        return QStringLiteral("%1.%2() has %3 arguments, not %4")
            .arg(expectation->source, expectation->name)
            .arg(count)
            .arg(expectation->arguments.size());
    return QString();
}

QString parseState(const QRegularExpressionMatch& match, Expectation* expectation)
{
    expectation->kind = Expectation::State;
    expectation->comparison = match.captured(3);
    const QString type = CallTable::instance().typeOf(expectation->source, expectation->name);
    if (type.isEmpty())
        return QStringLiteral("there is no %1.%2").arg(expectation->source, expectation->name);
    expectation->value = valueFromWord(match.captured(4), type);
    if (expectation->value.isUndefined())
        return QStringLiteral("'%1' is no value of %2.%3")
            .arg(match.captured(4).left(64), expectation->source, expectation->name);
    const bool isOrder =
        expectation->comparison.startsWith(QLatin1Char('<')) || expectation->comparison.startsWith(QLatin1Char('>'));
    return isOrder && !expectation->value.isDouble() ? QStringLiteral("only numbers can be less or greater")
                                                     : QString();
}

bool fits(const QJsonValue& expected, const QJsonValue& actual)
{
    if (!expected.isObject())
        return expected == actual;
    const QString beginning = expected.toObject().value(beginsWith).toString();
    return beginning.isEmpty() || actual.toString().startsWith(beginning);
}

} // namespace

QString Expectation::parse(const QString& text, Expectation* expectation)
{
    *expectation = Expectation();
    expectation->text = text.trimmed();
    if (expectation->text == QLatin1String("none"))
        return QString();
    if (expectation->text == QLatin1String("hmi")) {
        expectation->kind = Hmi;
        return QString();
    }
    static const QRegularExpression call(QStringLiteral("^(\\w+)\\.(\\w+)\\s*\\((.*)\\)$"),
                                         QRegularExpression::DotMatchesEverythingOption);
    static const QRegularExpression state(QStringLiteral("^(\\w+)\\.(\\w+)\\s*(==|!=|<=|>=|<|>)\\s*(.*)$"),
                                          QRegularExpression::DotMatchesEverythingOption);
    const QRegularExpressionMatch callMatch = call.match(expectation->text);
    const QRegularExpressionMatch match = callMatch.hasMatch() ? callMatch : state.match(expectation->text);
    if (!match.hasMatch())
        return QStringLiteral("'%1' is neither Source.call(…) nor Source.field == value nor none")
            .arg(expectation->text.left(200));
    expectation->source = match.captured(1);
    expectation->name = match.captured(2);
    return callMatch.hasMatch() ? parseCall(match, expectation) : parseState(match, expectation);
}

bool Expectation::matches(const QString& callSource, const QString& call, const QJsonArray& callArguments) const
{
    if (kind != Call || source != callSource || name != call || arguments.size() != callArguments.size())
        return false;
    for (int i = 0; i < arguments.size(); ++i)
        if (!fits(arguments.at(i), callArguments.at(i)))
            return false;
    return true;
}

bool Expectation::holdsFor(const QJsonValue& actual) const
{
    if (comparison == QLatin1String("=="))
        return actual == value;
    if (comparison == QLatin1String("!="))
        return actual != value;
    const double difference = actual.toDouble() - value.toDouble();
    const bool isLess = comparison.startsWith(QLatin1Char('<'));
    return (comparison.endsWith(QLatin1Char('=')) && difference == 0) || (isLess ? difference < 0 : difference > 0);
}

QJsonValue valueFromWord(const QString& word, const QString& type)
{
    const QString trimmed = word.trimmed();
    if (type == QLatin1String("text") && !trimmed.startsWith(QLatin1Char('"')))
        return word;
    QJsonParseError error;
    const QJsonArray list = QJsonDocument::fromJson('[' + trimmed.toUtf8() + ']', &error).array();
    return error.error == QJsonParseError::NoError && list.size() == 1 ? list.at(0) : QJsonValue(QJsonValue::Undefined);
}

QString wordFromValue(const QJsonValue& value)
{
    return QString::fromUtf8(QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact).mid(1).chopped(1));
}

QString callText(const QString& source, const QString& call, const QJsonArray& arguments)
{
    QStringList words;
    for (const auto& argument : arguments)
        words.append(wordFromValue(argument));
    return QStringLiteral("%1.%2(%3)").arg(source, call, words.join(QStringLiteral(", ")));
}

} // namespace HmiVehicle

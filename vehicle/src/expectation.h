// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonArray>
#include <QJsonValue>
#include <QString>

namespace HmiVehicle {

/// What a script expects of the HMI or of the vehicle's state.
struct Expectation
{
    enum Kind {
        Call,    ///< `GlobalSource.sendShortPresetKey(1)`; `*` stands for any argument
        State,   ///< `FMTunerSource.activePreset == 2`; also != < <= > >=
        Nothing, ///< `none`: no calls that nobody expected
        Hmi      ///< `hmi`: one is connected and answers
    };

    /// Empty, or what is wrong with \a text.
    static QString parse(const QString& text, Expectation* expectation);

    bool matches(const QString& callSource, const QString& call, const QJsonArray& callArguments) const;
    bool holdsFor(const QJsonValue& actual) const;

    Kind kind = Nothing;
    QString text; ///< as it was written
    QString source;
    QString name; ///< of a call or field
    QJsonArray arguments;
    QString comparison;
    QJsonValue value;
};

/// The value that \a word means for a field of that type: JSON, or for texts also without quotes. Undefined for garbage.
QJsonValue valueFromWord(const QString& word, const QString& type);
/// The other way round.
QString wordFromValue(const QJsonValue& value);
/// A call as people write it.
QString callText(const QString& source, const QString& call, const QJsonArray& arguments);

} // namespace HmiVehicle

// SPDX-License-Identifier: MIT
#pragma once

#include <QJsonArray>
#include <QStringList>

/// \brief The languages for which engines were registered, each with its kind, language and the class that works for it.
///
/// \a warnings gives the warnings since the last call and forgets them. An engine that cannot be made is a problem of the
/// report.
QJsonArray engineLanguages(QStringList (*takeWarnings)());

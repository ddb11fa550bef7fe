// SPDX-License-Identifier: MIT
#pragma once

#include "pointcloud.h"

#include <QStringList>

namespace Latin {

/// \brief Tells which characters strokes look like. Any thread.
///
/// What characters look like is built in. Reading that takes a moment, when it is asked for the first time.
namespace Matcher {

/// \brief Strokes as characters of the table are: 0 is the top of a capital, 1 the line on which letters stand.
struct Template
{
    QChar character;
    QList<Stroke> strokes;
};

/// \brief All that characters may look like, a character several times.
QList<Template> templates();

/// \brief Reads what characters look like, unless that is done.
void prepare();

/// \brief What \a strokes, in the same grid as the templates, may be, each character once and the most likely first. At most \a count.
///
/// Capitals and small letters of the same shape differ by size and place only, so both are near each other.
QStringList candidates(const QList<Stroke>& strokes, int count);

} // namespace Matcher

} // namespace Latin

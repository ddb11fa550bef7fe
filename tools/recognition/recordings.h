// SPDX-License-Identifier: MIT
#pragma once

#include <QList>
#include <QString>
#include <QVariant>

/// What somebody put in, and what was meant.
struct Recording
{
    QString meant;
    QVariantList input; ///< strokes, each a list of points in per cent of the writing area; or keys
    int among = 0;      ///< of keys: so many candidates are enough for it to be there
};

namespace Recordings {

/// \brief The strokes "x,y x,y …" as a recognizer takes them; invalid when they are not that.
QVariant stroke(const QString& points);

/// \brief Written characters, one a line: "character | stroke | stroke …". Lines that begin with "# " are comments, unless they
/// go on with "|". None, and \a error has file and line, when the file cannot be understood.
QList<Recording> written(const QString& file, QString* error);

/// \brief Typed words, one a line: "keys | word | among how many candidates". Comments and errors as above.
QList<Recording> typed(const QString& file, QString* error);

} // namespace Recordings

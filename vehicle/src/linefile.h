// SPDX-License-Identifier: MIT
#pragma once

#include <QFile>
#include <QString>

namespace HmiVehicle {

/// Opens a file of lines. Empty, or why that does not work; only regular files of at most \a maximumSize bytes do.
QString openLines(QFile& file, qint64 maximumSize);

} // namespace HmiVehicle

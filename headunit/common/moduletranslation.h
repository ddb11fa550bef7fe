// SPDX-License-Identifier: MIT
#pragma once

#include <QString>

QT_BEGIN_NAMESPACE
class QObject;
QT_END_NAMESPACE

/// \brief Lets the catalogues `translations/<module>_<language>.qm` of the HMI's main folder follow the language.
///
/// Call it once, while the module is set up; \a parent lives as long as the HMI.
void registerModuleTranslation(const QString& module, QObject* parent);

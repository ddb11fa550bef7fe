// SPDX-License-Identifier: MIT
#pragma once

class IntentTable;
class QObject;

/// \brief The intents that the phone performs: its screens, calls, and the hint that the assistant is switched off.
///
/// \a parent owns the table.
IntentTable* makePhoneIntents(QObject* parent);

// SPDX-License-Identifier: MIT
#pragma once

class ConditionalPopup;
class IntentTable;
class QObject;
class RadioController;

/// \brief The intents that the radio performs: choosing what is heard, showing it, and ending an announcement.
///
/// \a radio and \a announcement outlive the table, which \a parent owns.
IntentTable* makeRadioIntents(RadioController* radio, ConditionalPopup* announcement, QObject* parent);

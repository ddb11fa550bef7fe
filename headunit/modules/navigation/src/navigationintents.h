// SPDX-License-Identifier: MIT
#pragma once

class IntentTable;
class Navigator;
class QObject;

/// \brief The intents that the navigation performs: its screens, and guidance to a place.
///
/// `Navigate` takes the name of a place or the start of it; without one the driver is asked for a destination. \a parent
/// owns the table.
IntentTable* makeNavigationIntents(Navigator* navigator, QObject* parent);

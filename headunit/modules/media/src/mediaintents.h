// SPDX-License-Identifier: MIT
#pragma once

class IntentTable;
class MediaController;
class QObject;

/// \brief The intents that the media module performs: pausing and resuming what plays, and showing it.
///
/// \a media outlives the table, which \a parent owns.
IntentTable* makeMediaIntents(MediaController* media, QObject* parent);

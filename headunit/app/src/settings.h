// SPDX-License-Identifier: MIT
#pragma once

#include <QSize>

/// \brief What the product sets in the framework before the core is initialized: folders, theme, window, fonts.
///
/// Needs the application object; the window's size is \a windowSize in pixels.
void applySettings(const QSize& windowSize);

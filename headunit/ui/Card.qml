// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A raised surface that groups what belongs together.
Rectangle {
    color: Theme.surface
    radius: Theme.radius

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
    }
}

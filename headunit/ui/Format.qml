// SPDX-License-Identifier: MIT
pragma Singleton
import QtQuick 2.15

/// How values are written.
QtObject {
    /// Seconds as minutes and seconds, from an hour on with hours.
    function duration(seconds) {
        const hours = Math.floor(seconds / 3600);
        const minutes = Math.floor(seconds / 60) % 60;
        const twoDigits = function (number) { return (number < 10 ? "0" : "") + number; };
        return hours > 0 ? hours + ":" + twoDigits(minutes) + ":" + twoDigits(seconds % 60) : minutes + ":" + twoDigits(seconds % 60);
    }
}

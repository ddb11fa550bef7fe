// SPDX-License-Identifier: MIT
import QtQuick 2.15

Item {
    property var viewData
    property int idleCount: 0

    function viewIdle() {
        ++idleCount;
    }
}

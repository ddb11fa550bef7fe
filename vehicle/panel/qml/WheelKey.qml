// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

PanelKey {
    width: 50
    height: 40
}

// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiOverrides 1.0

/// How a module is called and drawn now: as it says itself, unless another module overrides that.
QtObject {
    property int domain
    property string ownName
    property url ownIcon

    readonly property var named: HmiOverrides.nameOverrides // domains
    readonly property var drawn: HmiOverrides.iconOverrides
    readonly property string otherName: named.indexOf(domain) < 0 ? "" : HmiOverrides.nameOverride(domain)
    readonly property string otherIcon: drawn.indexOf(domain) < 0 ? "" : HmiOverrides.iconOverride(domain, "")
    readonly property string name: otherName.length > 0 ? otherName : ownName
    readonly property url icon: otherIcon.length > 0 ? otherIcon : ownIcon
}

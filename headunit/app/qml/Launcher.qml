// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The start screen: what plays now, and a tile for every module.
Screen {
    id: root

    title: qsTr("Home")

    readonly property real tileGap: Theme.gap * 1.25

    NowPlayingCard {
        id: nowPlaying

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; leftMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Math.round(parent.width * 0.4)
    }

    Flickable {
        id: scroller

        anchors {
            left: nowPlaying.right; right: parent.right; top: parent.top; bottom: parent.bottom
            leftMargin: root.tileGap; rightMargin: Theme.margin; bottomMargin: Theme.margin
        }
        contentHeight: tiles.height
        clip: true
        boundsBehavior: Flickable.StopAtBounds

        Flow {
            id: tiles

            readonly property real tileHeight: Math.floor((scroller.height - spacing) / 2)
            readonly property real tileWidth: Math.floor((width - spacing) / 2)

            objectName: "launcherTiles"
            width: parent.width
            spacing: root.tileGap
            layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
            LayoutMirroring.enabled: false // mirrored by its layout direction

            Repeater {
                model: _modulesModel

                // The home module is first by its priority, and has a row of its own.
                ModuleTile {
                    objectName: "tile" + model.moduleId
                    width: isHome ? tiles.width : tiles.tileWidth
                    height: tiles.tileHeight
                    iconUrl: model.iconUrl
                    name: model.moduleName
                    active: !model.moduleBlocked
                    isHome: model.moduleRootView === _homeState
                    onClicked: _viewManager.requestView(model.moduleRootView)
                }
            }
        }
    }
}

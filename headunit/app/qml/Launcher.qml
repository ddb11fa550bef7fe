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

    GridView {
        id: grid

        objectName: "launcherGrid"
        anchors {
            left: nowPlaying.right; right: parent.right; top: parent.top; bottom: parent.bottom
            leftMargin: root.tileGap; rightMargin: Theme.margin - root.tileGap; bottomMargin: Theme.margin - root.tileGap
        }
        cellWidth: Math.floor(width / 2)
        cellHeight: Math.floor(height / Math.max(2, Math.min(3, Math.ceil(count / 2))))
        model: _modulesModel
        clip: true
        boundsBehavior: Flickable.StopAtBounds
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight

        delegate: Item {
            width: grid.cellWidth
            height: grid.cellHeight

            ModuleTile {
                objectName: "tile" + model.moduleId
                anchors { fill: parent; rightMargin: root.tileGap; bottomMargin: root.tileGap }
                iconUrl: model.iconUrl
                name: model.moduleName
                active: !model.moduleBlocked
                isHome: model.moduleRootView === _homeState
                onClicked: _viewManager.requestView(model.moduleRootView)
            }
        }
    }
}

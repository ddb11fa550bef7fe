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
        width: Math.round(parent.width * (tiles.columns > 2 ? 0.35 : 0.4))
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

            readonly property int columns: repeater.count > 4 ? 3 : 2
            readonly property int homeSpan: 1 + (columns - repeater.count % columns) % columns
            readonly property int rows: Math.min(3, Math.ceil((repeater.count + homeSpan - 1) / columns))
            readonly property real tileHeight: Math.floor((scroller.height - (rows - 1) * spacing) / rows)
            readonly property real tileWidth: widthOf(1)

            // Of a number of cells with the gaps between them.
            function widthOf(cells) {
                return Math.floor((width - (columns - 1) * spacing) / columns) * cells + (cells - 1) * spacing;
            }

            objectName: "launcherTiles"
            width: parent.width
            spacing: root.tileGap
            layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
            LayoutMirroring.enabled: false // mirrored by its layout direction

            Repeater {
                id: repeater

                model: _modulesModel

                // The home module is first by its priority, and as wide as it takes to leave no gap.
                ModuleTile {
                    readonly property ModuleEntry entry: ModuleEntry {
                        domain: model.moduleDomain
                        ownName: qsTranslate("Modules", model.moduleName)
                        ownIcon: model.iconUrl
                    }

                    objectName: "tile" + model.moduleId
                    width: isHome ? tiles.widthOf(tiles.homeSpan) : tiles.tileWidth
                    height: tiles.tileHeight
                    iconUrl: entry.icon
                    name: entry.name
                    active: !model.moduleBlocked
                    mark: _moduleMarks.marks[model.moduleId] || 0
                    isHome: model.moduleRootView === _homeState
                    onClicked: _moduleActivation.open(model.moduleDomain, model.moduleRootView)
                }
            }
        }
    }
}

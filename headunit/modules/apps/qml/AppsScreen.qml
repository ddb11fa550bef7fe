// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The projected phone, and the modules that lie beyond the first row of the start screen.
Screen {
    id: root

    readonly property int firstRow: 2 // modules that the start screen shows in its first row

    title: qsTr("Apps")

    PhonePanel {
        id: phone

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; leftMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Math.round(parent.width * 0.36)
    }

    Card {
        anchors {
            left: phone.right; right: parent.right; top: parent.top; bottom: parent.bottom
            leftMargin: Theme.gap; rightMargin: Theme.margin; bottomMargin: Theme.margin
        }

        Flickable {
            id: scroller

            anchors { fill: parent; margins: Theme.margin }
            contentHeight: tiles.height
            clip: true
            boundsBehavior: Flickable.StopAtBounds

            Flow {
                id: tiles

                readonly property real tileWidth: Math.floor((width - 2 * spacing) / 3)

                objectName: "apps"
                width: parent.width
                spacing: Theme.gap

                Repeater {
                    model: _modulesModel

                    AppTile {
                        objectName: "app" + model.moduleId
                        visible: index >= root.firstRow && model.moduleId !== "APPS"
                        width: tiles.tileWidth
                        height: Theme.px(180)
                        iconUrl: model.iconUrl
                        name: qsTranslate("Modules", model.moduleName)
                        active: !model.moduleBlocked
                        onClicked: _viewManager.requestView(model.moduleRootView)
                    }
                }
            }
        }
    }
}

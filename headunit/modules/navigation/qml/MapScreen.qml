// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiNavigation 1.0
import HmiUi 1.0

/// The map, and beside it what to do next or where to go.
Screen {
    id: root

    readonly property real panelSpace: panel.width + Theme.margin

    title: _navigation.active ? _navigation.destination : qsTr("Navigation")

    NavigationMap {
        id: map

        objectName: "map"
        anchors.fill: parent
        navigator: _navigation
        immediate: !AppSettings.animations
        unit: Theme.scale
        font.pixelSize: Theme.textCaption
        font.weight: Font.DemiBold
        pivot: Qt.point(Math.round((width + (Theme.mirrored ? -root.panelSpace : root.panelSpace)) / 2), Math.round(height / 2))
        colors: ({
            land: Theme.mapLand, built: Theme.mapBuilt, park: Theme.mapPark, water: Theme.mapWater,
            street: Theme.mapStreet, mainStreet: Theme.mapMainStreet, motorway: Theme.mapMotorway, roadEdge: Theme.mapRoadEdge,
            route: Theme.mapRoute, routeEdge: Theme.mapRouteEdge, name: Theme.mapName, nameEdge: Theme.mapNameEdge,
            parkName: Theme.mapParkName, mark: Theme.mapMark, markEdge: Theme.mapMarkEdge
        })

        PinchArea {
            anchors.fill: parent
            onPinchUpdated: function (pinch) { map.zoomBy(pinch.scale / pinch.previousScale); }

            MouseArea {
                property point last

                objectName: "mapArea"
                anchors.fill: parent
                onPressed: function (mouse) { last = Qt.point(mouse.x, mouse.y); }
                onPositionChanged: function (mouse) {
                    map.panBy(mouse.x - last.x, mouse.y - last.y);
                    last = Qt.point(mouse.x, mouse.y);
                }
                onWheel: function (wheel) { map.zoomBy(wheel.angleDelta.y > 0 ? 1.25 : 0.8); }
            }
        }

        Rectangle {
            objectName: "vehicleMark"
            x: map.vehicle.x - width / 2
            y: map.vehicle.y - height / 2
            width: Theme.px(58)
            height: width
            radius: width / 2
            color: Theme.accent
            border.width: Theme.px(4)
            border.color: Theme.surface

            Icon {
                anchors.centerIn: parent
                name: "vehicle"
                size: Theme.px(36)
                color: Theme.accentText
                rotation: _navigation.heading
            }
        }
    }

    Item {
        id: panel

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; leftMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Theme.px(400)

        StartPanel {
            anchors.fill: parent
            visible: !_navigation.active
        }

        GuidancePanel {
            anchors.fill: parent
            visible: _navigation.active
        }
    }

    Column {
        anchors { right: parent.right; bottom: parent.bottom; rightMargin: Theme.margin; bottomMargin: Theme.margin }
        spacing: Theme.gap

        IconButton {
            objectName: "followVehicle"
            visible: !map.following
            icon: "locate"
            label: qsTr("Back to the vehicle")
            fill: Theme.accent
            iconColor: Theme.accentText
            onClicked: map.following = true
        }

        IconButton {
            objectName: "zoomIn"
            icon: "plus"
            label: qsTr("Zoom in")
            fill: Theme.surface
            onClicked: map.zoomBy(1.5)
        }

        IconButton {
            objectName: "zoomOut"
            icon: "minus"
            label: qsTr("Zoom out")
            fill: Theme.surface
            onClicked: map.zoomBy(1 / 1.5)
        }
    }
}

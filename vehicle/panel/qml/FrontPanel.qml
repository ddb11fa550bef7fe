// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// The faceplate around the screen: two knobs, and the keys between them.
Rectangle {
    id: root

    readonly property var rows: [
        [{ keyId: 13, label: qsTr("SOURCE") }, { keyId: 15, label: qsTr("CD") }, { keyId: 47, label: qsTr("SAT") },
         { keyId: 35, label: qsTr("TRAFFIC") }, { keyId: 60, label: qsTr("DISPLAY"), icon: "display" },
         { keyId: 48, label: qsTr("MUTE"), icon: "mute" }],
        [{ keyId: 22, label: "1" }, { keyId: 23, label: "2" }, { keyId: 24, label: "3" }, { keyId: 25, label: "4" },
         { keyId: 26, label: "5" }, { keyId: 27, label: "6" }],
        [{ keyId: 6, label: qsTr("SEEK"), icon: "seek-down" }, { keyId: 7, label: qsTr("SEEK"), icon: "seek-up" },
         { keyId: 83, label: qsTr("PLAY"), icon: "play-pause" }, { keyId: 12, label: qsTr("PHONE"), icon: "phone" },
         { keyId: 49, label: qsTr("TAKE"), icon: "pick-up" }, { keyId: 50, label: qsTr("END"), icon: "end" }],
        [{ keyId: 77, label: qsTr("SEEK L"), icon: "left" }, { keyId: 78, label: qsTr("SEEK R"), icon: "right" },
         { keyId: 100, label: qsTr("NAV") }, { keyId: 101, label: qsTr("CLIMATE") }, { keyId: 102, label: qsTr("INBOX") },
         { keyId: 103, label: qsTr("APPS") }],
        [{ keyId: 104, label: qsTr("DEFROST") }, { keyId: 106, label: qsTr("COOLER") }, { keyId: 105, label: qsTr("WARMER") }]
    ]

    implicitWidth: 920
    implicitHeight: 318
    radius: 18
    border.color: Style.plateEdge
    gradient: Gradient {
        GradientStop { position: 0; color: "#222a33" }
        GradientStop { position: 1; color: "#141a20" }
    }

    Knob {
        x: 24
        anchors.verticalCenter: parent.verticalCenter
        downKey: 9
        upKey: 8
        middleKey: 41
        middleIcon: "power"
        label: qsTr("Volume, power")
    }

    Column {
        anchors.centerIn: parent
        spacing: Style.gap

        Repeater {
            model: root.rows

            Row {
                required property var modelData
                anchors.horizontalCenter: parent.horizontalCenter
                spacing: Style.gap

                Repeater {
                    model: parent.modelData

                    PanelKey {
                        required property var modelData
                        keyId: modelData.keyId
                        label: modelData.label
                        icon: modelData.icon === undefined ? "" : modelData.icon
                    }
                }
            }
        }
    }

    Knob {
        anchors.right: parent.right
        anchors.rightMargin: 24
        anchors.verticalCenter: parent.verticalCenter
        downKey: 55
        upKey: 54
        middleKey: 110
        middleIcon: "select"
        label: qsTr("Tune, choose")
    }
}

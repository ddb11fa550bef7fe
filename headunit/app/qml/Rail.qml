// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The way to every module from everywhere: home, the modules by priority, and back.
Rectangle {
    id: root

    width: Theme.railWidth
    color: Theme.surface

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong }
    }

    component RailButton: Tappable {
        id: button

        property string icon
        property url iconUrl: icon.length > 0 ? "image://hmiimages/" + icon : ""
        property bool current: false
        property bool mirrorsWithLayout: false

        width: Theme.railWidth
        height: Theme.px(80)
        radius: 0

        Rectangle {
            anchors.left: parent.left
            width: Theme.px(5)
            height: parent.height
            visible: button.current
            color: Theme.accent
        }

        Icon {
            anchors.centerIn: parent
            base: button.iconUrl
            size: Theme.px(38)
            color: button.current ? Theme.accent : Theme.text
            opacity: button.active ? 1 : 0.3
            mirrorsWithLayout: button.mirrorsWithLayout
        }
    }

    Column {
        anchors { top: parent.top; left: parent.left }

        RailButton {
            objectName: "railHome"
            icon: "home"
            label: qsTr("Home")
            current: _viewManager.currentView === "SYSTEM.Launcher"
            onClicked: _stateMachine.sendKeySignal("Home")
        }

        Repeater {
            model: _modulesModel

            RailButton {
                objectName: "rail" + model.moduleId
                visible: index < 6
                iconUrl: model.iconUrl
                label: model.moduleName
                active: !model.moduleBlocked
                current: _viewManager.currentView.indexOf(model.moduleRootView + ".") === 0
                onClicked: _viewManager.requestView(model.moduleRootView)
            }
        }
    }

    RailButton {
        objectName: "railBack"
        anchors { bottom: parent.bottom; left: parent.left }
        icon: "back"
        label: qsTr("Back")
        mirrorsWithLayout: true
        active: _viewManager.currentView !== "SYSTEM.Launcher"
        onClicked: _stateMachine.sendKeySignal("Back")
    }
}

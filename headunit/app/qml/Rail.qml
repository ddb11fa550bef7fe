// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// The way to every module from everywhere: home, the modules by priority, and back.
Rectangle {
    id: root

    // Home, the projected phone and back beside the modules; keys get lower before modules go missing.
    readonly property int most: Math.floor(height / Theme.touchTarget) - 3
    readonly property real keyHeight: Math.min(Theme.px(80), Math.floor(height / (Math.min(modules.count, most) + 3)))

    width: Theme.railWidth
    color: Theme.surface

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
    }

    component RailButton: Tappable {
        id: button

        property string icon
        property url iconUrl: icon.length > 0 ? "image://hmiimages/" + icon : ""
        property bool current: false
        property bool mirrorsWithLayout: false
        property bool marked: false // things wait there

        width: Theme.railWidth
        height: root.keyHeight
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

            Rectangle {
                anchors { right: parent.right; top: parent.top }
                width: Theme.px(14)
                height: width
                radius: width / 2
                visible: button.marked
                color: Theme.accent
                border.width: Theme.px(2)
                border.color: root.color
            }
        }
    }

    Column {
        anchors { top: parent.top; left: parent.left }

        RailButton {
            objectName: "railHome"
            icon: "home"
            label: qsTr("Home")
            current: _viewManager.currentView === "SYSTEM.Launcher"
            onClicked: HmiIntents.requestAction(HmiIntents.GoHome)
        }

        Repeater {
            id: modules

            model: _modulesModel

            RailButton {
                readonly property ModuleEntry entry: ModuleEntry {
                    domain: model.moduleDomain
                    ownName: qsTranslate("Modules", model.moduleName)
                    ownIcon: model.iconUrl
                }

                objectName: "rail" + model.moduleId
                visible: index < root.most
                iconUrl: entry.icon
                label: entry.name
                active: !model.moduleBlocked
                marked: (_moduleMarks.marks[model.moduleId] || 0) > 0
                current: _viewManager.currentView.indexOf(model.moduleRootView + ".") === 0
                onClicked: _moduleActivation.open(model.moduleDomain, model.moduleRootView)
            }
        }

        RailButton {
            objectName: "railProjection"
            visible: _projectionSource.projectionMode !== 0
            icon: "projection"
            label: qsTr("Phone screen")
            current: _viewManager.currentView === "SYSTEM.Projection"
            onClicked: HmiIntents.requestAction(HmiIntents.ShowProjection)
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

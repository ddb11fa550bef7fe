// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiClimate 1.0
import HmiUi 1.0

/// Both sides' temperatures with the air between them, and a row of keys for the rest.
Screen {
    id: root

    title: qsTr("Climate")

    ClimateZone {
        id: driver

        anchors { left: parent.left; top: parent.top; bottom: keys.top; leftMargin: Theme.margin; bottomMargin: Theme.gap }
        width: Theme.px(300)
        name: "driver"
        title: qsTr("Driver")
        temperature: _climate.driverTemperature
        seat: _climate.driverSeat
        onStepped: function (steps) { _climate.stepTemperature(Climate.Driver, steps); }
        onSeatPressed: _climate.stepSeat(Climate.Driver)
    }

    ClimateZone {
        id: passenger

        anchors { right: parent.right; top: parent.top; bottom: keys.top; rightMargin: Theme.margin; bottomMargin: Theme.gap }
        width: driver.width
        name: "passenger"
        title: qsTr("Passenger")
        temperature: _climate.passengerTemperature
        seat: _climate.passengerSeat
        onStepped: function (steps) { _climate.stepTemperature(Climate.Passenger, steps); }
        onSeatPressed: _climate.stepSeat(Climate.Passenger)
    }

    Card {
        anchors { left: driver.right; right: passenger.left; top: parent.top; bottom: keys.top; leftMargin: Theme.gap; rightMargin: Theme.gap; bottomMargin: Theme.gap }

        Icon {
            id: fanIcon

            anchors { horizontalCenter: parent.horizontalCenter; top: parent.top; topMargin: Theme.margin }
            name: "fan"
            size: Theme.px(64)
            color: _climate.on ? Theme.accent : Theme.textMuted
        }

        Label {
            objectName: "climateState"
            anchors { left: parent.left; right: parent.right; top: fanIcon.bottom; topMargin: Theme.gap / 2 }
            horizontalAlignment: Text.AlignHCenter
            content: !_climate.on ? qsTr("Off") : _climate.defrosting ? qsTr("Defrosting") : _climate.automatic ? qsTr("Automatic") : qsTr("By hand")
            color: Theme.textMuted
        }

        FanControl {
            anchors { left: parent.left; right: parent.right; bottom: air.top; margins: Theme.margin }
        }

        AirKeys {
            id: air

            anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
            height: Theme.px(132)
        }
    }

    Row {
        id: keys

        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
        height: Theme.px(116)
        spacing: Theme.gap

        Repeater {
            model: [
                { name: "climatePower", property: "on", icon: "power", text: qsTr("On") },
                { name: "climateAuto", property: "automatic", icon: "auto", text: qsTr("Automatic") },
                { name: "climateCooling", property: "cooling", icon: "cooling", text: qsTr("Cooling") },
                { name: "climateRecirculation", property: "recirculating", icon: "recirculation", text: qsTr("Recirculation") },
                { name: "climateDefrost", property: "defrosting", icon: "air-windscreen", text: qsTr("Defrost") },
                { name: "climateRear", property: "rearDefrosting", icon: "defrost-rear", text: qsTr("Rear window") },
                { name: "climateSync", property: "synchronous", icon: "sync", text: qsTr("Both sides") }
            ]

            ClimateKey {
                objectName: modelData.name
                width: (keys.width - 6 * keys.spacing) / 7
                height: keys.height
                ground: Theme.surface
                icon: modelData.icon
                text: modelData.text
                on: _climate[modelData.property]
                onClicked: _climate[modelData.property] = !_climate[modelData.property]
            }
        }
    }
}

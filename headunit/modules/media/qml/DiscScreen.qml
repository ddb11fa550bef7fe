// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The tracks of the disc. Only the one that plays has told its title.
Screen {
    id: root

    title: qsTr("CD")

    Card {
        id: card

        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
    }

    EmptyNote {
        anchors { left: card.left; right: card.right; verticalCenter: card.verticalCenter }
        visible: list.count === 0
        icon: "disc"
        text: _cdSource.cdStatus === 1 ? qsTr("Reading the disc…") : qsTr("No disc")
    }

    ScrollList {
        id: list

        objectName: "discTracks"
        anchors { fill: card; margins: Theme.gap }
        model: _cdSource.trackCount
        header: Label {
            width: list.width
            height: _cdSource.discTitle.length > 0 ? Theme.px(56) : 0
            leftPadding: Theme.gap
            rightPadding: Theme.gap
            content: _cdSource.discTitle
            color: Theme.accent
            font.weight: Font.DemiBold
        }

        delegate: ListRow {
            readonly property bool current: index + 1 === _cdSource.track

            objectName: "discTrack" + (index + 1)
            width: list.width
            icon: "disc"
            title: current && _cdSource.title.length > 0 ? _cdSource.title : qsTr("Track %1").arg(index + 1)
            value: current ? qsTr("Track %1").arg(index + 1) : ""
            selected: current
            onClicked: {
                _media.playDiscTrack(index + 1);
                _viewManager.requestView("MEDIA.Main");
            }
        }
    }
}

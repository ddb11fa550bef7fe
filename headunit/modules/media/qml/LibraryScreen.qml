// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// All tracks of the player, by title, artist or album.
Screen {
    id: root

    title: qsTr("Library")

    SegmentedControl {
        id: orders

        objectName: "libraryOrder"
        anchors { left: parent.left; leftMargin: Theme.margin; top: parent.top }
        options: [qsTr("Titles"), qsTr("Artists"), qsTr("Albums")]
        current: _media.library.order
        onChosen: function (index) { _media.library.order = index; }
    }

    Card {
        id: card

        anchors {
            left: parent.left; right: parent.right; top: orders.bottom; bottom: parent.bottom
            leftMargin: Theme.margin; rightMargin: Theme.margin; topMargin: Theme.gap; bottomMargin: Theme.margin
        }
    }

    EmptyNote {
        anchors { left: card.left; right: card.right; verticalCenter: card.verticalCenter }
        visible: list.count === 0
        icon: "media"
        text: qsTr("No music")
    }

    ScrollList {
        id: list

        objectName: "library"
        anchors { fill: card; margins: Theme.gap }
        model: _media.library
        section.property: "section"
        section.delegate: Label {
            width: list.width
            height: Theme.px(48)
            leftPadding: Theme.gap
            rightPadding: Theme.gap
            content: section
            color: Theme.accent
            font.pixelSize: Theme.textCaption
            font.weight: Font.Bold
        }

        delegate: ListRow {
            objectName: "track" + model.row
            width: list.width
            icon: "media"
            title: model.title
            subtitle: model.detail
            selected: model.row === _mediaSource.trackIndex
            onClicked: {
                _media.playLibraryRow(model.row);
                _viewManager.requestView("MEDIA.Main");
            }
        }
    }
}

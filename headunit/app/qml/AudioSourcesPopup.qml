// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Chooses where the sound comes from.
PopupCard {
    id: root

    title: qsTr("Sources")
    icon: "source"
    wide: true
    dismissible: true
    onDismissed: _viewManager.closePopup("SYSTEM.AudioSources")

    Grid {
        id: grid

        width: parent.width
        columns: 2
        spacing: Theme.gap / 2
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Repeater {
            model: _audioSources

            ListRow {
                objectName: "source" + index
                width: Math.floor((grid.width - grid.spacing) / 2)
                icon: model.icon
                title: model.name
                subtitle: model.hint
                selected: model.active
                active: model.playable
                dimmed: !model.playable
                onClicked: {
                    _viewManager.closePopup("SYSTEM.AudioSources");
                    _audioSources.select(index);
                }

                Icon {
                    visible: model.active
                    name: "check"
                    color: Theme.accent
                }
            }
        }
    }
}

// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The keys of the layout, row by row. Rows are as wide as the widest, in keys that type, so keys are equally wide.
Column {
    id: root

    readonly property var rows: _inputPanel.rows
    readonly property real rowHeight: Math.floor((height - (rows.length - 1) * spacing) / rows.length)
    readonly property real widest: widestRow(rows)

    spacing: Theme.px(8)

    Repeater {
        model: root.rows

        Row {
            id: row

            readonly property int rowIndex: index

            anchors.horizontalCenter: parent.horizontalCenter
            spacing: root.spacing
            layoutDirection: Qt.LeftToRight
            LayoutMirroring.enabled: false // keys that type stay in order; the others come mirrored

            Repeater {
                model: modelData

                Key {
                    objectName: modelData.action.length > 0 ? "key_" + modelData.action : "key" + row.rowIndex + "_" + index
                    width: Math.floor((root.width + root.spacing) / root.widest * modelData.width - root.spacing)
                    height: root.rowHeight
                    key: modelData
                }
            }
        }
    }

    function widestRow(rows) {
        let widest = 8;
        for (let i = 0; i < rows.length; ++i) {
            let width = 0;
            for (let k = 0; k < rows[i].length; ++k)
                width += rows[i][k].width;
            widest = Math.max(widest, width);
        }
        return widest;
    }
}

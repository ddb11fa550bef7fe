// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiCore 1.0
import HmiUi 1.0

/// The languages that the market offers, in their own names.
Screen {
    id: root

    title: qsTr("Language")

    property bool isOffered: true // the language that the vehicle is set to

    HmiLanguageBundleModel {
        id: languages

        bundleId: _market.languageBundle
        candidateLanguage: _globalSource.systemLanguage
        onSupportedLanguageChanged: root.isOffered = supportedLanguage === candidateLanguage
    }

    // Another market has other languages; what is used is worked out again for a new candidate only.
    Connections {
        target: _market
        function onChanged() {
            languages.candidateLanguage = -1
            languages.candidateLanguage = Qt.binding(() => _globalSource.systemLanguage)
        }
    }

    Card {
        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }

        Label {
            id: note

            objectName: "languageNote"
            anchors { top: parent.top; left: parent.left; right: parent.right; margins: Theme.margin }
            visible: !root.isOffered
            wrapMode: Text.Wrap
            maximumLineCount: 3
            color: Theme.textMuted
            content: qsTr("The language of the vehicle is not offered here. This one is used instead.")
        }

        ScrollList {
            id: list

            objectName: "languages"
            anchors { top: note.visible ? note.bottom : parent.top; left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.gap }
            model: languages

            delegate: ListRow {
                readonly property int language: languages.mapped(index)

                objectName: "language" + model.locale
                width: list.width
                title: model.name
                selected: language === languages.supportedLanguage
                onClicked: _language.choose(language)
            }
        }
    }
}

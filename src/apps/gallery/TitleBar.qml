import QtQuick

/* The name of the document, and how the app looks. */
Rectangle {
    id: bar

    property bool dark
    property bool mirrored
    property bool roomy: true

    signal darkChosen(bool dark)
    signal mirroredChosen(bool mirrored)

    color: Style.panel
    implicitHeight: 64

    Column {
        anchors.left: parent.left
        anchors.leftMargin: Style.margin + 4
        anchors.verticalCenter: parent.verticalCenter
        spacing: 1

        Label {
            anchors.left: parent.left
            font.family: Style.displayFamily
            font.pixelSize: Style.titleSize
            font.weight: Font.Bold
            text: qsTr("Broadside")
        }
        Label {
            anchors.left: parent.left
            font.pixelSize: Style.captionSize
            secondary: true
            text: bar.roomy ? qsTr("Lakeside Nights, poster, 600 × 840 mm") : qsTr("Lakeside Nights")
        }
    }
    Row {
        anchors.right: parent.right
        anchors.rightMargin: Style.margin
        anchors.verticalCenter: parent.verticalCenter
        spacing: Style.gap

        SegmentedChoice {
            current: bar.mirrored ? 1 : 0
            words: ["LTR", "RTL"]

            onChosen: index => bar.mirroredChosen(index === 1)
        }
        SegmentedChoice {
            current: bar.dark ? 1 : 0
            words: [qsTr("Light"), qsTr("Dark")]

            onChosen: index => bar.darkChosen(index === 1)
        }
    }
    Rectangle {
        anchors.bottom: parent.bottom
        color: Style.separator
        height: 1
        width: parent.width
    }
}

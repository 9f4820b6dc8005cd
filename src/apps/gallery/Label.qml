import QtQuick

/* Text in the app's face; a name for people and for assistive technology alike. */
Text {
    property bool secondary: false

    color: secondary ? Style.secondaryText : Style.text
    elide: Text.ElideRight
    font.family: Style.family
    font.pixelSize: Style.bodySize
    horizontalAlignment: Text.AlignLeft
    textFormat: Text.PlainText
    verticalAlignment: Text.AlignVCenter
}

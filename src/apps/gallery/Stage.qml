import QtQuick
import Favrin.Gallery

/* The poster, its parts and what can be done with them: side by side where there is room, otherwise stacked. */
Item {
    id: stage

    required property Poster poster
    property int presentation

    readonly property bool wide: width >= parts.width + actions.width + 3 * Style.margin

    signal embedRequested
    signal popoverRequested(Item anchor)
    signal presentRequested

    PosterView {
        anchors.bottom: parts.top
        anchors.left: parent.left
        anchors.margins: stage.wide ? 32 : Style.margin
        anchors.right: parent.right
        anchors.top: parent.top
        poster: stage.poster
    }
    PartStrip {
        id: parts

        anchors.bottom: stage.wide ? parent.bottom : actions.top
        anchors.bottomMargin: Style.gap
        anchors.left: parent.left
        anchors.leftMargin: stage.wide ? Style.margin : (stage.width - width) / 2
        poster: stage.poster
    }
    ActionBar {
        id: actions

        anchors.bottom: parent.bottom
        anchors.bottomMargin: stage.wide ? Style.gap + (parts.height - height) / 2 : Style.margin
        anchors.right: parent.right
        anchors.rightMargin: stage.wide ? Style.margin : (stage.width - width) / 2
        poster: stage.poster
        presentation: stage.presentation

        onEmbedRequested: stage.embedRequested()
        onPopoverRequested: anchor => stage.popoverRequested(anchor)
        onPresentRequested: stage.presentRequested()
    }
}

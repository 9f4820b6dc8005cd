import QtQuick
import Favrin.Gallery

/* The window: poster and actions, and the inspector beside them or, where that does not fit, below. */
Window {
    id: window

    required property Gallery gallery
    readonly property bool wide: width >= 940

    /* Of the inspector where it lies below. */
    readonly property real lowerHeight: inspector.embedded ? Math.min(inspector.heightForPicker, 0.62 * height)
                                                           : Math.round(0.3 * height)

    color: Style.desk
    height: 820
    minimumHeight: 560
    minimumWidth: 360
    title: qsTr("Broadside")
    width: 1240

    Binding {
        property: "dark"
        target: Style
        value: window.gallery.dark
    }
    Item {
        LayoutMirroring.childrenInherit: true
        LayoutMirroring.enabled: window.gallery.mirrored
        anchors.fill: parent

        TitleBar {
            id: bar

            anchors.left: parent.left
            anchors.right: parent.right
            dark: window.gallery.dark
            mirrored: window.gallery.mirrored
            roomy: window.width > 560

            onDarkChosen: dark => window.gallery.dark = dark
            onMirroredChosen: mirrored => window.gallery.mirrored = mirrored
        }
        Stage {
            anchors.bottom: window.wide ? parent.bottom : inspector.top
            anchors.left: parent.left
            anchors.right: window.wide ? inspector.left : parent.right
            anchors.top: bar.bottom
            poster: window.gallery.poster
            presentation: window.gallery.presenter.presentation

            onEmbedRequested: window.gallery.presenter.embed(inspector.pickerPlace)
            onPopoverRequested: anchor => window.gallery.presenter.presentPopover(anchor)
            onPresentRequested: window.gallery.presenter.present(window)
        }
        Inspector {
            id: inspector

            anchors.bottom: parent.bottom
            anchors.right: parent.right
            gallery: window.gallery
            height: window.wide ? parent.height - bar.height : window.lowerHeight
            width: window.wide ? 392 : parent.width

            Rectangle {
                color: Style.separator
                height: window.wide ? parent.height : 1
                width: window.wide ? 1 : parent.width
                x: window.wide && window.gallery.mirrored ? parent.width - 1 : 0
            }
        }
    }
}

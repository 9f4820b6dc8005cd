pragma ComponentBehavior: Bound

import QtQuick
import QtQuick.Templates as T
import Favrin.Sliders
import Favrin.Theme

/* The color spaces to choose from, below their title; the current one has a check mark. */
T.Menu {
    id: menu

    required property ColorSpaceSwitcher switcher

    readonly property real rowHeight: Math.max(40, Theme.bodyFont.pixelSize * 2)
    readonly property real sidePadding: 14
    readonly property real widestItem: {
        let widest = 0;
        for (let index = 0; index < count; ++index)
            widest = Math.max(widest, itemAt(index).implicitWidth);
        return widest;
    }

    readonly property TextMetrics heading: TextMetrics {
        font: Theme.subheadlineFont
        text: menu.title
    }

    title: switcher.menuTitle
    margins: 8
    topPadding: rowHeight
    modal: false
    focus: true
    implicitWidth: Math.max(190, widestItem, Math.ceil(heading.advanceWidth) + 2 * sidePadding)
    implicitHeight: rowHeight * (switcher.names.length + 1)
    onOpened: currentIndex = switcher.current

    contentItem: ListView {
        interactive: false
        model: menu.contentModel
        currentIndex: menu.currentIndex
        LayoutMirroring.enabled: Theme.isMirrored
        LayoutMirroring.childrenInherit: true
    }

    background: FieldBackground {
        color: Theme.systemBackground

        Rectangle {
            anchors.fill: parent
            radius: parent.cornerRadius
            color: "transparent"
            border.color: Theme.separator
        }

        Text {
            x: menu.sidePadding
            width: parent.width - 2 * menu.sidePadding
            height: menu.rowHeight
            verticalAlignment: Text.AlignVCenter
            horizontalAlignment: Theme.isMirrored ? Text.AlignRight : Text.AlignLeft
            text: menu.title
            textFormat: Text.PlainText
            elide: Text.ElideRight
            font: Theme.subheadlineFont
            color: Theme.secondaryLabel
        }
    }

    Repeater {
        model: menu.switcher.names
        delegate: ColorSpaceMenuItem {
            required property int index
            required property string modelData

            text: modelData
            isCurrent: index === menu.switcher.current
            sidePadding: menu.sidePadding
            implicitHeight: menu.rowHeight
            onTriggered: menu.switcher.choose(index)
        }
    }
}

pragma ComponentBehavior: Bound

import QtQuick
import Favrin.Service
import Favrin.Shell
import Favrin.Theme

/* One segment for each tab. Arrows move between them: the whole picker is one tab stop. */
Item {
    id: picker

    required property ColorPickerState colorPickerState

    readonly property real cornerRadius: 9
    readonly property real gap: 2
    readonly property real segmentWidth: width / Math.max(segments.titles.length, 1)

    /* Where a segment starts: the first one at the leading edge. */
    function segmentX(index: int): real {
        return segmentWidth * (Theme.isMirrored ? segments.titles.length - 1 - index : index);
    }

    implicitHeight: 32
    activeFocusOnTab: true
    Accessible.role: Accessible.PageTabList
    Accessible.name: ShellStrings.colorPickerType
    Keys.onLeftPressed: segments.current += Theme.isMirrored ? 1 : -1
    Keys.onRightPressed: segments.current += Theme.isMirrored ? -1 : 1

    TabSegments {
        id: segments

        colorPickerState: picker.colorPickerState
    }

    Rectangle {
        anchors.fill: parent
        radius: picker.cornerRadius
        color: Theme.fill

        Rectangle {
            x: picker.segmentX(segments.current) + picker.gap
            y: picker.gap
            width: picker.segmentWidth - 2 * picker.gap
            height: parent.height - 2 * picker.gap
            radius: picker.cornerRadius - picker.gap
            color: Theme.systemBackground
        }

        FocusRing {
            parentRadius: picker.cornerRadius
            visible: picker.activeFocus
        }
    }

    Repeater {
        model: segments.titles

        MouseArea {
            id: segment

            required property int index
            required property string modelData

            readonly property bool checked: index === segments.current

            x: picker.segmentX(index)
            width: picker.segmentWidth
            height: picker.height
            containmentMask: TouchMask { face: segment }
            Accessible.role: Accessible.PageTab
            Accessible.name: modelData
            Accessible.checkable: true
            Accessible.checked: checked
            Accessible.onPressAction: segments.current = index
            onClicked: segments.current = index

            Text {
                anchors.fill: parent
                text: segment.modelData
                textFormat: Text.PlainText
                elide: Text.ElideRight
                // A long word is made smaller before it is cut.
                fontSizeMode: Text.HorizontalFit
                minimumPixelSize: 11
                horizontalAlignment: Text.AlignHCenter
                verticalAlignment: Text.AlignVCenter
                font: Theme.subheadlineFont
                color: Theme.label
                opacity: segment.containsPress && !segment.checked ? 0.5 : 1
                Accessible.ignored: true
            }
        }
    }
}

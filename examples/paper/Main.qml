import QtQuick
import QtQuick.Window
import Favrin.ColorPicker

Window {
    id: window

    width: 820
    height: 680
    visible: true
    title: qsTr("Paper")
    color: "#e7e5df"

    Component.onCompleted: picker.embed(sidebar)

    FVColorPickerViewController {
        id: picker

        title: qsTr("Paper")
        selectedColor: sheet.paper
        // Volatile picks come while the user drags, the last one again as final: the moment for the undo stack.
        onPickerDidSelectColor: (color, colorspace, isVolatile) => {
            sheet.paper = color;
            if (!isVolatile)
                console.info("chosen:", color.red, color.green, color.blue, colorspace);
        }
        onStateChanged: {
            if (state === FVColorPickerViewController.Ready)
                console.info("The picker is on screen.");
        }
        onColorPickerViewServiceDidTerminateWithError: error => console.warn("The picker ended:", error)
    }

    Rectangle {
        id: sheet

        property fvColor paper

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; right: sidebar.left; margins: 40 }
        color: paper.valid ? paper.toQColor() : "white"

        TapHandler {
            onTapped: {
                if (!picker.presented)
                    picker.presentPopover(sheet);
            }
        }
    }

    Rectangle {
        id: sidebar

        anchors { top: parent.top; bottom: parent.bottom; right: parent.right }
        width: 360
        color: "white"
    }
}

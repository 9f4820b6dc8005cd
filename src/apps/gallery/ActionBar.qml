import QtQuick
import Favrin.Gallery

/* The three ways to color the selected part. */
Row {
    id: bar

    required property Poster poster
    property int presentation

    signal embedRequested
    signal popoverRequested(Item anchor)
    signal presentRequested

    spacing: Style.gap

    PushButton {
        checked: bar.presentation === PickerPresenter.Embedded
        objectName: "embedButton"
        text: qsTr("Inspector")

        onClicked: bar.embedRequested()
    }
    PushButton {
        id: fillButton

        objectName: "popoverButton"
        showsSwatch: true
        swatch: bar.poster.selectedColor
        text: qsTr("Fill")

        onClicked: bar.popoverRequested(fillButton)
    }
    PushButton {
        objectName: "presentButton"
        prominent: true
        text: qsTr("Color…")

        onClicked: bar.presentRequested()
    }
}

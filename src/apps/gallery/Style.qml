pragma Singleton

import QtQuick

/* The look of the app: colors by their meaning, text sizes, spacing. */
QtObject {
    property bool dark: false

    readonly property color desk: dark ? "#151518" : "#ece9e3"
    readonly property color panel: dark ? "#1e1e22" : "#faf8f5"
    readonly property color control: dark ? "#303036" : "#ffffff"
    readonly property color pressedControl: dark ? "#3c3c44" : "#e6e2da"
    readonly property color well: dark ? "#28282d" : "#e9e5de"
    readonly property color separator: dark ? "#1fffffff" : "#17000000"
    readonly property color text: dark ? "#f4f1ec" : "#1b1a1e"
    readonly property color secondaryText: dark ? "#a7a3ad" : "#66626b"
    readonly property color accent: dark ? "#93a8ff" : "#3451d1"
    readonly property color pressedAccent: dark ? "#7d93ec" : "#2a43b2"
    readonly property color accentText: dark ? "#10131f" : "#ffffff"
    readonly property color warning: dark ? "#ff8f80" : "#b3261e"

    readonly property string family: "Inter"
    readonly property string displayFamily: "Inter Display"
    readonly property int titleSize: 17
    readonly property int bodySize: 14
    readonly property int captionSize: 12

    readonly property int gap: 8
    readonly property int margin: 16
    readonly property int controlHeight: 40
    readonly property int controlRadius: 12
    readonly property int panelRadius: 18
}

import QtQuick
import Favrin.Favorites
import Favrin.Theme

/* The strip: its pages scroll sideways, one at a time. */
FavoriteColorPickerBridge {
    id: strip

    collectionView: cells

    onScrollRequested: (contentX, animated) => {
        scroller.cancelFlick();
        turning.stop();
        if (animated)
            scroller.turnTo(contentX);
        else
            scroller.contentX = contentX;
    }
    onDeleteCalloutRequested: (cell) => menu.openAt(cells, cell)

    // Clips a little beyond the page's edges, where the focus ring of the outer swatches is.
    Item {
        id: clipper

        anchors.fill: parent
        anchors.margins: -strip.edgeReach
        clip: true

        Flickable {
            id: scroller

            function turnTo(position: real) {
                turning.to = position;
                turning.restart();
            }

            anchors.fill: parent
            anchors.margins: strip.edgeReach
            contentWidth: strip.contentWidth
            contentHeight: height
            flickableDirection: Flickable.HorizontalFlick
            boundsBehavior: Flickable.DragAndOvershootBounds
            interactive: contentWidth > width
            pixelAligned: true

            onContentXChanged: strip.didScroll(contentX)
            onMovementStarted: {
                turning.stop();
                strip.movementStarted();
            }
            onFlickStarted: {
                const position = strip.restingPosition(horizontalVelocity);
                cancelFlick();
                turnTo(position);
            }
            // A drag that ended slowly, or a wheel that stopped.
            onMovementEnded: {
                const position = strip.restingPosition(0);
                if (!turning.running && position !== contentX)
                    turnTo(position);
            }

            NumberAnimation {
                id: turning

                target: scroller
                property: "contentX"
                duration: Theme.reduceMotion ? 0 : 320
                easing.type: Easing.OutCubic
            }

            FavoritesCollectionView {
                id: cells

                width: strip.contentWidth
                height: scroller.height

                onTransitionStarted: changing.restart()

                NumberAnimation on transitionProgress {
                    id: changing

                    running: false
                    from: 0
                    to: 1
                    duration: Theme.reduceMotion ? 0 : 300
                    easing.type: Easing.InOutQuad
                }

                TapHandler {
                    property bool wasLong: false

                    onPressedChanged: {
                        if (pressed)
                            wasLong = false;
                    }
                    onLongPressed: {
                        wasLong = true;
                        strip.showDeleteCallout(point.position);
                    }
                    onTapped: (eventPoint) => {
                        if (!wasLong)
                            strip.tap(eventPoint.position);
                    }
                }

                TapHandler {
                    acceptedButtons: Qt.RightButton
                    onTapped: (eventPoint) => strip.showDeleteCallout(eventPoint.position)
                }

                Item {
                    x: strip.focusFrame.x
                    y: strip.focusFrame.y
                    width: strip.focusFrame.width
                    height: strip.focusFrame.height
                    visible: strip.focusVisible

                    FocusRing {
                        parentRadius: parent.width / 2
                    }
                }
            }
        }
    }

    CalloutLoader {
        id: menu

        command: FavoritesStrings.deleteCommand
        isDestructive: true
        onTriggered: strip.performDelete()
        onClosed: strip.forceActiveFocus(Qt.PopupFocusReason)
    }
}

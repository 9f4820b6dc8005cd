#pragma once

#include "grid/colorswatchpickerview.h"
#include "service/colorpickerstate.h"

#include <QPointingDevice>
#include <QQuickWindow>
#include <QTest>

/** A grid of 360 × 300 points, 30 to a cell, at (20, 20) in a window that is shown and active. */
class GridWindow
{
public:
    GridWindow()
    {
        state.fallbackColor.set({0.0, 0.0, 0.0, 1.0, favrin::model::SomeColor::ColorSpace::sRGB});
        view = new favrin::grid::ColorSwatchPickerView(window.contentItem());
        view->setPosition({20.0, 20.0});
        view->setSize({360.0, 300.0});
        view->setColorPickerState(&state);
        window.resize(400, 340);
        window.show();
        window.requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(&window));
    }

    /** The middle of a cell in the window. */
    static QPoint middle(int row, int column) { return {20 + 30 * column + 15, 20 + 30 * row + 15}; }

    favrin::service::ColorPickerState state = favrin::service::ColorPickerState({});
    QQuickWindow window;
    favrin::grid::ColorSwatchPickerView *view;
};

/** The swatch as the rest of the tests name it. */
inline const favrin::model::SomeColor &swatch(int row, int column)
{
    return favrin::grid::defaultColorMatrix()[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
}

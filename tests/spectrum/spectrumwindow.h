#pragma once

#include "service/colorpickerstate.h"
#include "spectrum/spectrum.h"

#include <QQuickWindow>
#include <QTest>

/** A spectrum of 360 × 300 points at (20, 20) in a window that is shown and active. */
class SpectrumWindow
{
public:
    using SomeColor = favrin::model::SomeColor;

    explicit SpectrumWindow(SomeColor color = {0.2, 0.4, 0.6, 1.0, SomeColor::ColorSpace::sRGB})
    {
        state.fallbackColor.set(color);
        item = new favrin::spectrum::Spectrum(window.contentItem());
        item->setPosition(origin);
        item->setSize({360.0, 300.0});
        item->setColorPickerState(&state);
        window.resize(400, 340);
        window.show();
        window.requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(&window));
    }

    /** A point of the spectrum in the window. */
    static QPoint at(int x, int y) { return QPoint(x, y) + origin.toPoint(); }
    /** The point of the spectrum that the lens is centered on; none when there is no lens. */
    std::optional<QPointF> lensCenter() const
    {
        const auto &lens = item->lens();
        return lens.isVisible() ? std::optional(lens.position() + QPointF(16.5, 16.5)) : std::nullopt;
    }

    static constexpr QPointF origin = {20.0, 20.0};
    favrin::service::ColorPickerState state = favrin::service::ColorPickerState({});
    QQuickWindow window;
    favrin::spectrum::Spectrum *item;
};

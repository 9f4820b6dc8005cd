#include "service/displaycolor.h"
#include "sliders/slidertrack.h"
#include "theme/theme.h"

#include <QTest>

using namespace favrin;
using namespace favrin::sliders;
using model::SomeColor;
using service::DisplayColor;
using Space = SomeColor::ColorSpace;

namespace {

/** A track of 236 × 36 points with its picture. */
struct Track
{
    explicit Track(ColorComponent::Name component, std::optional<SomeColor> color)
    {
        state.selectedColor.set(color);
        track.setComponent(component);
        track.setColorPickerState(&state);
        track.setSize({236.0, 36.0});
    }

    QColor at(int x, int y = 18) { return track.render(1.0).pixelColor(x, y); }

    service::ColorPickerState state = service::ColorPickerState({});
    SliderTrack track;
};

bool isNear(const QColor &left, const QColor &right)
{
    return std::abs(left.red() - right.red()) < 3 && std::abs(left.green() - right.green()) < 3 &&
           std::abs(left.blue() - right.blue()) < 3 && std::abs(left.alpha() - right.alpha()) < 3;
}

const SomeColor blue(0.0, 97 / 255.0, 253 / 255.0, 0.3, Space::sRGB);

} // namespace

class SliderTrackTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        theme::Theme::instance().setLayoutDirection(Qt::LeftToRight);
        theme::Theme::instance().setColorScheme(service::ColorScheme::Light);
        DisplayColor::instance().setSurfaceColorSpace(Space::sRGB);
    }

    void runsFromLeadingToTrailing()
    {
        Track red(ColorComponent::Red, blue);
        QVERIFY(isNear(red.at(1), QColor(0, 97, 253)));
        QVERIFY(isNear(red.at(118), QColor(128, 97, 253)));
        QVERIFY(isNear(red.at(234), QColor(255, 97, 253)));
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        QVERIFY(isNear(red.at(234), QColor(0, 97, 253)));
        QVERIFY(isNear(red.at(1), QColor(255, 97, 253)));
    }

    void opacityLiesOverACheckerboard()
    {
        Track opacity(ColorComponent::Opacity, blue);
        const SomeColor square(0.851, 0.847, 0.855, 1.0, Space::displayP3);
        const auto over = [](double alpha, const QColor &below) {
            const auto mix = [alpha](int top, int bottom) {
                return int(std::lround(alpha * top + (1 - alpha) * bottom));
            };
            return QColor(mix(0, below.red()), mix(97, below.green()), mix(253, below.blue()));
        };
        const QColor even = DisplayColor::instance().color(square);
        // Rows 0 and 1, columns 2 and 3.
        QVERIFY(isNear(opacity.at(30, 6), over(30.5 / 236, even)));
        QVERIFY(isNear(opacity.at(42, 6), over(42.5 / 236, Qt::white)));
        QVERIFY(isNear(opacity.at(30, 18), over(30.5 / 236, Qt::white)));
        QVERIFY(isNear(opacity.at(42, 18), over(42.5 / 236, even)));
        theme::Theme::instance().setColorScheme(service::ColorScheme::Dark);
        QVERIFY(isNear(opacity.at(30, 6), over(30.5 / 236, even)));
        QVERIFY(isNear(opacity.at(42, 6), over(42.5 / 236, Qt::black)));
        theme::Theme::instance().setLayoutDirection(Qt::RightToLeft);
        QVERIFY(isNear(opacity.at(235 - 30, 6), over(30.5 / 236, even)));
    }

    void onlyOpacityHasAnOutline()
    {
        Track opacity(ColorComponent::Opacity, SomeColor(1.0, 1.0, 1.0, 1.0, Space::sRGB));
        const QColor edge = opacity.at(200, 0);
        QVERIFY(edge.red() < 240 && edge.red() > 215);
        QVERIFY(opacity.at(200, 1).red() > 245);
        Track red(ColorComponent::Red, SomeColor(1.0, 1.0, 1.0, 1.0, Space::sRGB));
        QCOMPARE(red.at(200, 0), red.at(200, 18));
    }

    void cornersAreCut()
    {
        Track red(ColorComponent::Red, blue);
        for (const QPoint corner : {QPoint(0, 0), QPoint(235, 0), QPoint(0, 35), QPoint(235, 35), QPoint(4, 4)})
            QCOMPARE(red.at(corner.x(), corner.y()).alpha(), 0);
        QCOMPARE(red.at(18, 0).alpha(), 255);
    }

    void blackWithoutAColor()
    {
        Track green(ColorComponent::Green, std::nullopt);
        green.state.fallbackColor.set(SomeColor(1.0, 1.0, 1.0, 1.0, Space::displayP3));
        QVERIFY(isNear(green.at(1), QColor(0, 0, 0)));
        QVERIFY(isNear(green.at(234), QColor(0, 255, 0)));
    }

    void spacesMeetTheSurface()
    {
        DisplayColor::instance().setSurfaceColorSpace(Space::displayP3);
        Track p3(ColorComponent::Red, SomeColor(0.0, 0.2, 0.4, 1.0, Space::displayP3));
        QVERIFY(isNear(p3.at(118), QColor(128, 51, 102)));
        Track sRGB(ColorComponent::Red, SomeColor(0.0, 0.2, 0.4, 1.0, Space::sRGB));
        QVERIFY(
            isNear(sRGB.at(118), DisplayColor::instance().color(SomeColor(118.5 / 236, 0.2, 0.4, 1.0, Space::sRGB))));
    }
};

QTEST_MAIN(SliderTrackTest)
#include "tst_slidertrack.moc"

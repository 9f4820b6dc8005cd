#include "lens/colorlens.h"
#include "service/displaycolor.h"
#include "theme/theme.h"

#include <QTest>

#include <algorithm>
#include <vector>

using namespace favrin;
using lens::ColorLens;
using model::SomeColor;
using Space = SomeColor::ColorSpace;

namespace {

/** What a lens looks like depends on these, and on nothing else. */
struct Look
{
    double extent = 36.0;
    double ratio = 1.0;
    SomeColor color = {1.0, 0.0, 0.0, 1.0, Space::sRGB};
    service::ColorScheme scheme = service::ColorScheme::Light;
    Space surface = Space::sRGB;
};

QImage picture(const Look &look)
{
    theme::Theme::instance().setColorScheme(look.scheme);
    service::DisplayColor::instance().setSurfaceColorSpace(look.surface);
    ColorLens lens;
    lens.setSize({look.extent, look.extent});
    lens.setColor(look.color);
    return lens.render(look.ratio);
}

std::vector<Look> looks()
{
    std::vector<Look> list(8);
    list[1].extent = 33.0;
    list[2].ratio = 2.0;
    list[3].color = {0.0, 0.0, 1.0, 1.0, Space::sRGB};
    list[4].color = {1.0, 0.0, 0.0, 0.5, Space::sRGB};
    list[5].scheme = service::ColorScheme::Dark;
    list[6].surface = Space::displayP3;
    list[7].color = {1.0, 0.0, 0.0, 1.0, Space::displayP3};
    return list;
}

} // namespace

class ColorLensTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        theme::Theme::instance().setColorScheme(service::ColorScheme::Light);
        service::DisplayColor::instance().setSurfaceColorSpace(Space::sRGB);
    }

    void looksTheSameAfterAnyOther()
    {
        const auto list = looks();
        std::vector<QImage> first;
        for (const Look &look : list)
            first.push_back(picture(look));
        for (std::size_t before = 0; before < list.size(); ++before) {
            for (std::size_t after = 0; after < list.size(); ++after) {
                picture(list[before]);
                QCOMPARE(picture(list[after]), first[after]);
                // Colors beyond sRGB look like the clipped ones there.
                const bool mayLookAlike = std::min(before, after) == 0 && std::max(before, after) == 7;
                QVERIFY(before == after || mayLookAlike || first[before] != first[after]);
            }
        }
    }

    void discRingAndShadow()
    {
        const QImage lens = picture({.color = {0.0, 0.0, 1.0, 0.5, Space::sRGB}});
        const int center = lens.width() / 2;
        // Half of blue over the white ring, as everywhere within it.
        QCOMPARE(lens.pixelColor(center, center), QColor(127, 127, 255));
        QCOMPARE(lens.pixelColor(center, 4), QColor(Qt::white));
        const QColor shadow = lens.pixelColor(center, 1);
        QVERIFY(shadow.alpha() > 0 && shadow.alpha() < 128 && shadow.value() == 0);
    }
};

QTEST_MAIN(ColorLensTest)
#include "tst_colorlens.moc"

#include "favoriteswindow.h"

#include "favorites/addcolorcell.h"
#include "favorites/favoritecolorwellcell.h"
#include "favorites/removecolorcell.h"
#include "service/displaycolor.h"

using namespace favrin;

namespace {

constexpr int side = 30;

/** A picture of a cell, asked by points from its top left corner. */
class Picture
{
public:
    Picture(favorites::FavoriteCell &cell, double scale, QSizeF size = QSizeF(side, side)) : m_scale(scale)
    {
        cell.setSize(size);
        m_image = cell.render(scale);
    }

    QColor at(double x, double y) const
    {
        return m_image.pixelColor(static_cast<int>(x * m_scale), static_cast<int>(y * m_scale));
    }
    const QImage &image() const { return m_image; }

private:
    double m_scale;
    QImage m_image;
};

bool isAbout(const QColor &one, const QColor &other)
{
    return std::abs(one.red() - other.red()) <= 1 && std::abs(one.green() - other.green()) <= 1 &&
           std::abs(one.blue() - other.blue()) <= 1 && std::abs(one.alpha() - other.alpha()) <= 1;
}

platform::Color sRGB(double r, double g, double b, double a)
{
    return SomeColor(r, g, b, a, SomeColor::ColorSpace::sRGB).platformColor();
}

} // namespace

/** What the cells look like, at every scale. */
class FavoriteCellsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup() { service::DisplayColor::instance().setSurfaceColorSpace(SomeColor::ColorSpace::sRGB); }

    void atEveryScale_data()
    {
        QTest::addColumn<double>("scale");
        for (const double scale : {1.0, 2.0, 3.0})
            QTest::addRow("%gx", scale) << scale;
    }

    void ringsOfASelectedSwatch_data() { atEveryScale_data(); }

    void ringsOfASelectedSwatch()
    {
        QFETCH(double, scale);
        favorites::FavoriteColorWellCell cell;
        cell.setColor(sRGB(0.2, 0.4, 0.6, 1.0));
        const QColor color(51, 102, 153);
        const Picture plain(cell, scale);
        for (const double x : {1.5, 4.5, 15.0, 28.5})
            QVERIFY(isAbout(plain.at(x, 15.0), color));
        QCOMPARE(plain.at(1.0, 1.0).alpha(), 0);
        cell.setSelected(true);
        const Picture selected(cell, scale);
        for (const double edge : {1.5, 28.5})
            QVERIFY(isAbout(selected.at(edge, 15.0), color) && isAbout(selected.at(15.0, edge), color));
        for (const double gap : {4.5, 25.5})
            QVERIFY(selected.at(gap, 15.0).alpha() == 0 && selected.at(15.0, gap).alpha() == 0);
        for (const double inner : {7.5, 15.0, 22.5})
            QVERIFY(isAbout(selected.at(inner, 15.0), color));
    }

    void translucentColorsLieOverTwoHalves_data() { atEveryScale_data(); }

    void translucentColorsLieOverTwoHalves()
    {
        QFETCH(double, scale);
        favorites::FavoriteColorWellCell cell;
        cell.setColor(sRGB(0.0, 0.0, 1.0, 0.5));
        const Picture half(cell, scale);
        QVERIFY(isAbout(half.at(10.0, 10.0), QColor(0, 0, 128)));
        QVERIFY(isAbout(half.at(20.0, 20.0), QColor(127, 127, 255)));
        // The halves meet on the line from the lower left to the upper right.
        QVERIFY(half.at(6.0, 21.0).red() < 20 && half.at(10.0, 23.0).red() > 100);
        cell.setColor(sRGB(0.0, 0.0, 1.0, 1.0));
        QVERIFY(isAbout(Picture(cell, scale).at(20.0, 20.0), QColor(0, 0, 255)));
    }

    void slashOfTheRemoveCell_data() { atEveryScale_data(); }

    void slashOfTheRemoveCell()
    {
        QFETCH(double, scale);
        QCOMPARE(favorites::slashLength(30.0, false), 22.0);
        QCOMPARE(favorites::slashLength(30.0, true), 12.0);
        const QColor red = theme::Theme::instance().systemRed();
        const QColor gray = theme::Theme::instance().systemGray5();
        favorites::RemoveColorCell cell;
        const auto along = [](const Picture &picture, double distance) {
            const double step = distance / std::sqrt(2.0);
            return picture.at(15.0 + step, 15.0 - step);
        };
        for (const bool selected : {false, true}) {
            cell.setSelected(selected);
            const Picture picture(cell, scale);
            const double end = favorites::slashLength(30.0, selected) / 2.0;
            for (const double distance : {-end + 2.0, 0.0, end - 2.0})
                QVERIFY(isAbout(along(picture, distance), red));
            QVERIFY(isAbout(along(picture, end + 1.5), gray) && isAbout(along(picture, -end - 1.5), gray));
            QVERIFY(isAbout(picture.at(12.0, 12.0), gray));
        }
    }

    void addCellIsADiscAtItsTopLeft()
    {
        favorites::AddColorCell cell;
        const Picture picture(cell, 2.0, QSizeF(50.0, 30.0));
        QVERIFY(isAbout(picture.at(3.0, 15.0), QColor(217, 217, 217)));
        QCOMPARE(picture.at(31.0, 15.0).alpha(), 0);
        QCOMPARE(picture.at(45.0, 15.0).alpha(), 0);
    }

    void plusIsSharp_data() { atEveryScale_data(); }

    void plusIsSharp()
    {
        QFETCH(double, scale);
        favorites::AddColorCell cell;
        const Picture picture(cell, scale);
        QVERIFY(isAbout(picture.at(15.0, 15.0), QColor(74, 74, 74)));
        QVERIFY(isAbout(picture.at(5.0, 15.0), QColor(217, 217, 217)));
        // Across a stroke: the one gray, the other, nothing between; and the same from the left as from the right.
        const QImage &image = picture.image();
        const int row = static_cast<int>(11.0 * scale);
        for (int x = static_cast<int>(8.0 * scale); x < image.width() / 2; ++x) {
            const QColor pixel = image.pixelColor(x, row);
            QVERIFY(isAbout(pixel, QColor(74, 74, 74)) || isAbout(pixel, QColor(217, 217, 217)));
            QCOMPARE(image.pixel(image.width() - 1 - x, row), image.pixel(x, row));
        }
    }

    void colorsAreThoseOfTheSurface()
    {
        favorites::FavoriteColorWellCell cell;
        cell.setColor(SomeColor(1.0, 0.0, 0.0, 1.0, SomeColor::ColorSpace::displayP3).platformColor());
        QVERIFY(isAbout(Picture(cell, 1.0).at(15.0, 15.0), QColor(255, 0, 0)));
        service::DisplayColor::instance().setSurfaceColorSpace(SomeColor::ColorSpace::displayP3);
        cell.setColor(sRGB(1.0, 0.0, 0.0, 1.0));
        QVERIFY(isAbout(Picture(cell, 1.0).at(15.0, 15.0), QColor(234, 51, 35)));
    }
};

QTEST_MAIN(FavoriteCellsTest)
#include "tst_favoritecells.moc"

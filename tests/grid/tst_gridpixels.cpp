#include "gridwindow.h"

#include "service/displaycolor.h"
#include "theme/theme.h"

#include <cmath>

using namespace favrin;

namespace {

QRgb drawn(int row, int column)
{
    const model::SomeColor &color = swatch(row, column);
    return QColor::fromRgbF(static_cast<float>(color.r), static_cast<float>(color.g), static_cast<float>(color.b))
        .rgb();
}

} // namespace

/** What is on screen, at the scale factor of this process. */
class GridPixelsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyPixelIsAPureSwatch_data()
    {
        QTest::addColumn<QPointF>("position");
        QTest::addColumn<QSizeF>("size");
        QTest::newRow("whole points") << QPointF(20, 20) << QSizeF(360, 300);
        QTest::newRow("the picker's own size") << QPointF(16, 55) << QSizeF(328, 328 / 1.2);
        QTest::newRow("between pixels") << QPointF(16.3, 20.7) << QSizeF(331.4, 276.2);
    }

    void everyPixelIsAPureSwatch()
    {
        QFETCH(QPointF, position);
        QFETCH(QSizeF, size);
        GridWindow grid;
        grid.view->setPosition(position);
        grid.view->setSize(size);
        const QImage image = grid.window.grabWindow();
        const double ratio = grid.window.effectiveDevicePixelRatio();
        const QPoint origin = (position * ratio).toPoint();

        // Every pixel away from the rounded corners: no seam between cells, no mixed or missing line at the edges.
        const int corner = static_cast<int>(std::ceil(14.0 * ratio));
        const QSize pixels = grid.view->pixelSize(ratio);
        for (int y = 0; y < pixels.height(); ++y) {
            const bool nearEdge = y < corner || y >= pixels.height() - corner;
            for (int x = nearEdge ? corner : 0; x < (nearEdge ? pixels.width() - corner : pixels.width()); ++x) {
                const auto cell = grid::cellAt({x + 0.5, y + 0.5}, pixels);
                const QRgb actual = image.pixel(origin + QPoint(x, y));
                if (actual != drawn(cell->row, cell->column))
                    QFAIL(qPrintable(QStringLiteral("pixel %1,%2 is #%3").arg(x).arg(y).arg(actual, 8, 16)));
            }
        }
        QCOMPARE(image.pixel(origin), image.pixel(0, 0));
        QCOMPARE(image.pixel(origin + QPoint(pixels.width() / 2, -1)), image.pixel(0, 0));
        QCOMPARE(image.pixel(origin + QPoint(pixels.width() / 2, pixels.height())), image.pixel(0, 0));
    }

    void markerFramesItsCell_data()
    {
        QTest::addColumn<int>("row");
        QTest::addColumn<int>("column");
        QTest::newRow("inside") << 5 << 5;
        QTest::newRow("top left corner") << 0 << 0;
        QTest::newRow("bottom right corner") << 9 << 11;
    }

    void markerFramesItsCell()
    {
        QFETCH(int, row);
        QFETCH(int, column);
        GridWindow grid;
        grid.view->setSize({328, 328 / 1.2});
        grid.window.setColor(Qt::gray);
        grid.state.selectedColor.set(swatch(row, column));
        const QImage image = grid.window.grabWindow();
        const double ratio = grid.window.effectiveDevicePixelRatio();
        const QPoint origin = (QPointF(20, 20) * ratio).toPoint();
        const QRect cell = grid::cellPixels({row, column}, grid.view->pixelSize(ratio)).translated(origin);
        const QRgb frame = theme::Theme::instance().systemBackground().rgb();

        // The innermost pixels of the line on both sides of all four edges.
        const QPoint middle = cell.center();
        for (const int x : {cell.x() - 1, cell.x(), cell.x() + cell.width() - 1, cell.x() + cell.width()})
            QCOMPARE(image.pixel(x, middle.y()), frame);
        for (const int y : {cell.y() - 1, cell.y(), cell.y() + cell.height() - 1, cell.y() + cell.height()})
            QCOMPARE(image.pixel(middle.x(), y), frame);
        QCOMPARE(image.pixel(middle), drawn(row, column));
    }

    void colorsFollowTheSurface()
    {
        GridWindow grid;
        auto &display = service::DisplayColor::instance();
        display.setSurfaceColorSpace(model::SomeColor::ColorSpace::displayP3);
        const QImage image = grid.window.grabWindow();
        const QRgb expected = display.color(swatch(5, 5)).rgb();
        display.setSurfaceColorSpace(model::SomeColor::ColorSpace::sRGB);
        const QPoint pixel = (QPointF(GridWindow::middle(5, 5)) * grid.window.effectiveDevicePixelRatio()).toPoint();
        QCOMPARE(image.pixel(pixel), expected);
        QVERIFY(expected != drawn(5, 5));
        QCOMPARE(grid.window.grabWindow().pixel(pixel), drawn(5, 5));
    }
};

QTEST_MAIN(GridPixelsTest)
#include "tst_gridpixels.moc"

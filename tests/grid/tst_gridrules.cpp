#include "../shared/table.h"
#include "grid/gridkeys.h"
#include "grid/gridrules.h"
#include "grid/roundedrectshape.h"

#include <QTest>

#include <cmath>
#include <limits>

using namespace favrin::grid;
using favrin::model::SomeColor;

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();
constexpr double infinity = std::numeric_limits<double>::infinity();

/** "row,column", or "none". */
QString text(std::optional<CellPosition> cell)
{
    return cell ? QStringLiteral("%1,%2").arg(cell->row).arg(cell->column) : QStringLiteral("none");
}

const SomeColor &swatch(int row, int column)
{
    return defaultColorMatrix()[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
}

} // namespace

class GridRulesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void locationNamesCell()
    {
        const auto cell = [](QPointF location, QSizeF size = {360.0, 300.0}) { return text(cellAt(location, size)); };
        QCOMPARE(cell({0, 0}), QStringLiteral("0,0"));
        // Just before the second column, and exactly there.
        QCOMPARE(cell({29.999, 0}), QStringLiteral("0,0"));
        QCOMPARE(cell({30, 0}), QStringLiteral("0,1"));
        QCOMPARE(cell({0, 30}), QStringLiteral("1,0"));
        QCOMPARE(cell({360, 300}), QStringLiteral("9,11"));
        QCOMPARE(cell({326.9, 272.9}, {327.0, 273.0}), QStringLiteral("9,11"));
        // Outside, the nearest.
        QCOMPARE(cell({-0.001, -0.001}), QStringLiteral("0,0"));
        QCOMPARE(cell({-1e300, 1e300}), QStringLiteral("9,0"));
        QCOMPARE(cell({100, 1000}), QStringLiteral("9,3"));
        QCOMPARE(cell({10, 10}, {0.0, 300.0}), QStringLiteral("none"));
        QCOMPARE(cell({0, 0}, {360.0, 0.0}), QStringLiteral("none"));
        QCOMPARE(cell({notANumber, 10}), QStringLiteral("none"));
        QCOMPARE(cell({10, infinity}), QStringLiteral("none"));
    }

    void cornerCellsAreMasked()
    {
        QCOMPARE(maskedCorner({0, 0}), RectCorners(RectCorner::topLeft));
        QCOMPARE(maskedCorner({0, 11}), RectCorners(RectCorner::topRight));
        QCOMPARE(maskedCorner({9, 0}), RectCorners(RectCorner::bottomLeft));
        QCOMPARE(maskedCorner({9, 11}), RectCorners(RectCorner::bottomRight));
        QCOMPARE(maskedCorner({0, 5}), RectCorners());
        QCOMPARE(maskedCorner({4, 5}), RectCorners());
    }

    void keysMoveTheSelection()
    {
        const auto moved = [](std::optional<CellPosition> marked, Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
            return text(cellForKey(key, modifiers, marked, {2, 3}));
        };
        const CellPosition inside = {4, 5};
        QCOMPARE(moved(inside, Qt::Key_Right), QStringLiteral("4,6"));
        QCOMPARE(moved(inside, Qt::Key_Left), QStringLiteral("4,4"));
        QCOMPARE(moved(inside, Qt::Key_Up), QStringLiteral("3,5"));
        QCOMPARE(moved(inside, Qt::Key_Down), QStringLiteral("5,5"));
        QCOMPARE(moved(inside, Qt::Key_Down, Qt::KeypadModifier), QStringLiteral("5,5"));
        QCOMPARE(moved(CellPosition{4, 11}, Qt::Key_Right), QStringLiteral("4,11"));
        QCOMPARE(moved(CellPosition{0, 5}, Qt::Key_Up), QStringLiteral("0,5"));
        QCOMPARE(moved(inside, Qt::Key_Home), QStringLiteral("4,0"));
        QCOMPARE(moved(inside, Qt::Key_End), QStringLiteral("4,11"));
        QCOMPARE(moved(inside, Qt::Key_Home, Qt::ControlModifier), QStringLiteral("0,0"));
        QCOMPARE(moved(inside, Qt::Key_End, Qt::ControlModifier), QStringLiteral("9,11"));
        QCOMPARE(moved(inside, Qt::Key_PageUp), QStringLiteral("0,5"));
        QCOMPARE(moved(inside, Qt::Key_PageDown), QStringLiteral("9,5"));
        // The first arrow without a mark goes to the start.
        QCOMPARE(moved({}, Qt::Key_Right), QStringLiteral("2,3"));
        QCOMPARE(moved({}, Qt::Key_End), QStringLiteral("2,11"));
        // What is not the grid's.
        QCOMPARE(moved(inside, Qt::Key_Right, Qt::ControlModifier), QStringLiteral("none"));
        QCOMPARE(moved(inside, Qt::Key_PageUp, Qt::ControlModifier), QStringLiteral("none"));
        QCOMPARE(moved(inside, Qt::Key_Left, Qt::AltModifier), QStringLiteral("none"));
        QCOMPARE(moved(inside, Qt::Key_A), QStringLiteral("none"));
    }

    void markIgnoresOpacityAndSelectionDoesNot()
    {
        const auto seen = [](double offset, double opacity) {
            SomeColor color = swatch(5, 5);
            color.g += offset;
            color.a = opacity;
            return std::pair(text(markedCell(color, defaultColorMatrix())), isSelected(color, swatch(5, 5)));
        };
        QCOMPARE(seen(0.0, 1.0), std::pair(QStringLiteral("5,5"), true));
        QCOMPARE(seen(0.0009, 1.0), std::pair(QStringLiteral("5,5"), true));
        QCOMPARE(seen(0.0011, 1.0), std::pair(QStringLiteral("none"), false));
        QCOMPARE(seen(0.0, 0.5), std::pair(QStringLiteral("5,5"), false));
        // The same color in the wide space.
        QCOMPARE(text(markedCell(swatch(5, 5).inDisplayP3(), defaultColorMatrix())), QStringLiteral("5,5"));
        QVERIFY(isSelected(swatch(5, 5).inDisplayP3(), swatch(5, 5)));
        QCOMPARE(text(markedCell(std::nullopt, defaultColorMatrix())), QStringLiteral("none"));
        QVERIFY(!isSelected(std::nullopt, swatch(5, 5)));
    }

    void firstOfEqualSwatchesIsMarked()
    {
        ColorMatrix palette = defaultColorMatrix();
        palette[6][2] = palette[8][1];
        palette[6][7] = palette[8][1];
        QCOMPARE(text(markedCell(palette[8][1], palette)), QStringLiteral("6,2"));
    }

    void markerOutlineHasTwoRadii_data()
    {
        addRows<RectCorners>({{"none", {}},
                              {"top left", RectCorner::topLeft},
                              {"bottom right", RectCorner::bottomRight},
                              {"two", RectCorner::topRight | RectCorner::bottomLeft}});
    }

    void markerOutlineHasTwoRadii()
    {
        const auto [masked] = row<RectCorners>();
        const QRectF rect(10, 20, 30, 24);
        const QPainterPath path = RoundedRectShape{1.0, 8.0, masked}.path(rect);
        QCOMPARE(path.boundingRect(), rect);
        const std::pair<RectCorner, QPointF> corners[] = {
            {RectCorner::topLeft, rect.topLeft()},
            {RectCorner::topRight, rect.topRight()},
            {RectCorner::bottomLeft, rect.bottomLeft()},
            {RectCorner::bottomRight, rect.bottomRight()},
        };
        for (const auto &[corner, point] : corners) {
            // On the diagonal a circular corner lies radius * (1 - 1/sqrt 2) away from both edges.
            const double depth = (masked.testFlag(corner) ? 8.0 : 1.0) * (1.0 - std::sqrt(0.5));
            const QPointF inward((rect.center().x() - point.x()) / 15.0, (rect.center().y() - point.y()) / 12.0);
            QVERIFY(path.contains(point + inward * (depth + 0.05)));
            QVERIFY(!path.contains(point + inward * (depth - 0.05)));
        }
    }
};

QTEST_APPLESS_MAIN(GridRulesTest)
#include "tst_gridrules.moc"

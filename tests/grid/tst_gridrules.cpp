#include "grid/gridkeys.h"
#include "grid/gridrules.h"
#include "grid/roundedrectshape.h"

#include <QTest>

#include <cmath>
#include <limits>

using namespace favrin::grid;
using favrin::model::SomeColor;

Q_DECLARE_METATYPE(favrin::grid::RectCorners)
Q_DECLARE_METATYPE(Qt::Key)

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
    void locationNamesCell_data();
    void locationNamesCell();
    void cornerCellsAreMasked_data();
    void cornerCellsAreMasked();
    void keysMoveTheSelection_data();
    void keysMoveTheSelection();
    void markIgnoresOpacityAndSelectionDoesNot_data();
    void markIgnoresOpacityAndSelectionDoesNot();
    void firstOfEqualSwatchesIsMarked();
    void markerOutlineHasTwoRadii_data();
    void markerOutlineHasTwoRadii();
};

void GridRulesTest::locationNamesCell_data()
{
    QTest::addColumn<QPointF>("location");
    QTest::addColumn<QSizeF>("size");
    QTest::addColumn<QString>("cell");
    const QSizeF size(360.0, 300.0);
    QTest::newRow("origin") << QPointF(0, 0) << size << "0,0";
    QTest::newRow("just before the second column") << QPointF(29.999, 0) << size << "0,0";
    QTest::newRow("exactly the second column") << QPointF(30, 0) << size << "0,1";
    QTest::newRow("exactly the second row") << QPointF(0, 30) << size << "1,0";
    QTest::newRow("right and bottom edge") << QPointF(360, 300) << size << "9,11";
    QTest::newRow("a little left and above") << QPointF(-0.001, -0.001) << size << "0,0";
    QTest::newRow("far left, below") << QPointF(-1e300, 1e300) << size << "9,0";
    QTest::newRow("below keeps the column") << QPointF(100, 1000) << size << "9,3";
    QTest::newRow("odd size, last cell") << QPointF(326.9, 272.9) << QSizeF(327.0, 273.0) << "9,11";
    QTest::newRow("no width") << QPointF(10, 10) << QSizeF(0.0, 300.0) << "none";
    QTest::newRow("no height, at the origin") << QPointF(0, 0) << QSizeF(360.0, 0.0) << "none";
    QTest::newRow("not a number") << QPointF(notANumber, 10) << size << "none";
    QTest::newRow("infinite") << QPointF(10, infinity) << size << "none";
}

void GridRulesTest::locationNamesCell()
{
    QFETCH(QPointF, location);
    QFETCH(QSizeF, size);
    QTEST(text(cellAt(location, size)), "cell");
}

void GridRulesTest::cornerCellsAreMasked_data()
{
    QTest::addColumn<int>("row");
    QTest::addColumn<int>("column");
    QTest::addColumn<RectCorners>("corner");
    QTest::newRow("top left") << 0 << 0 << RectCorners(RectCorner::topLeft);
    QTest::newRow("top right") << 0 << 11 << RectCorners(RectCorner::topRight);
    QTest::newRow("bottom left") << 9 << 0 << RectCorners(RectCorner::bottomLeft);
    QTest::newRow("bottom right") << 9 << 11 << RectCorners(RectCorner::bottomRight);
    QTest::newRow("an edge is no corner") << 0 << 5 << RectCorners();
    QTest::newRow("inside") << 4 << 5 << RectCorners();
}

void GridRulesTest::cornerCellsAreMasked()
{
    QFETCH(int, row);
    QFETCH(int, column);
    QTEST(maskedCorner({row, column}), "corner");
}

void GridRulesTest::keysMoveTheSelection_data()
{
    QTest::addColumn<QString>("from");
    QTest::addColumn<Qt::Key>("key");
    QTest::addColumn<int>("modifiers");
    QTest::addColumn<QString>("to");
    const int plain = Qt::NoModifier;
    const int control = Qt::ControlModifier;
    QTest::newRow("right") << "4,5" << Qt::Key_Right << plain << "4,6";
    QTest::newRow("left") << "4,5" << Qt::Key_Left << plain << "4,4";
    QTest::newRow("up") << "4,5" << Qt::Key_Up << plain << "3,5";
    QTest::newRow("down") << "4,5" << Qt::Key_Down << plain << "5,5";
    QTest::newRow("right stays at the edge") << "4,11" << Qt::Key_Right << plain << "4,11";
    QTest::newRow("up stays at the edge") << "0,5" << Qt::Key_Up << plain << "0,5";
    QTest::newRow("home") << "4,5" << Qt::Key_Home << plain << "4,0";
    QTest::newRow("end") << "4,5" << Qt::Key_End << plain << "4,11";
    QTest::newRow("control home") << "4,5" << Qt::Key_Home << control << "0,0";
    QTest::newRow("control end") << "4,5" << Qt::Key_End << control << "9,11";
    QTest::newRow("page up") << "4,5" << Qt::Key_PageUp << plain << "0,5";
    QTest::newRow("page down") << "4,5" << Qt::Key_PageDown << plain << "9,5";
    QTest::newRow("keypad arrow") << "4,5" << Qt::Key_Down << int(Qt::KeypadModifier) << "5,5";
    QTest::newRow("first arrow without a mark") << "none" << Qt::Key_Right << plain << "2,3";
    QTest::newRow("end without a mark") << "none" << Qt::Key_End << plain << "2,11";
    QTest::newRow("control arrow is not the grid's") << "4,5" << Qt::Key_Right << control << "none";
    QTest::newRow("control page up is not the grid's") << "4,5" << Qt::Key_PageUp << control << "none";
    QTest::newRow("alt arrow is not the grid's") << "4,5" << Qt::Key_Left << int(Qt::AltModifier) << "none";
    QTest::newRow("a letter is not the grid's") << "4,5" << Qt::Key_A << plain << "none";
}

void GridRulesTest::keysMoveTheSelection()
{
    QFETCH(QString, from);
    QFETCH(Qt::Key, key);
    QFETCH(int, modifiers);
    const auto marked =
        from == u"none"
            ? std::nullopt
            : std::optional(CellPosition{from.section(u',', 0, 0).toInt(), from.section(u',', 1, 1).toInt()});
    const CellPosition start = {2, 3};
    QTEST(text(cellForKey(key, Qt::KeyboardModifiers(modifiers), marked, start)), "to");
}

void GridRulesTest::markIgnoresOpacityAndSelectionDoesNot_data()
{
    QTest::addColumn<double>("offset");
    QTest::addColumn<double>("opacity");
    QTest::addColumn<bool>("inDisplayP3");
    QTest::addColumn<QString>("marked");
    QTest::addColumn<bool>("selected");
    QTest::newRow("the swatch itself") << 0.0 << 1.0 << false << "5,5" << true;
    QTest::newRow("within the tolerance") << 0.0009 << 1.0 << false << "5,5" << true;
    QTest::newRow("beyond the tolerance") << 0.0011 << 1.0 << false << "none" << false;
    QTest::newRow("translucent") << 0.0 << 0.5 << false << "5,5" << false;
    QTest::newRow("the same color in the wide space") << 0.0 << 1.0 << true << "5,5" << true;
}

void GridRulesTest::markIgnoresOpacityAndSelectionDoesNot()
{
    QFETCH(double, offset);
    QFETCH(double, opacity);
    QFETCH(bool, inDisplayP3);
    SomeColor color = swatch(5, 5);
    color.g += offset;
    color.a = opacity;
    if (inDisplayP3)
        color = color.inDisplayP3();
    QTEST(text(markedCell(color, defaultColorMatrix())), "marked");
    QTEST(isSelected(color, swatch(5, 5)), "selected");
    QVERIFY(!isSelected(std::nullopt, swatch(5, 5)));
    QCOMPARE(text(markedCell(std::nullopt, defaultColorMatrix())), QStringLiteral("none"));
}

void GridRulesTest::firstOfEqualSwatchesIsMarked()
{
    ColorMatrix palette = defaultColorMatrix();
    palette[6][2] = palette[8][1];
    palette[6][7] = palette[8][1];
    QCOMPARE(text(markedCell(palette[8][1], palette)), QStringLiteral("6,2"));
}

void GridRulesTest::markerOutlineHasTwoRadii_data()
{
    QTest::addColumn<RectCorners>("masked");
    QTest::newRow("none") << RectCorners();
    QTest::newRow("top left") << RectCorners(RectCorner::topLeft);
    QTest::newRow("bottom right") << RectCorners(RectCorner::bottomRight);
    QTest::newRow("two") << (RectCorner::topRight | RectCorner::bottomLeft);
}

void GridRulesTest::markerOutlineHasTwoRadii()
{
    QFETCH(RectCorners, masked);
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

QTEST_APPLESS_MAIN(GridRulesTest)
#include "tst_gridrules.moc"

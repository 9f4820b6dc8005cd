#include "platform/shapes/continuousroundedrect.h"
#include "platform/shapes/dropshadow.h"

#include "../../shared/table.h"

#include <QPainter>
#include <QTest>

#include <cmath>

using namespace favrin::platform;

class ShapesTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cornersAreSmooth_data()
    {
        // Of each edge, per corner; of the shape's radius.
        addRows<QSizeF, double, double, double>({
            {"room for the smoothing", {300, 200}, 8.0, 12.8, 8.0},
            {"room for a part of it", {300, 20}, 8.0, 10.0, 8.0},
            {"too small for the radius", {12, 12}, 8.0, 6.0, 6.0},
        });
    }
    void cornersAreSmooth()
    {
        const auto [size, radius, extent, usedRadius] = row<QSizeF, double, double, double>();
        const QRectF rect(QPointF(5, 7), size);
        const QPainterPath path = continuousRoundedRect(rect, radius);
        QVERIFY(std::abs(path.boundingRect().width() - rect.width()) < 1e-9);
        QVERIFY(std::abs(path.boundingRect().height() - rect.height()) < 1e-9);
        QCOMPARE(path.elementAt(0).x, rect.left() + extent);

        // On the diagonal of each corner it lies where the circle does, or a hair outside of it.
        const double depth = usedRadius * (1.0 - std::sqrt(0.5));
        for (const QPointF &corner : {rect.topLeft(), rect.topRight(), rect.bottomLeft(), rect.bottomRight()}) {
            const QPointF inward(corner.x() < rect.center().x() ? 1.0 : -1.0,
                                 corner.y() < rect.center().y() ? 1.0 : -1.0);
            QVERIFY(path.contains(corner + inward * (depth + 0.02)));
            QVERIFY(!path.contains(corner + inward * (depth - 0.12 * usedRadius)));
        }

        // No kink anywhere: the direction turns by small steps.
        double last = path.angleAtPercent(0.0);
        for (int step = 1; step <= 2000; ++step) {
            const double angle = path.angleAtPercent(step / 2000.0);
            const double turn = std::abs(std::remainder(angle - last, 360.0));
            QVERIFY2(turn < 8.0, qPrintable(QString::number(turn)));
            last = angle;
        }
    }

    void shadowKeepsItsWeightAndPlace()
    {
        QImage shape(41, 41, QImage::Format_ARGB32_Premultiplied);
        shape.fill(Qt::transparent);
        QPainter(&shape).fillRect(16, 16, 9, 9, Qt::white);
        const QImage shadow = dropShadow(shape, 8.0, QColor(0, 0, 0, 255));
        double weight = 0.0;
        for (int y = 0; y < 41; ++y) {
            for (int x = 0; x < 41; ++x) {
                weight += qAlpha(shadow.pixel(x, y)) / 255.0;
                QCOMPARE(qAlpha(shadow.pixel(x, y)), qAlpha(shadow.pixel(40 - x, y)));
                QCOMPARE(qAlpha(shadow.pixel(x, y)), qAlpha(shadow.pixel(y, x)));
            }
        }
        QVERIFY(std::abs(weight - 81.0) < 2.0);
        QVERIFY(qAlpha(shadow.pixel(20, 20)) < 200);
        QCOMPARE(qAlpha(shadow.pixel(0, 0)), 0);
    }
};

QTEST_APPLESS_MAIN(ShapesTest)
#include "tst_shapes.moc"

#include "apps/eyedropper/picker/loupepainter.h"

#include "model/colordescription.h"
#include "model/hexcolor.h"

#include <QFontMetrics>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>

namespace favrin::eyedropper {

namespace {

/** Points. */
constexpr double hexSize = 17;
constexpr double nameSize = 13;
constexpr double labelPadding = 12;
constexpr double labelLift = 7;

/** Both edges of everything that lies over the screen: one of them stands out, whatever is below. */
const QColor lightEdge(255, 255, 255);
const QColor darkEdge(0, 0, 0, 150);
const QColor labelGround(28, 28, 30, 240);
const QColor labelText(255, 255, 255);
const QColor labelSecondText(235, 235, 245, 190);
const QColor outsideScreen(58, 58, 60);

QFont fontOf(double points, double scale, QFont::Weight weight)
{
    QFont font;
    font.setFamilies({QStringLiteral("Inter"), font.family()});
    font.setPixelSize(std::max(1, qRound(points * scale)));
    font.setWeight(weight);
    return font;
}

QPointF middle(const QRect &rect)
{
    return QRectF(rect).center();
}

} // namespace

LoupeText LoupeText::of(const platform::Color &color)
{
    return {.hex = u'#' + QString::fromStdString(model::hexString(model::SomeColor(color))),
            .name = QString::fromStdString(model::colorDescription(color))};
}

LoupePainter::LoupePainter(double scale)
    : m_metrics(scale)
    , m_hexFont(fontOf(hexSize, scale, QFont::DemiBold))
    , m_nameFont(fontOf(nameSize, scale, QFont::Normal))
{
}

QSize LoupePainter::labelSize(const LoupeText &text) const
{
    const QFontMetrics hex(m_hexFont);
    const QFontMetrics name(m_nameFont);
    // As wide as the widest code: the label does not tremble while the loupe moves over similar colors.
    const int hexWidth = std::max(hex.horizontalAdvance(QStringLiteral("#CCCCCC")), hex.horizontalAdvance(text.hex));
    const int width = std::max(hexWidth, name.horizontalAdvance(text.name));
    return {width + 2 * qRound(labelPadding * m_metrics.scale),
            hex.height() + name.height() + 2 * qRound(labelLift * m_metrics.scale)};
}

void LoupePainter::paint(QPainter &painter, const LoupeGeometry &geometry, const QImage &picture, QPoint crosshair,
                         const LoupeText &text) const
{
    painter.setRenderHint(QPainter::Antialiasing);
    paintShadow(painter, geometry);
    paintRing(painter, geometry, picture.pixelColor(crosshair));
    paintLens(painter, geometry, picture, crosshair);
    paintCrosshair(painter, geometry);
    if (!geometry.discContains(crosshair))
        paintMark(painter, crosshair);
    paintLabel(painter, geometry.label, text);
}

void LoupePainter::paintShadow(QPainter &painter, const LoupeGeometry &geometry) const
{
    const double radius = geometry.disc.width() / 2.0;
    const double reach = radius + m_metrics.shadow;
    const double edge = (radius - 2 * m_metrics.scale) / reach;
    QRadialGradient shadow(middle(geometry.disc) + QPointF(0, 2 * m_metrics.scale), reach);
    // Falls off by the square, so that no outer edge is seen.
    constexpr int steps = 8;
    for (int step = 0; step <= steps; ++step) {
        const double way = double(step) / steps;
        shadow.setColorAt(edge + (1 - edge) * way, QColor(0, 0, 0, qRound(90 * (1 - way) * (1 - way))));
    }
    painter.setPen(Qt::NoPen);
    painter.setBrush(shadow);
    painter.drawEllipse(middle(geometry.disc), reach, reach);
}

void LoupePainter::paintRing(QPainter &painter, const LoupeGeometry &geometry, const QColor &color) const
{
    const QPointF center = middle(geometry.disc);
    const double line = m_metrics.scale;
    double radius = geometry.disc.width() / 2.0;
    painter.setPen(Qt::NoPen);
    painter.setBrush(darkEdge);
    painter.drawEllipse(center, radius, radius);
    radius -= line;
    painter.setBrush(lightEdge);
    painter.drawEllipse(center, radius, radius);
    radius -= 2 * line;
    painter.setBrush(color);
    painter.drawEllipse(center, radius, radius);
}

void LoupePainter::paintLens(QPainter &painter, const LoupeGeometry &geometry, const QImage &picture,
                             QPoint crosshair) const
{
    constexpr int across = LoupeMetrics::cellsAcross;
    QImage pixels(across, across, QImage::Format_RGB32);
    for (int y = 0; y < across; ++y) {
        for (int x = 0; x < across; ++x) {
            const QPoint pixel = crosshair + QPoint(x - across / 2, y - across / 2);
            pixels.setPixelColor(x, y, picture.valid(pixel) ? picture.pixelColor(pixel) : outsideScreen);
        }
    }
    // Whole cells, neighbor by neighbor: nothing is blended but the round edge.
    const QImage magnified = pixels.scaled(geometry.lens.size(), Qt::IgnoreAspectRatio, Qt::FastTransformation);
    QBrush brush(magnified);
    brush.setTransform(QTransform::fromTranslate(geometry.lens.x(), geometry.lens.y()));
    const double radius = geometry.lens.width() / 2.0;
    painter.setBrush(brush);
    painter.setPen(QPen(darkEdge, 3 * m_metrics.scale));
    painter.drawEllipse(middle(geometry.lens), radius, radius);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(lightEdge, m_metrics.scale));
    painter.drawEllipse(middle(geometry.lens), radius, radius);
}

void LoupePainter::paintCrosshair(QPainter &painter, const LoupeGeometry &geometry) const
{
    const int cell = m_metrics.cell;
    const int before = LoupeMetrics::cellsAcross / 2 * cell;
    const QRectF sampled(geometry.lens.topLeft() + QPoint(before, before), QSizeF(cell, cell));
    // Outside the cell, so that all of it keeps the color that is picked.
    const double line = std::max(1.0, std::round(m_metrics.scale));
    const auto frame = [&](double distance, double width, const QColor &color) {
        const double half = distance + width / 2;
        painter.setPen(QPen(color, width, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(sampled.adjusted(-half, -half, half, half));
    };
    frame(0, line, Qt::black);
    frame(line, 2 * line, Qt::white);
    frame(3 * line, line, Qt::black);
}

void LoupePainter::paintMark(QPainter &painter, QPoint crosshair) const
{
    const QPointF center = QPointF(crosshair) + QPointF(0.5, 0.5);
    const double radius = 6 * m_metrics.scale;
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(Qt::black, 4 * m_metrics.scale));
    painter.drawEllipse(center, radius, radius);
    painter.setPen(QPen(Qt::white, 2 * m_metrics.scale));
    painter.drawEllipse(center, radius, radius);
}

void LoupePainter::paintLabel(QPainter &painter, const QRect &label, const LoupeText &text) const
{
    const double line = m_metrics.scale;
    const QRectF frame = QRectF(label).adjusted(line / 2, line / 2, -line / 2, -line / 2);
    const double radius = 10 * m_metrics.scale;
    painter.setPen(QPen(QColor(255, 255, 255, 70), line));
    painter.setBrush(labelGround);
    painter.drawRoundedRect(frame, radius, radius);

    const int lift = qRound(labelLift * m_metrics.scale);
    const QRect lines = label.adjusted(0, lift, 0, -lift);
    painter.setPen(labelText);
    painter.setFont(m_hexFont);
    painter.drawText(lines, Qt::AlignHCenter | Qt::AlignTop, text.hex);
    painter.setPen(labelSecondText);
    painter.setFont(m_nameFont);
    painter.drawText(lines, Qt::AlignHCenter | Qt::AlignBottom, text.name);
}

} // namespace favrin::eyedropper

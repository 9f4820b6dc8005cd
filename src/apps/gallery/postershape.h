#pragma once

#include "apps/gallery/poster.h"
#include "platform/shapes/crisppainteditem.h"

#include <QPainterPath>

namespace favrin::gallery {

/** One part of the poster: the sheet's outline of it scaled to the item, which also says where it can be touched. */
class PosterShape : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT

    Q_PROPERTY(favrin::gallery::Poster::Part part READ part WRITE setPart NOTIFY partChanged REQUIRED)
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged REQUIRED)

public:
    explicit PosterShape(QQuickItem *parent = nullptr);

    Poster::Part part() const { return m_part; }
    void setPart(Poster::Part part);
    QColor color() const { return m_color; }
    void setColor(const QColor &color);

    bool contains(const QPointF &point) const override;

Q_SIGNALS:
    void partChanged();
    void colorChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    Poster::Part m_part = Poster::Part::Paper;
    QColor m_color;
    QPainterPath m_path;
};

} // namespace favrin::gallery

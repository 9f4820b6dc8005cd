#pragma once

#include "model/somecolor.h"
#include "platform/shapes/crisppainteditem.h"

namespace favrin::lens {

/**
 * A round disc of a color in a ring of the background's color, with a soft shadow: what marks a place on a field and
 * what is moved along a track. It fills the largest circle that fits, less a padding of 2 points for the shadow. A
 * translucent color shows the background through. It takes no input.
 */
class ColorLens : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(favrin::model::SomeColor color READ color WRITE setColor NOTIFY colorChanged FINAL)

public:
    explicit ColorLens(QQuickItem *parent = nullptr);

    const model::SomeColor &color() const { return m_color; }
    void setColor(const model::SomeColor &color);

Q_SIGNALS:
    void colorChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    model::SomeColor m_color = model::SomeColor(platform::Color::black());
};

} // namespace favrin::lens

#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QColor>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::sliders {

/** The face of a text field: one color in a rectangle with smoothed corners. */
class FieldBackground : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged FINAL)
    Q_PROPERTY(double cornerRadius READ cornerRadius CONSTANT FINAL)

public:
    explicit FieldBackground(QQuickItem *parent = nullptr);

    QColor color() const { return m_color; }
    void setColor(const QColor &color);
    /** Points. */
    double cornerRadius() const;

Q_SIGNALS:
    void colorChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    QColor m_color;
};

} // namespace favrin::sliders

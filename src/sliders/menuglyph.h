#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QColor>
#include <QPainterPath>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::sliders {

// The bases are named in full: so the description of the module finds them.

/** A small sign drawn with a round pen in one color, as large as the item. */
class MenuGlyph : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ANONYMOUS
    Q_PROPERTY(QColor color READ color WRITE setColor NOTIFY colorChanged FINAL)

public:
    explicit MenuGlyph(QQuickItem *parent = nullptr);

    QColor color() const { return m_color; }
    void setColor(const QColor &color);

Q_SIGNALS:
    void colorChanged();

protected:
    /** The strokes in a square from 0 to 1. */
    virtual QPainterPath strokes() const = 0;
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    QColor m_color;
};

/** Two chevrons, up and down: here a menu opens. */
class MenuIndicator : public favrin::sliders::MenuGlyph
{
    Q_OBJECT
    QML_ELEMENT

public:
    using MenuGlyph::MenuGlyph;

protected:
    QPainterPath strokes() const override;
};

/** Marks the current choice of a menu. */
class CheckMark : public favrin::sliders::MenuGlyph
{
    Q_OBJECT
    QML_ELEMENT

public:
    using MenuGlyph::MenuGlyph;

protected:
    QPainterPath strokes() const override;
};

} // namespace favrin::sliders

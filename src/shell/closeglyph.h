#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QColor>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::shell {

/** The face of the close button: a disc with a cross. */
class CloseGlyph : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(QColor discColor READ discColor WRITE setDiscColor NOTIFY discColorChanged FINAL)
    Q_PROPERTY(QColor crossColor READ crossColor WRITE setCrossColor NOTIFY crossColorChanged FINAL)

public:
    explicit CloseGlyph(QQuickItem *parent = nullptr);

    QColor discColor() const { return m_discColor; }
    void setDiscColor(const QColor &color);
    QColor crossColor() const { return m_crossColor; }
    void setCrossColor(const QColor &color);

Q_SIGNALS:
    void discColorChanged();
    void crossColorChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    QColor m_discColor;
    QColor m_crossColor;
};

} // namespace favrin::shell

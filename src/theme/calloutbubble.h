#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::theme {

/** The face of a menu that points at something below it: a rounded box with an arrow at its lower edge, and a shadow.
 */
class CalloutBubble : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT
    /** Where the arrow's tip lies; kept off the corners. */
    Q_PROPERTY(double arrowX READ arrowX WRITE setArrowX NOTIFY arrowXChanged FINAL)
    /** The height of the arrow, which is part of the item's. */
    Q_PROPERTY(double arrowHeight READ arrowHeight CONSTANT FINAL)

public:
    explicit CalloutBubble(QQuickItem *parent = nullptr);

    double arrowX() const { return m_arrowX; }
    void setArrowX(double x);
    double arrowHeight() const;

Q_SIGNALS:
    void arrowXChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    double m_arrowX = 0.0;
};

} // namespace favrin::theme

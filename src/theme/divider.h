#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::theme {

/** A line between rows, as thin as the display can show: one pixel at the top of the item. */
class Divider : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT

public:
    explicit Divider(QQuickItem *parent = nullptr);

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
};

} // namespace favrin::theme

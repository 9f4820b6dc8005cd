#pragma once

#include "platform/shapes/crisppainteditem.h"

#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::gallery {

/** The soft shadow of a sheet of paper that lies on the desk. */
class SheetShadow : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_ELEMENT

public:
    explicit SheetShadow(QQuickItem *parent = nullptr);

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;
};

} // namespace favrin::gallery

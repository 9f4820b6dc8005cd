#pragma once

#include "model/somecolor.h"

#include <QColor>
#include <QObject>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::service {

/**
 * The one place where a color becomes what is drawn: converted to the space of the surface, clipped as the conversion
 * clips. What is reported to anybody never passes through here. Main thread only.
 */
class DisplayColor : public QObject
{
    Q_OBJECT

public:
    /** The converter of this process. */
    static DisplayColor &instance();

    /** The space in which the pixels of the surface are read: sRGB at first. */
    model::SomeColor::ColorSpace surfaceColorSpace() const { return m_surfaceColorSpace; }
    void setSurfaceColorSpace(model::SomeColor::ColorSpace space);

    /** Drawing color of @p color, with its opacity. The QColor holds numbers of the surface's space. */
    QColor color(const model::SomeColor &color) const;
    /** The same for an sRGB color of the interface itself (labels, lines, backgrounds). */
    QColor interfaceColor(const QColor &sRGB) const;

Q_SIGNALS:
    /** Everything drawn with the old space must be drawn anew. */
    void surfaceColorSpaceChanged();

private:
    model::SomeColor::ColorSpace m_surfaceColorSpace = model::SomeColor::ColorSpace::sRGB;
};

} // namespace favrin::service

#pragma once

#include "favorites/pagelayout.h"

#include <QObject>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::favorites {

/** How a strip is laid into a given width, for whoever arranges it. */
class StripFitting : public QObject
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(double availableWidth READ availableWidth WRITE setAvailableWidth NOTIFY changed FINAL)
    Q_PROPERTY(bool useLandscapeLayout READ useLandscapeLayout WRITE setUseLandscapeLayout NOTIFY layoutChanged FINAL)
    Q_PROPERTY(int swatchesPerPage READ swatchesPerPage NOTIFY changed FINAL)
    Q_PROPERTY(double inset READ inset NOTIFY changed FINAL)
    Q_PROPERTY(double stripHeight READ stripHeight NOTIFY layoutChanged FINAL)

public:
    using QObject::QObject;

    double availableWidth() const { return m_availableWidth; }
    void setAvailableWidth(double width);
    bool useLandscapeLayout() const { return m_useLandscapeLayout; }
    void setUseLandscapeLayout(bool landscape);

    int swatchesPerPage() const { return fit().swatchesPerPage; }
    /** What is left of the width on either side of the strip. */
    double inset() const { return fit().inset; }
    double stripHeight() const { return favorites::stripHeight(swatchMetrics(m_useLandscapeLayout)); }

Q_SIGNALS:
    void changed();
    /** The layout is another one; what depends on the width alone is not. */
    void layoutChanged();

private:
    StripFit fit() const { return stripFit(m_availableWidth, swatchMetrics(m_useLandscapeLayout)); }

    double m_availableWidth = 0.0;
    bool m_useLandscapeLayout = false;
};

} // namespace favrin::favorites

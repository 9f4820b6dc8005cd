#include "favorites/stripfitting.h"

namespace favrin::favorites {

void StripFitting::setAvailableWidth(double width)
{
    if (width == m_availableWidth)
        return;
    m_availableWidth = width;
    Q_EMIT changed();
}

void StripFitting::setUseLandscapeLayout(bool landscape)
{
    if (landscape == m_useLandscapeLayout)
        return;
    m_useLandscapeLayout = landscape;
    Q_EMIT layoutChanged();
    Q_EMIT changed();
}

} // namespace favrin::favorites

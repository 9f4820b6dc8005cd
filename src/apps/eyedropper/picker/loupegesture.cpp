#include "apps/eyedropper/picker/loupegesture.h"

#include <utility>

namespace favrin::eyedropper {

QPoint LoupeGesture::press(QPoint finger, QPoint crosshair, bool isOnLoupe)
{
    m_start = finger;
    m_offset = isOnLoupe ? crosshair - finger : QPoint();
    m_crosshair = finger + m_offset;
    m_isDrag = false;
    return m_crosshair;
}

QPoint LoupeGesture::move(QPoint finger)
{
    if (!m_start)
        return finger;
    m_isDrag = m_isDrag || (finger - *m_start).manhattanLength() > m_slop;
    // Within a tap the crosshair rests, so that the finger's trembling does not change what it picks.
    if (m_isDrag)
        m_crosshair = finger + m_offset;
    return m_crosshair;
}

bool LoupeGesture::release()
{
    return std::exchange(m_start, std::nullopt).has_value() && !m_isDrag;
}

} // namespace favrin::eyedropper

#include "apps/gallery/stillness.h"

#include <QQuickWindow>

#include <chrono>

namespace favrin::gallery {
namespace {

using namespace std::chrono_literals;

/** Whatever moves, or is yet to arrive from the picker's process, shows within this time. */
constexpr std::chrono::milliseconds interval = 120ms;

} // namespace

bool Stillness::isReached()
{
    if (m_sincePicture.isValid() && m_sincePicture.elapsed() < interval.count())
        return false;
    const QImage picture = m_window->grabWindow();
    const bool isSame = picture == m_picture;
    m_picture = picture;
    m_sincePicture.start();
    return isSame;
}

} // namespace favrin::gallery

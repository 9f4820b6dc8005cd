#include "host/session/remotesurface.h"

#include "host/server/remoteviewserver.h"

#include <cstring>

namespace favrin::host {

namespace {

constexpr int bytesPerPixel = 4;

QRegion damagedRegion(const server::Frame &frame)
{
    QRegion region;
    for (const auto &rectangle : frame.damage)
        region += QRect(rectangle.x, rectangle.y, rectangle.width, rectangle.height);
    return region & QRect(0, 0, frame.width, frame.height);
}

} // namespace

void RemoteSurface::update(const server::Frame &frame)
{
    const QSize size(frame.width, frame.height);
    const bool resized = size != m_size || frame.scale != m_scale || frame.opaque != m_opaque;
    const QRegion region = resized ? QRegion(QRect(QPoint(), size)) : damagedRegion(frame);
    const std::size_t rowBytes = static_cast<std::size_t>(size.width()) * bytesPerPixel;
    if (resized) {
        m_size = size;
        m_scale = frame.scale;
        m_opaque = frame.opaque;
        m_pixels.resize(rowBytes * static_cast<std::size_t>(size.height()));
    }
    for (const QRect &rectangle : region) {
        const std::size_t offset = static_cast<std::size_t>(rectangle.x()) * bytesPerPixel;
        const std::size_t length = static_cast<std::size_t>(rectangle.width()) * bytesPerPixel;
        for (int row = rectangle.top(); row <= rectangle.bottom(); ++row) {
            const auto line = static_cast<std::size_t>(row);
            std::memcpy(m_pixels.data() + line * rowBytes + offset,
                        frame.pixels + line * static_cast<std::size_t>(frame.stride) + offset, length);
        }
    }
    Q_EMIT changed(region, resized);
}

void RemoteSurface::clear()
{
    m_size = {};
    m_pixels.clear();
    Q_EMIT changed({}, true);
}

QImage RemoteSurface::image() const
{
    const auto format = m_opaque ? QImage::Format_RGB32 : QImage::Format_ARGB32_Premultiplied;
    return QImage(m_pixels.data(), m_size.width(), m_size.height(), m_size.width() * bytesPerPixel, format);
}

} // namespace favrin::host

#include "apps/eyedropper/picker/screenpicture.h"

#include <array>
#include <cstdlib>
#include <cstring>
#include <memory>

#include <xcb/xcb.h>

namespace favrin::eyedropper {

namespace {

struct FreeReply
{
    void operator()(void *reply) const { std::free(reply); }
};

const xcb_visualtype_t *rootVisual(const xcb_screen_t *screen)
{
    for (auto depth = xcb_screen_allowed_depths_iterator(screen); depth.rem; xcb_depth_next(&depth)) {
        for (auto visual = xcb_depth_visuals_iterator(depth.data); visual.rem; xcb_visualtype_next(&visual)) {
            if (visual.data->visual_id == screen->root_visual)
                return visual.data;
        }
    }
    return nullptr;
}

/** The format in which the screen's pixels lie in memory, or invalid. */
QImage::Format formatOf(const xcb_visualtype_t &visual)
{
    struct KnownFormat
    {
        quint32 red, green, blue;
        QImage::Format format;
    };
    static constexpr KnownFormat known[] = {
        {0xff0000, 0xff00, 0xff, QImage::Format_RGB32},     {0xff, 0xff00, 0xff0000, QImage::Format_RGBX8888},
        {0x3ff00000, 0xffc00, 0x3ff, QImage::Format_RGB30}, {0x3ff, 0xffc00, 0x3ff00000, QImage::Format_BGR30},
        {0xf800, 0x7e0, 0x1f, QImage::Format_RGB16},
    };
    for (const KnownFormat &format : known) {
        if (visual.red_mask == format.red && visual.green_mask == format.green && visual.blue_mask == format.blue)
            return format.format;
    }
    return QImage::Format_Invalid;
}

QImage::Format formatOf(const xcb_screen_t *screen)
{
    const xcb_visualtype_t *visual = rootVisual(screen);
    return visual ? formatOf(*visual) : QImage::Format_Invalid;
}

const xcb_screen_t *screenOf(xcb_connection_t *connection)
{
    return xcb_setup_roots_iterator(xcb_get_setup(connection)).data;
}

platform::Color tenBitColor(quint32 red, quint32 green, quint32 blue)
{
    constexpr double largest = 1023.0;
    const std::array components = {red / largest, green / largest, blue / largest};
    return platform::Color(platform::ColorSpace::sRGB(), components, 1.0);
}

} // namespace

bool screenCanBeRead(xcb_connection_t *connection)
{
    return formatOf(screenOf(connection)) != QImage::Format_Invalid;
}

std::optional<QImage> pictureOfScreen(xcb_connection_t *connection)
{
    const xcb_screen_t *screen = screenOf(connection);
    const auto format = formatOf(screen);
    if (format == QImage::Format_Invalid)
        return std::nullopt;
    const std::unique_ptr<xcb_get_geometry_reply_t, FreeReply> size(
        xcb_get_geometry_reply(connection, xcb_get_geometry(connection, screen->root), nullptr));
    if (!size)
        return std::nullopt;
    const std::unique_ptr<xcb_get_image_reply_t, FreeReply> reply(xcb_get_image_reply(
        connection,
        xcb_get_image(connection, XCB_IMAGE_FORMAT_Z_PIXMAP, screen->root, 0, 0, size->width, size->height, ~0U),
        nullptr));
    QImage picture(size->width, size->height, format);
    // A row is filled up to whole words, here as there.
    if (!reply || picture.isNull() || xcb_get_image_data_length(reply.get()) != picture.sizeInBytes())
        return std::nullopt;
    std::memcpy(picture.bits(), xcb_get_image_data(reply.get()), static_cast<std::size_t>(picture.sizeInBytes()));
    return picture;
}

platform::Color colorOfPixel(const QImage &picture, QPoint pixel)
{
    // Ten bits are read as they are: widened to sixteen by the toolkit they would no longer be whole steps.
    if (picture.format() == QImage::Format_RGB30 || picture.format() == QImage::Format_BGR30) {
        const quint32 bits = reinterpret_cast<const quint32 *>(picture.constScanLine(pixel.y()))[pixel.x()];
        const quint32 high = bits >> 20 & 0x3ff;
        const quint32 middle = bits >> 10 & 0x3ff;
        const quint32 low = bits & 0x3ff;
        return picture.format() == QImage::Format_RGB30 ? tenBitColor(high, middle, low)
                                                        : tenBitColor(low, middle, high);
    }
    const QRgb value = picture.pixel(pixel);
    const std::array components = {qRed(value) / 255.0, qGreen(value) / 255.0, qBlue(value) / 255.0};
    return platform::Color(platform::ColorSpace::sRGB(), components, 1.0);
}

} // namespace favrin::eyedropper

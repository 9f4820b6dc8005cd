#include "lens/lenspicture.h"

#include "platform/shapes/dropshadow.h"

#include <QPainter>

#include <algorithm>
#include <utility>
#include <vector>

namespace favrin::lens {
namespace {

/** As many as are on screen together: the lens of the spectrum, and the thumbs, which are all alike. */
constexpr std::size_t mostKept = 2;

/** The last few pictures by what they show. */
template<class Description>
class RecentImages
{
public:
    template<class Draw>
    QImage image(const Description &description, Draw draw)
    {
        const auto found = std::ranges::find(m_images, description, &std::pair<Description, QImage>::first);
        if (found != m_images.end())
            return found->second;
        if (m_images.size() == mostKept)
            m_images.erase(m_images.begin());
        return m_images.emplace_back(description, draw()).second;
    }

private:
    std::vector<std::pair<Description, QImage>> m_images;
};

void drawDisc(QImage &image, const QRectF &circle, const QColor &color)
{
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(color);
    painter.drawEllipse(circle);
}

QImage transparent(QSize size)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    return image;
}

QImage drawn(const LensFrame &frame)
{
    QImage ring = transparent(frame.size);
    drawDisc(ring, frame.circle, frame.ring);
    QImage image = platform::dropShadow(ring, frame.shadowBlurRadius, frame.shadow);
    QPainter(&image).drawImage(0, 0, ring);
    return image;
}

QImage image(const LensFrame &frame)
{
    static RecentImages<LensFrame> frames;
    return frames.image(frame, [&] { return drawn(frame); });
}

} // namespace

QImage image(const LensPicture &picture)
{
    static RecentImages<LensPicture> pictures;
    return pictures.image(picture, [&] {
        QImage drawn = image(picture.frame);
        drawDisc(drawn, picture.disc, picture.color);
        return drawn;
    });
}

} // namespace favrin::lens

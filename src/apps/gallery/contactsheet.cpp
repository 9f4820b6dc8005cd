#include "apps/gallery/contactsheet.h"

#include <QPainter>

#include <algorithm>

namespace favrin::gallery {
namespace {

constexpr int margin = 28;
constexpr int gap = 16;
constexpr int captionHeight = 40;
constexpr int captionSize = 19;

QSize scaled(const QImage &picture, double scale)
{
    return (QSizeF(picture.size()) * scale).toSize();
}

} // namespace

void ContactSheet::addRow(const QString &caption)
{
    m_rows.append({caption, {}});
}

void ContactSheet::addPicture(const QImage &picture)
{
    m_rows.last().pictures.append(picture);
}

QImage ContactSheet::draw(double scale, int width) const
{
    const int room = width - 2 * margin;
    QList<int> tops;
    int bottom = margin;
    for (const Row &row : m_rows) {
        tops.append(bottom);
        for (const QRect &place : row.places(scale, room))
            bottom = std::max(bottom, tops.last() + place.bottom() + 1 + gap);
    }
    QImage sheet(width, bottom - gap + margin, QImage::Format_RGB32);
    sheet.fill(m_background);
    QPainter painter(&sheet);
    painter.setPen(m_background.lightnessF() < 0.5f ? Qt::white : Qt::black);
    QFont font = painter.font();
    font.setPixelSize(captionSize);
    painter.setFont(font);
    for (qsizetype index = 0; index < m_rows.size(); ++index) {
        const Row &row = m_rows.at(index);
        painter.drawText(QRect(margin, tops.at(index), room, captionHeight), Qt::AlignLeft | Qt::AlignVCenter,
                         row.caption);
        const QList<QRect> places = row.places(scale, room);
        for (qsizetype picture = 0; picture < places.size(); ++picture) {
            const QRect place = places.at(picture).translated(margin, tops.at(index));
            painter.drawImage(place.topLeft(), row.pictures.at(picture).scaled(place.size(), Qt::IgnoreAspectRatio,
                                                                               Qt::SmoothTransformation));
        }
    }
    return sheet;
}

QList<QRect> ContactSheet::Row::places(double scale, int width) const
{
    QList<QRect> places;
    QPoint next(0, captionHeight);
    int lineBottom = next.y();
    for (const QImage &picture : pictures) {
        const QSize size = scaled(picture, scale);
        if (next.x() > 0 && next.x() + size.width() > width)
            next = {0, lineBottom + gap};
        places.append({next, size});
        next.rx() += size.width() + gap;
        lineBottom = std::max(lineBottom, next.y() + size.height());
    }
    return places;
}

} // namespace favrin::gallery

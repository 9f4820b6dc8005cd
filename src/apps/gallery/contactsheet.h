#pragma once

#include <QImage>
#include <QList>
#include <QString>

namespace favrin::gallery {

/** Many pictures on one, in rows that are broken where they are too long, smaller than they are. */
class ContactSheet
{
public:
    /** @param background what the sheet is filled with; captions are legible on it */
    explicit ContactSheet(const QColor &background) : m_background(background) {}

    /** Begins a row with a caption of its own. */
    void addRow(const QString &caption);
    /** Adds to the last row. */
    void addPicture(const QImage &picture);

    /**
     * @param scale of every picture, of its own size in pixels
     * @param width of the sheet, in pixels
     */
    QImage draw(double scale, int width) const;

private:
    struct Row
    {
        QString caption;
        QList<QImage> pictures;

        /** Where the pictures go below the caption in a room of @p width, from the row's top left corner. */
        QList<QRect> places(double scale, int width) const;
    };

    QColor m_background;
    QList<Row> m_rows;
};

} // namespace favrin::gallery

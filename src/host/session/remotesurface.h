#pragma once

#include <QImage>
#include <QObject>
#include <QRegion>

#include <vector>

namespace favrin::host {

namespace server {
struct Frame;
}

/**
 * The pixels that the service drew last, kept here because the service's memory may be read only while a frame arrives.
 * Changed in place: a reader on another thread needs a copy.
 */
class RemoteSurface : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    /** Copies the damaged parts of @p frame, or all of it when its size or scale is new. */
    void update(const server::Frame &frame);
    void clear();

    bool isEmpty() const { return m_size.isEmpty(); }
    /** Pixels. */
    QSize size() const { return m_size; }
    int scale() const { return m_scale; }
    /** Premultiplied; shares the memory that update() writes into. */
    QImage image() const;

Q_SIGNALS:
    /** The changed region in pixels; everything when @p resized. */
    void changed(const QRegion &damage, bool resized);

private:
    std::vector<unsigned char> m_pixels;
    QSize m_size;
    int m_scale = 1;
    bool m_opaque = false;
};

} // namespace favrin::host

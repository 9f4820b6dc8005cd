#pragma once

#include <QElapsedTimer>
#include <QImage>

class QQuickWindow;

namespace favrin::gallery {

/** Tells when nothing moves in a window any more: two pictures of it, some time apart, are the same. */
class Stillness
{
public:
    explicit Stillness(QQuickWindow *window) : m_window(window) {}

    /** What was still so far says nothing about what comes. */
    void forget() { m_picture = {}; }
    /** To be asked again and again. */
    bool isReached();
    /** The last picture that was taken, in pixels. */
    const QImage &picture() const { return m_picture; }

private:
    QQuickWindow *m_window;
    QImage m_picture;
    QElapsedTimer m_sincePicture;
};

} // namespace favrin::gallery

#pragma once

#include <QQuickWindow>
#include <QTest>

#include <optional>

/** One finger on a touch screen, or the mouse where there is none. */
class Pointer
{
public:
    Pointer(QQuickWindow &window, const QPointingDevice *touchScreen) : m_window(window)
    {
        if (touchScreen)
            m_touch.emplace(QTest::touchEvent(&window, const_cast<QPointingDevice *>(touchScreen), false));
    }
    void press(QPoint place)
    {
        if (m_touch)
            m_touch->press(0, place).commit();
        else
            QTest::mousePress(&m_window, Qt::LeftButton, {}, place);
    }
    void move(QPoint place)
    {
        if (m_touch)
            m_touch->move(0, place).commit();
        else
            QTest::mouseMove(&m_window, place);
    }
    void release(QPoint place)
    {
        if (m_touch)
            m_touch->release(0, place).commit();
        else
            QTest::mouseRelease(&m_window, Qt::LeftButton, {}, place);
    }

private:
    QQuickWindow &m_window;
    std::optional<QTest::QTouchEventSequence> m_touch;
};

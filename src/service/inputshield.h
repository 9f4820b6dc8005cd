#pragma once

#include <QQuickItem>

namespace favrin::service {

/**
 * Keeps the user's input from the items below while it is raised: it takes every new touch, press, hover and wheel
 * event itself and swallows keys and composed text of its window. A gesture that began before goes on to its end, which
 * disabling the items would not allow: the button that starts the eyedropper still has to see the finger or key lift.
 */
class InputShield : public QQuickItem
{
    Q_OBJECT

public:
    explicit InputShield(QQuickItem *parent = nullptr);
    ~InputShield() override;

    void setRaised(bool raised);

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseDoubleClickEvent(QMouseEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void touchEvent(QTouchEvent *event) override;
    void hoverEnterEvent(QHoverEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool belongsToWindow(const QObject *receiver) const;
};

} // namespace favrin::service

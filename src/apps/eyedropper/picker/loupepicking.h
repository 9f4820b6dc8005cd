#pragma once

#include "apps/eyedropper/picker/loupewindow.h"
#include "apps/eyedropper/picker/picking.h"

#include <QTimer>

#include <memory>

namespace favrin::eyedropper {

/**
 * Picks through a loupe over an X server's screen. While the finger that started it is down, the app that it touches
 * has the input, and the loupe follows by asking where the pointer is; floating, it has pointer and keys to itself.
 */
class LoupePicking : public Picking
{
    Q_OBJECT

public:
    /** @p displayIdentifier names the display to start on; @p scale is pixels a point. */
    LoupePicking(QString displayIdentifier, double scale, QObject *parent = nullptr);
    ~LoupePicking() override;

    void start() override;
    void floatPicking() override;
    void cancel() override;

private:
    void showWindow(QImage picture);
    void startOnDisplay();
    void followPointer();
    void takeInput();
    void startListening();
    void end(PickingEnd how);

    QString m_displayIdentifier;
    double m_scale;
    std::unique_ptr<LoupeWindow> m_window;
    QTimer m_follow;
    QTimer m_takeInput;
    QPoint m_pointer;
    bool m_hasEnded = false;
};

} // namespace favrin::eyedropper

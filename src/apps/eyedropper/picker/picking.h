#pragma once

#include "platform/color/color.h"

#include <QObject>

namespace favrin::eyedropper {

/** How picking a color came to its end. */
enum class PickingEnd { Picked, Cancelled, Failed };

/** One way of sampling a color from the screen. ended() comes once, after start(), and nothing after it. */
class Picking : public QObject
{
    Q_OBJECT

public:
    using QObject::QObject;

    virtual void start() = 0;
    /** The finger that started the eyedropper has been lifted. */
    virtual void floatPicking() = 0;
    virtual void cancel() = 0;

Q_SIGNALS:
    void floated();
    void picked(const favrin::platform::Color &color);
    void ended(favrin::eyedropper::PickingEnd how);
};

} // namespace favrin::eyedropper

#pragma once

#include "platform/color/color.h"

#include <string>

namespace favrin::service {

/** What the eyedropper service reports. Main thread. */
class EyedropperClientDelegate
{
public:
    virtual ~EyedropperClientDelegate() = default;
    /** The user sampled a color. */
    virtual void eyedropperDidSelectColor(const platform::Color &color) = 0;
    virtual void eyedropperDidFloat() = 0;
    /** The eyedropper has gone away, for whatever reason. */
    virtual void eyedropperDidDismiss() = 0;
};

/**
 * The way to the eyedropper service. Requests are one-way and never wait; each connects first when there is no
 * connection. Main thread only. A client never calls its delegate from within a request.
 */
class EyedropperClient
{
public:
    virtual ~EyedropperClient() = default;
    /** Starts the eyedropper on the display with this hardware identifier. */
    virtual void invoke(const std::string &displayIdentifier) = 0;
    /** Lets the running eyedropper float. */
    virtual void floatEyedropper() = 0;
    /** Stops the eyedropper. */
    virtual void cancel() = 0;
};

} // namespace favrin::service

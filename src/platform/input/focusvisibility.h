#pragma once

#include <functional>

class QFocusEvent;

namespace favrin::platform {

/**
 * Whether an item shows that it has the keyboard: from the moment a key is used on it, or brings the focus to it, until
 * a pointer takes over or the focus goes elsewhere. A change of the active window leaves it as it is.
 */
class FocusVisibility
{
public:
    /** @param changed called after isVisible() became another */
    explicit FocusVisibility(std::function<void()> changed);

    bool isVisible() const { return m_visible; }

    /** A key was used on the item. */
    void keyUsed() { setVisible(true); }
    void focusIn(const QFocusEvent &event);
    void focusOut(const QFocusEvent &event);

private:
    void setVisible(bool visible);

    std::function<void()> m_changed;
    bool m_visible = false;
};

} // namespace favrin::platform

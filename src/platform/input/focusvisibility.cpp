#include "platform/input/focusvisibility.h"

#include <QFocusEvent>

#include <utility>

namespace favrin::platform {

FocusVisibility::FocusVisibility(std::function<void()> changed) : m_changed(std::move(changed)) {}

void FocusVisibility::focusIn(const QFocusEvent &event)
{
    const auto reason = event.reason();
    if (reason != Qt::ActiveWindowFocusReason)
        setVisible(reason == Qt::TabFocusReason || reason == Qt::BacktabFocusReason ||
                   reason == Qt::ShortcutFocusReason);
}

void FocusVisibility::focusOut(const QFocusEvent &event)
{
    if (event.reason() != Qt::ActiveWindowFocusReason)
        setVisible(false);
}

void FocusVisibility::setVisible(bool visible)
{
    if (visible == m_visible)
        return;
    m_visible = visible;
    m_changed();
}

} // namespace favrin::platform

#include "apps/service/focusborder.h"

#include <QKeyEvent>
#include <QQuickItem>
#include <QQuickWindow>

#include <utility>

namespace favrin::apps {

using remote::FocusDirection;

namespace {

/** Which way a key moves the focus; none for any other key. */
std::optional<FocusDirection> direction(const QKeyEvent &event)
{
    if (event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        return std::nullopt;
    const bool shift = event.modifiers().testFlag(Qt::ShiftModifier);
    if (event.key() == Qt::Key_Backtab || (event.key() == Qt::Key_Tab && shift))
        return FocusDirection::Backward;
    return event.key() == Qt::Key_Tab ? std::optional(FocusDirection::Forward) : std::nullopt;
}

/** The first element in that direction. */
QQuickItem *edge(const QQuickWindow &window, FocusDirection direction)
{
    return window.contentItem()->nextItemInFocusChain(direction == FocusDirection::Forward);
}

} // namespace

FocusBorder::FocusBorder(QQuickWindow &window, std::function<bool(FocusDirection)> leave)
    : m_window(window), m_leave(std::move(leave))
{
    window.installEventFilter(this);
    connect(&window, &QWindow::activeChanged, this, &FocusBorder::enterNow);
}

void FocusBorder::enter(FocusDirection direction)
{
    m_entry = direction;
    enterNow();
}

void FocusBorder::enterNow()
{
    if (!m_entry || !m_window.isActive())
        return;
    QQuickItem *element = edge(m_window, *m_entry);
    if (!element)
        return;
    // An element that has the focus already would not hear where it comes from.
    element->setFocus(false);
    element->forceActiveFocus(*m_entry == FocusDirection::Forward ? Qt::TabFocusReason : Qt::BacktabFocusReason);
}

bool FocusBorder::eventFilter(QObject *watched, QEvent *event)
{
    if (watched != &m_window)
        return false;
    if (event->type() == QEvent::MouseButtonPress || event->type() == QEvent::TouchBegin)
        m_entry.reset();
    if (event->type() != QEvent::KeyPress)
        return false;
    m_entry.reset();
    const auto way = direction(*static_cast<QKeyEvent *>(event));
    return way && isAtBorder(*way) && m_leave(*way);
}

bool FocusBorder::isAtBorder(FocusDirection direction) const
{
    const QQuickItem *element = m_window.activeFocusItem();
    if (!element || !element->activeFocusOnTab())
        return false;
    // From the last element the chain begins anew.
    return m_window.activeFocusItem()->nextItemInFocusChain(direction == FocusDirection::Forward) ==
           edge(m_window, direction);
}

} // namespace favrin::apps

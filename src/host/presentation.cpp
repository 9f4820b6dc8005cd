#include "host/presentation.h"

#include "host/presentationlayout.h"
#include "host/presentationpanel.h"
#include "host/presentationscrim.h"
#include "host/remoteviewitem.h"

#include <QPropertyAnimation>
#include <QQuickWindow>

namespace favrin::host {

namespace {

/** Above whatever an app stacks; popups of Qt Quick Controls use a million. */
constexpr double stackingOrder = 2'000'000;
constexpr int revealMilliseconds = 160;

} // namespace

std::unique_ptr<ItemPlace> ItemPlace::create(PresentationStyle style, QQuickItem &place)
{
    return std::make_unique<Presentation>(style, place);
}

Presentation::Presentation(PresentationStyle style, QQuickItem &place)
    : m_style(style)
    , m_place(&place)
    , m_parentItem(style == PresentationStyle::Embedded ? &place : place.window()->contentItem())
    , m_focusBefore(place.window() ? place.window()->activeFocusItem() : nullptr)
{
    build();
    layOut();
    follow();
}

Presentation::~Presentation()
{
    const bool hadFocus = m_view && m_view->hasActiveFocus();
    // The view hangs below the panel, the panel beside the scrim; any of them may have gone with the window.
    delete m_view;
    delete m_panel;
    delete m_scrim;
    if (hadFocus && m_focusBefore)
        m_focusBefore->forceActiveFocus(Qt::PopupFocusReason);
}

void Presentation::follow()
{
    connect(m_parentItem, &QQuickItem::widthChanged, this, &Presentation::layOut);
    connect(m_parentItem, &QQuickItem::heightChanged, this, &Presentation::layOut);
    connect(m_place, &QObject::destroyed, this, &Presentation::wasLost);
    connect(m_place, &QQuickItem::windowChanged, this, &Presentation::wasLost);
    connect(m_view, &QQuickItem::widthChanged, this, &Presentation::changed);
    connect(m_view, &QQuickItem::heightChanged, this, &Presentation::changed);
    if (const QWindow *shownIn = window()) {
        connect(shownIn, &QWindow::widthChanged, this, &Presentation::changed);
        connect(shownIn, &QWindow::heightChanged, this, &Presentation::changed);
        connect(shownIn, &QWindow::screenChanged, this, &Presentation::changed);
    }
}

QWindow *Presentation::window() const
{
    return m_parentItem ? m_parentItem->window() : nullptr;
}

QSizeF Presentation::surroundingSize() const
{
    if (m_style == PresentationStyle::Embedded)
        return m_place ? m_place->size() : QSizeF(0, 0);
    const QWindow *shownIn = window();
    return shownIn ? QSizeF(shownIn->size()) : QSizeF(0, 0);
}

QRectF Presentation::rectangle() const
{
    return m_view ? m_view->mapRectToScene(m_view->boundingRect()) : QRectF();
}

QQuickItem *Presentation::view() const
{
    return m_view;
}

void Presentation::setSession(RemoteViewSession *session)
{
    if (m_view)
        m_view->setSession(session);
}

void Presentation::takeFocus()
{
    if (m_view)
        m_view->forceActiveFocus(Qt::PopupFocusReason);
}

void Presentation::build()
{
    if (m_style == PresentationStyle::Embedded) {
        m_view = new RemoteViewItem(m_parentItem);
        return;
    }
    const auto look =
        m_style == PresentationStyle::Presented ? PresentationScrim::Look::Dimmed : PresentationScrim::Look::Clear;
    m_scrim = new PresentationScrim(look, m_parentItem);
    m_scrim->setZ(stackingOrder);
    m_scrim->setOpacity(0);
    m_panel = new PresentationPanel(m_parentItem);
    m_panel->setZ(stackingOrder);
    m_panel->setOpacity(0);
    m_view = new RemoteViewItem(m_panel);
    // A popover has no close button: leaving it is what ends it.
    if (m_style == PresentationStyle::Popover)
        connect(m_scrim, &PresentationScrim::pressed, this, &Presentation::dismissRequested);
}

void Presentation::layOut()
{
    if (!m_parentItem || !m_place || !m_view)
        return;
    const QSizeF window = m_parentItem->size();
    const QRectF anchor = m_place->mapRectToItem(m_parentItem, m_place->boundingRect());
    const auto layout = layoutPresentation(m_style, window, m_preferredContentSize, anchor);
    if (m_style == PresentationStyle::Embedded) {
        m_view->setSize(layout.panel.size());
        return;
    }
    m_scrim->setSize(window);
    m_panel->setLayout(layout);
    const QRectF content = m_panel->contentRectangle();
    m_view->setPosition(content.topLeft());
    m_view->setSize(content.size());
}

void Presentation::setPreferredContentSize(QSizeF size)
{
    if (size == m_preferredContentSize)
        return;
    m_preferredContentSize = size;
    layOut();
}

void Presentation::setAppearance(bool dark)
{
    if (m_panel)
        m_panel->setAppearance(dark);
}

void Presentation::reveal(bool animated)
{
    for (QQuickItem *item : {static_cast<QQuickItem *>(m_scrim), static_cast<QQuickItem *>(m_panel)}) {
        if (!item || item->opacity() == 1.0)
            continue;
        // A window that is still to appear shows the picker with its first frame.
        if (!animated || !item->window() || !item->window()->isVisible()) {
            item->setOpacity(1);
            continue;
        }
        auto *animation = new QPropertyAnimation(item, "opacity", item);
        animation->setDuration(revealMilliseconds);
        animation->setEndValue(1.0);
        animation->start(QAbstractAnimation::DeleteWhenStopped);
    }
}

} // namespace favrin::host

#include "fake/scriptedplace.h"

#include "fake/scriptedpicker.h"
#include "host/presentationlayout.h"

#include <QQuickWindow>

namespace favrin {

using host::PresentationStyle;

std::unique_ptr<host::Picker> host::Picker::create()
{
    return std::make_unique<fake::ScriptedPicker>();
}

std::unique_ptr<host::ItemPlace> host::ItemPlace::create(PresentationStyle style, QQuickItem &place)
{
    return std::make_unique<fake::ScriptedPlace>(style, place);
}

namespace fake {

ScriptedPlace::ScriptedPlace(PresentationStyle style, QQuickItem &place)
    : m_style(style)
    , m_place(&place)
    , m_view(new QQuickItem(style == PresentationStyle::Embedded ? &place : place.window()->contentItem()))
{
    connect(&place, &QObject::destroyed, this, &ScriptedPlace::wasLost);
}

ScriptedPlace::~ScriptedPlace()
{
    delete m_view;
}

QWindow *ScriptedPlace::window() const
{
    return m_view ? m_view->window() : nullptr;
}

QSizeF ScriptedPlace::surroundingSize() const
{
    return window() ? QSizeF(window()->size()) : QSizeF(0, 0);
}

QRectF ScriptedPlace::rectangle() const
{
    return m_view ? m_view->mapRectToScene(m_view->boundingRect()) : QRectF();
}

void ScriptedPlace::setPreferredContentSize(QSizeF size)
{
    if (!m_view || !m_place)
        return;
    const QQuickItem *parent = m_view->parentItem();
    const QRectF anchor = m_place->mapRectToItem(parent, m_place->boundingRect());
    const auto layout = host::layoutPresentation(m_style, parent->size(), size, anchor);
    m_view->setPosition(layout.panel.topLeft());
    m_view->setSize(layout.panel.size());
}

} // namespace fake

} // namespace favrin

#include "host/presentationscrim.h"

#include <QColor>
#include <QMouseEvent>
#include <QQuickWindow>
#include <QSGRectangleNode>
#include <QTouchEvent>
#include <QWheelEvent>

namespace favrin::host {

namespace {

constexpr QColor dimmed(0, 0, 0, 51);

} // namespace

PresentationScrim::PresentationScrim(Look look, QQuickItem *parent) : QQuickItem(parent), m_look(look)
{
    setFlag(ItemHasContents, look == Look::Dimmed);
    setAcceptedMouseButtons(Qt::AllButtons);
    setAcceptHoverEvents(true);
    setAcceptTouchEvents(true);
}

QSGNode *PresentationScrim::updatePaintNode(QSGNode *oldNode, UpdatePaintNodeData *)
{
    auto *node = static_cast<QSGRectangleNode *>(oldNode);
    if (!node)
        node = window()->createRectangleNode();
    node->setRect(boundingRect());
    node->setColor(dimmed);
    return node;
}

void PresentationScrim::mousePressEvent(QMouseEvent *event)
{
    event->accept();
    Q_EMIT pressed();
}

void PresentationScrim::hoverMoveEvent(QHoverEvent *event)
{
    event->accept();
}

void PresentationScrim::wheelEvent(QWheelEvent *event)
{
    event->accept();
}

void PresentationScrim::touchEvent(QTouchEvent *event)
{
    event->accept();
    if (event->type() == QEvent::TouchBegin)
        Q_EMIT pressed();
}

} // namespace favrin::host

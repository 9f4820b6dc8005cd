#include "shell/colorwell.h"

#include "model/csstext.h"
#include "platform/shapes/continuousroundedrect.h"
#include "platform/shapes/shapeview.h"
#include "service/displaycolor.h"
#include "shell/accessiblecolorwell.h"
#include "shell/triangle.h"
#include "sliders/colormimedata.h"
#include "theme/theme.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QPainter>

#include <numbers>

namespace favrin::shell {

using service::ColorPickerState;
using service::DisplayColor;
using theme::Theme;

namespace {

constexpr double slashWidth = 3.0;
constexpr double slashCornerRadius = 1.5;
constexpr double slashRotation = 180.0 / 4;

/** As tall as the well, turned about its center. */
QPainterPath slash(const QRectF &bounds, double devicePixelRatio)
{
    const double width = slashWidth * devicePixelRatio;
    QPainterPath upright;
    upright.addRoundedRect(QRectF(-width / 2, -bounds.height() / 2, width, bounds.height()),
                           slashCornerRadius * devicePixelRatio, slashCornerRadius * devicePixelRatio);
    return QTransform::fromTranslate(bounds.center().x(), bounds.center().y()).rotate(slashRotation).map(upright);
}

} // namespace

ColorWell::ColorWell(QQuickItem *parent)
    : CrispPaintedItem(parent), m_focusVisibility([this] { Q_EMIT focusVisibleChanged(); })
{
    installAccessibleColorWell();
    setActiveFocusOnTab(true);
    connect(&Theme::instance(), &Theme::colorsChanged, this, [this] { repaint(); });
}

void ColorWell::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state)
        connect(state, &ColorPickerState::selectedColorChanged, this, [this] { repaint(); });
    repaint();
    Q_EMIT colorPickerStateChanged();
}

void ColorWell::copy() const
{
    const auto color = m_state ? m_state->selectedColor() : std::nullopt;
    if (color)
        QGuiApplication::clipboard()->setMimeData(
            sliders::colorMimeData(*color, QString::fromStdString(model::cssText(*color))).release());
}

void ColorWell::paint(QPainter &painter, QSize size, double devicePixelRatio)
{
    const DisplayColor &display = DisplayColor::instance();
    const QRect bounds(QPoint(), size);
    const auto color = m_state ? m_state->selectedColor() : std::nullopt;
    if (color) {
        if (color->a < 1.0) {
            painter.fillRect(bounds, display.interfaceColor(Qt::white));
            painter.fillPath(triangle(bounds), display.interfaceColor(Qt::black));
        }
        painter.fillRect(bounds, display.color(*color));
    } else {
        painter.fillRect(bounds, Theme::instance().systemGray5());
        painter.fillPath(slash(bounds, devicePixelRatio), Theme::instance().systemRed());
    }
    if (m_shape.size() != size)
        m_shape =
            platform::ShapeView{platform::continuousRoundedRect(bounds, cornerRadius() * devicePixelRatio)}.picture(
                bounds);
    platform::ShapeView::mask(painter, {}, m_shape);
}

void ColorWell::keyPressEvent(QKeyEvent *event)
{
    if (!event->matches(QKeySequence::Copy))
        return event->ignore();
    copy();
}

void ColorWell::focusInEvent(QFocusEvent *event)
{
    m_focusVisibility.focusIn(*event);
}

void ColorWell::focusOutEvent(QFocusEvent *event)
{
    m_focusVisibility.focusOut(*event);
}

} // namespace favrin::shell

#include "spectrum/spectrumkeys.h"

#include "spectrum/spectrumrules.h"

namespace favrin::spectrum {
namespace {

constexpr double smallStep = 0.01;
constexpr double largeStep = 0.1;
constexpr double hueStep = 1.0 / 6.0;

std::optional<QPointF> direction(int key)
{
    switch (key) {
    case Qt::Key_Left:
        return QPointF(-1.0, 0.0);
    case Qt::Key_Right:
        return QPointF(1.0, 0.0);
    case Qt::Key_Up:
        return QPointF(0.0, -1.0);
    case Qt::Key_Down:
        return QPointF(0.0, 1.0);
    default:
        return std::nullopt;
    }
}

} // namespace

std::optional<QPointF> pointForKey(int key, Qt::KeyboardModifiers modifiers, QPointF from, QSizeF size)
{
    if (modifiers & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        return std::nullopt;
    const auto moved = [=](QPointF share) {
        return clampedIntoSpectrum(from + QPointF(share.x() * size.width(), share.y() * size.height()), size);
    };
    if (const auto arrow = direction(key))
        return moved(*arrow * (modifiers.testFlag(Qt::ShiftModifier) ? largeStep : smallStep));
    switch (key) {
    case Qt::Key_PageUp:
        return moved({0.0, -hueStep});
    case Qt::Key_PageDown:
        return moved({0.0, hueStep});
    case Qt::Key_Home:
        return moved({0.0, -1.0});
    case Qt::Key_End:
        return moved({0.0, 1.0});
    default:
        return std::nullopt;
    }
}

} // namespace favrin::spectrum

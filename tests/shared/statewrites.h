#pragma once

#include "platform/observation/publisher.h"
#include "service/colorpickerstate.h"

#include <QStringList>

#include <functional>
#include <utility>

/** What is written into a state's flag and its color from now on, in order: "volatile", "final", and colors. */
class StateWrites
{
public:
    using OptionalColor = favrin::service::ColorPickerState::OptionalColor;
    /** How a color is written down. */
    using Name = std::function<QString(const OptionalColor &color)>;

    explicit StateWrites(
        favrin::service::ColorPickerState &state,
        const Name &name = [](const OptionalColor &) { return QStringLiteral("color"); })
        : m_flag(state.isVolatile.publisher().sink(
              [this](bool flag) { m_log << (flag ? QStringLiteral("volatile") : QStringLiteral("final")); }))
        , m_color(
              state.selectedColor.publisher().sink([this, name](const OptionalColor &color) { m_log << name(color); }))
    {
        // The subscriptions themselves deliver once.
        m_log.clear();
    }

    /** What was written since the last call. */
    QString take() { return std::exchange(m_log, {}).join(u' '); }

private:
    QStringList m_log;
    favrin::platform::Subscription m_flag;
    favrin::platform::Subscription m_color;
};

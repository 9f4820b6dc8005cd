#include "sliders/colorspaceswitcher.h"

#include "platform/strings/localizedstring.h"
#include "sliders/colorspacelabel.h"
#include "theme/theme.h"

#include <algorithm>

namespace favrin::sliders {

using model::SomeColor;
using service::ColorPickerState;

ColorSpaceSwitcher::ColorSpaceSwitcher(QObject *parent) : QObject(parent)
{
    connect(&theme::Theme::instance(), &theme::Theme::localeChanged, this, [this] {
        Q_EMIT namesChanged();
        Q_EMIT currentChanged();
    });
}

void ColorSpaceSwitcher::setColorPickerState(ColorPickerState *state)
{
    if (state == m_state)
        return;
    if (m_state)
        m_state->disconnect(this);
    m_state = state;
    if (state) {
        connect(state, &ColorPickerState::selectedColorChanged, this, &ColorSpaceSwitcher::currentChanged);
        connect(state, &ColorPickerState::fallbackColorChanged, this, &ColorSpaceSwitcher::currentChanged);
    }
    Q_EMIT colorPickerStateChanged();
    Q_EMIT currentChanged();
}

SomeColor::ColorSpace ColorSpaceSwitcher::space() const
{
    return m_state ? m_state->colorBinding().colorSpace : SomeColor::ColorSpace::sRGB;
}

QString ColorSpaceSwitcher::label() const
{
    return colorSpaceLabel(space());
}

QString ColorSpaceSwitcher::menuTitle() const
{
    return QString::fromStdString(platform::localizedString("Color Space", "Menu title for the color space switcher"));
}

QStringList ColorSpaceSwitcher::names() const
{
    QStringList names;
    for (const auto space : model::allColorSpaces)
        names << QString::fromStdString(model::displayName(space));
    return names;
}

int ColorSpaceSwitcher::current() const
{
    const auto *const found = std::find(model::allColorSpaces.begin(), model::allColorSpaces.end(), space());
    return static_cast<int>(found - model::allColorSpaces.begin());
}

void ColorSpaceSwitcher::choose(int index)
{
    if (!m_state || index < 0 || index >= static_cast<int>(model::allColorSpaces.size()))
        return;
    const auto chosen = model::allColorSpaces[static_cast<std::size_t>(index)];
    if (chosen == space())
        return;
    m_state->withAnimation([&] { m_state->setColorBinding(m_state->colorBinding().converted(chosen)); });
}

} // namespace favrin::sliders

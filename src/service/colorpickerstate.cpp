#include "service/colorpickerstate.h"

#include "platform/strings/localizedstring.h"
#include "service/colorpickerlog.h"

namespace favrin::service {

using model::SomeColor;

ColorPickerState::ColorPickerState(ColorList initialFavorites, QObject *parent)
    : QObject(parent)
    , selectedColor(*this, std::nullopt)
    , fallbackColor(*this, SomeColor(platform::Color::black()))
    , allowsNoColor(*this, false)
    , isVolatile(*this, false)
    , selectedTab(*this, Tab::grid)
    , favoriteColors(*this, std::move(initialFavorites))
    , title(*this, platform::localizedString("Colors", "Used as headline for the color picker"))
    , showsAlpha(*this, true)
    , showsEyedropper(*this, true)
    , suggestedColors(*this, std::nullopt)
    , eyedropperShowing(*this, false)
    , eyedropperIsFloating(*this, false)
    , useLandscapeLayout(*this, false)
    , isEmbedded(*this, false)
    , isPopover(*this, false)
    , size(*this, QSizeF(0.0, 0.0))
    , close(*this, nullptr)
    , enableDarkGrid(*this, false)
    , overrideColorScheme(*this, std::nullopt)
{
    selectedColor.onStored([this] { Q_EMIT selectedColorChanged(); });
    fallbackColor.onStored([this] { Q_EMIT fallbackColorChanged(); });
    allowsNoColor.onStored([this] { Q_EMIT allowsNoColorChanged(); });
    isVolatile.onStored([this] { Q_EMIT isVolatileChanged(); });
    selectedTab.onStored([this] { Q_EMIT selectedTabChanged(); });
    favoriteColors.onStored([this] { Q_EMIT favoriteColorsChanged(); });
    title.onStored([this] { Q_EMIT titleChanged(); });
    showsAlpha.onStored([this] { Q_EMIT showsAlphaChanged(); });
    showsEyedropper.onStored([this] { Q_EMIT showsEyedropperChanged(); });
    suggestedColors.onStored([this] { Q_EMIT suggestedColorsChanged(); });
    eyedropperShowing.onStored([this] { Q_EMIT eyedropperShowingChanged(); });
    eyedropperIsFloating.onStored([this] { Q_EMIT eyedropperIsFloatingChanged(); });
    useLandscapeLayout.onStored([this] { Q_EMIT useLandscapeLayoutChanged(); });
    isEmbedded.onStored([this] { Q_EMIT isEmbeddedChanged(); });
    isPopover.onStored([this] { Q_EMIT isPopoverChanged(); });
    size.onStored([this] { Q_EMIT sizeChanged(); });
    close.onStored([this] { Q_EMIT closeChanged(); });
    enableDarkGrid.onStored([this] { Q_EMIT enableDarkGridChanged(); });
    overrideColorScheme.onStored([this] { Q_EMIT overrideColorSchemeChanged(); });

    m_objectWillChangeSink =
        objectWillChange().sink([](platform::Nothing) { colorPickerLog().debug("ColorPickerState will change"); });
}

ColorPickerState::~ColorPickerState() = default;

platform::Publisher<std::optional<platform::Color>> &ColorPickerState::finalColor()
{
    if (!m_finalColor) {
        m_finalColor = selectedColor.publisher().map(
            [](const OptionalColor &color) { return color ? std::optional(color->platformColor()) : std::nullopt; });
    }
    return *m_finalColor;
}

SomeColor ColorPickerState::colorBinding() const
{
    return selectedColor().value_or(fallbackColor());
}

void ColorPickerState::setColorBinding(const SomeColor &color)
{
    selectedColor.set(color);
}

QString ColorPickerState::selectedTabName() const
{
    const std::string_view name = rawValue(selectedTab());
    return QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size()));
}

void ColorPickerState::setSelectedTabName(const QString &name)
{
    if (const auto tab = tabFromRawValue(name.toStdString()))
        selectedTab.set(*tab);
}

QString ColorPickerState::titleText() const
{
    return QString::fromStdString(title());
}

void ColorPickerState::withAnimation(const std::function<void()> &change)
{
    const bool outer = m_animatesChanges;
    setAnimatesChanges(true);
    change();
    setAnimatesChanges(outer);
}

void ColorPickerState::setAnimatesChanges(bool animates)
{
    if (animates == m_animatesChanges)
        return;
    m_animatesChanges = animates;
    Q_EMIT animatesChangesChanged();
}

void ColorPickerState::performClose()
{
    // A copy: the action may end the presentation and this state with it.
    if (const auto action = close())
        action();
}

} // namespace favrin::service

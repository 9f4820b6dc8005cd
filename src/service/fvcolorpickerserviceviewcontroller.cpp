#include "service/fvcolorpickerserviceviewcontroller.h"

#include "platform/queue/queue.h"
#include "platform/strings/localizedstring.h"

#include <QPointer>

namespace favrin::service {

using model::SomeColor;

void FVColorPickerServiceViewController::registerClass(RootViewFactory makeRootView)
{
    platform::viewcontrollerregistry::registerClass(hostedPickerClassName, [makeRootView = std::move(makeRootView)] {
        return std::make_unique<FVColorPickerServiceViewController>(makeRootView);
    });
}

// The order is observable: the stored list is loaded before anything is saved, and each subscription that is made
// receives its current value at once.
FVColorPickerServiceViewController::FVColorPickerServiceViewController(RootViewFactory makeRootView,
                                                                       platform::UserDefaults &defaults)
    : m_makeRootView(std::move(makeRootView)), m_defaults(defaults), m_favoritesStore(defaults), m_colorPickerState({})
{
    m_colorPickerState.favoriteColors.set(m_favoritesStore.favoriteColors(m_colorPickerState.showsAlpha()));
    subscribeToPicks();
    restoreSelectedTab();
    subscribeToSelectedTab();
    subscribeToEyedropper();
    subscribeToFavorites();
    m_colorPickerState.close.set([weak = QPointer(this)] {
        if (weak)
            weak->colorPickerDidFinish();
    });
}

FVColorPickerServiceViewController::~FVColorPickerServiceViewController() = default;

HostedPickerParent *FVColorPickerServiceViewController::front() const
{
    return dynamic_cast<HostedPickerParent *>(parentController());
}

void FVColorPickerServiceViewController::subscribeToPicks()
{
    auto picks = platform::combineLatest(m_colorPickerState.finalColor(),
                                         m_colorPickerState.isVolatile.publisher().removeDuplicates());
    m_finalColorSubscriber = picks.sink([this](const std::pair<std::optional<platform::Color>, bool> &pick) {
        // The host's own color is not told to the host.
        if (m_programmaticallySettingSelectedColor)
            return;
        if (auto *parent = front())
            parent->pickerDidSelectColor(pick.first, pick.second);
    });
}

void FVColorPickerServiceViewController::restoreSelectedTab()
{
    const auto stored = m_defaults.string(m_selectedTabUserDefaultsKey);
    const auto tab = stored ? tabFromRawValue(*stored) : std::nullopt;
    if (tab)
        m_colorPickerState.selectedTab.set(*tab);
}

void FVColorPickerServiceViewController::subscribeToSelectedTab()
{
    m_selectedTabCancellable = m_colorPickerState.selectedTab.publisher().sink(
        [this](Tab tab) { m_defaults.set(m_selectedTabUserDefaultsKey, std::string(rawValue(tab))); });
}

void FVColorPickerServiceViewController::subscribeToEyedropper()
{
    m_eyedropperShowingCancellable = m_colorPickerState.eyedropperShowing.publisher().sink([this](bool showing) {
        if (showing)
            showEyedropper();
    });
    m_eyedropperFloatingCancellable = m_colorPickerState.eyedropperIsFloating.publisher().sink([this](bool floating) {
        auto *parent = floating ? front() : nullptr;
        if (parent)
            parent->pickerDidFloatEyeDropper();
    });
}

void FVColorPickerServiceViewController::showEyedropper()
{
    auto *parent = front();
    if (!parent)
        return;
    // The actions may be called on any thread; the state is touched on the main thread only.
    const QPointer weak(this);
    parent->pickerDidShowEyedropper(
        [weak](const platform::Color &color) {
            platform::mainQueue().async([weak, color] {
                if (!weak)
                    return;
                auto &state = weak->m_colorPickerState;
                state.withAnimation([&] { state.selectedColor.set(SomeColor(color)); });
            });
        },
        [weak] {
            platform::mainQueue().async([weak] {
                if (weak)
                    weak->m_colorPickerState.eyedropperShowing.set(false);
            });
        });
}

void FVColorPickerServiceViewController::subscribeToFavorites()
{
    m_favoritesCancellable =
        m_colorPickerState.favoriteColors.publisher().sink([this](const ColorPickerState::ColorList &colors) {
            m_favoritesStore.saveFavoriteColors(colors, m_colorPickerState.showsAlpha());
        });
}

void FVColorPickerServiceViewController::setSelectedColor(const std::optional<platform::Color> &color,
                                                          const std::optional<std::string> &colorspace)
{
    m_programmaticallySettingSelectedColor = true;
    std::optional<SomeColor> selected;
    if (color) {
        const auto named = colorspace ? model::colorSpaceFromPlatformName(*colorspace) : std::nullopt;
        selected = SomeColor(*color, named ? *named : model::deviceDefaultColorSpace());
        if (!m_colorPickerState.showsAlpha())
            selected = selected->setting(SomeColor::Component::a, 1.0);
    }
    m_colorPickerState.selectedColor.set(selected);
    m_programmaticallySettingSelectedColor = false;
}

void FVColorPickerServiceViewController::setConfiguration(const remote::Configuration &configuration)
{
    auto &state = m_colorPickerState;
    state.enableDarkGrid.set(configuration.shouldUseDarkGridInDarkMode);
    state.title.set(configuration.title ? *configuration.title
                                        : platform::localizedString("Colors", "Used as headline for the color picker"));
    state.allowsNoColor.set(configuration.allowsNoColor);
    if (!state.allowsNoColor() && !state.hasSelectedColor())
        selectFallbackColor();
    applyAlphaMode(configuration.showsAlpha);
    if (state.showsEyedropper() != configuration.showsEyedropper)
        state.showsEyedropper.set(configuration.showsEyedropper);
    applySuggestedColors(configuration.suggestedColors);
    applyGridStyle(configuration.userInterfaceStyleForGrid);
    if (state.isEmbedded() != configuration.isEmbedded)
        state.isEmbedded.set(configuration.isEmbedded);
}

void FVColorPickerServiceViewController::selectFallbackColor()
{
    const platform::Color color = m_colorPickerState.fallbackColor().platformColor();
    const auto name = color.colorSpace() ? color.colorSpace()->name() : std::nullopt;
    setSelectedColor(color, name ? *name : std::string(platformName(model::deviceDefaultColorSpace())));
}

void FVColorPickerServiceViewController::applyAlphaMode(bool showsAlpha)
{
    if (m_colorPickerState.showsAlpha() == showsAlpha)
        return;
    // In this order: the list is saved when it is assigned, and saving an opaque-only list in the old mode would delete
    // the translucent favorites.
    m_colorPickerState.showsAlpha.set(showsAlpha);
    m_colorPickerState.favoriteColors.set(m_favoritesStore.favoriteColors(showsAlpha));
}

void FVColorPickerServiceViewController::applySuggestedColors(const std::optional<std::vector<platform::Color>> &colors)
{
    std::optional<ColorPickerState::ColorList> suggested;
    if (colors) {
        suggested.emplace();
        suggested->reserve(colors->size());
        for (const platform::Color &color : *colors)
            suggested->push_back(SomeColor(color, SomeColor::ColorSpace::sRGB));
    }
    if (m_colorPickerState.suggestedColors() != suggested)
        m_colorPickerState.suggestedColors.set(std::move(suggested));
}

void FVColorPickerServiceViewController::applyGridStyle(std::int32_t style)
{
    switch (static_cast<platform::UserInterfaceStyle>(style)) {
    case platform::UserInterfaceStyle::Unspecified:
        m_colorPickerState.overrideColorScheme.set(std::nullopt);
        break;
    case platform::UserInterfaceStyle::Light:
        m_colorPickerState.overrideColorScheme.set(ColorScheme::Light);
        break;
    case platform::UserInterfaceStyle::Dark:
        m_colorPickerState.overrideColorScheme.set(ColorScheme::Dark);
        break;
    }
}

void FVColorPickerServiceViewController::prepareForDisplay(std::function<void()> completion)
{
    if (completion)
        completion();
}

void FVColorPickerServiceViewController::colorPickerDidFinish()
{
    if (auto *parent = front())
        parent->colorPickerDidFinish();
}

void FVColorPickerServiceViewController::setIsPresentedAsPopover(bool popover)
{
    if (m_colorPickerState.isPopover() != popover)
        m_colorPickerState.isPopover.set(popover);
}

void FVColorPickerServiceViewController::setIsLandscape(bool landscape)
{
    if (m_colorPickerState.useLandscapeLayout() != landscape)
        m_colorPickerState.useLandscapeLayout.set(landscape);
}

void FVColorPickerServiceViewController::reloadPersistedValues()
{
    auto stored = m_favoritesStore.favoriteColors(m_colorPickerState.showsAlpha());
    if (stored != m_colorPickerState.favoriteColors())
        m_colorPickerState.favoriteColors.set(std::move(stored));
    const auto name = m_defaults.string(m_selectedTabUserDefaultsKey);
    const auto tab = name ? tabFromRawValue(*name) : std::nullopt;
    if (tab && *tab != m_colorPickerState.selectedTab())
        m_colorPickerState.selectedTab.set(*tab);
}

} // namespace favrin::service

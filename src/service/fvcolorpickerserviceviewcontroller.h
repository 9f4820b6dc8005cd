#pragma once

#include "platform/observation/publisher.h"
#include "platform/viewcontroller/viewcontroller.h"
#include "service/colorpickerstate.h"
#include "service/favoritesstore.h"
#include "service/hostedpickermessages.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace favrin::service {

/**
 * Hosts the picker's views and connects them to the rest: owns the state and the favorites store of one presentation,
 * writes what the host says into the state, and reports what the user does to its parent, the front.
 *
 * The intrinsic size of its view is the view's implicit size. Main thread only.
 */
class FVColorPickerServiceViewController : public platform::ViewController, public FVColorPickerRemoteViewController
{
    Q_OBJECT

public:
    /** Makes the root view on the state; the state outlives the view. */
    using RootViewFactory = std::function<std::unique_ptr<QQuickItem>(ColorPickerState *)>;

    /** Lets the front create hosted pickers that show what @p makeRootView makes. */
    static void registerClass(RootViewFactory makeRootView);

    explicit FVColorPickerServiceViewController(RootViewFactory makeRootView,
                                                platform::UserDefaults &defaults = platform::UserDefaults::standard());
    ~FVColorPickerServiceViewController() override;

    ColorPickerState &colorPickerState() { return m_colorPickerState; }
    /** The picker shows nothing private and may be shown over a lock screen. */
    bool canShowWhileLocked() const { return true; }

    void setSelectedColor(const std::optional<platform::Color> &color,
                          const std::optional<std::string> &colorspace) override;
    void setConfiguration(const remote::Configuration &configuration) override;
    void prepareForDisplay(std::function<void()> completion) override;
    void colorPickerDidFinish() override;
    void setIsPresentedAsPopover(bool popover) override;
    void setIsLandscape(bool landscape) override;
    void reloadPersistedValues() override;

protected:
    std::unique_ptr<QQuickItem> loadView() override;
    void viewWillAppear() override;
    void viewDidDisappear() override;
    void viewWillLayoutSubviews() override;
    void viewDidLayoutSubviews() override;

private:
    /** The parent when it is the front; looked up at each send. */
    HostedPickerParent *front() const;

    void subscribeToPicks();
    void restoreSelectedTab();
    void subscribeToSelectedTab();
    void subscribeToEyedropper();
    void subscribeToFavorites();
    void showEyedropper();

    void applyAlphaMode(bool showsAlpha);
    void applySuggestedColors(const std::optional<std::vector<platform::Color>> &colors);
    void applyGridStyle(std::int32_t style);
    void selectFallbackColor();

    static constexpr std::string_view m_selectedTabUserDefaultsKey = "selectedTab";
    RootViewFactory m_makeRootView;
    platform::UserDefaults &m_defaults;
    FavoritesStore m_favoritesStore;
    ColorPickerState m_colorPickerState;
    platform::Subscription m_finalColorSubscriber;
    platform::Subscription m_favoritesCancellable;
    platform::Subscription m_eyedropperShowingCancellable;
    platform::Subscription m_eyedropperFloatingCancellable;
    platform::Subscription m_selectedTabCancellable;
    bool m_programmaticallySettingSelectedColor = false;
};

} // namespace favrin::service

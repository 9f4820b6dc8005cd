#pragma once

#include "platform/viewcontroller/viewcontroller.h"
#include "service/eyedroppersession.h"
#include "service/hostedpickermessages.h"
#include "service/remotehostprovider.h"

#include <optional>

namespace favrin::service {

class InputShield;

/**
 * The principal controller of the service, one per presentation: the only one that talks to the host. It embeds the
 * hosted picker, relays between it and the host, and owns what lies around it: the background effect, the room for the
 * host's keyboard and the preferred content size.
 *
 * There is no main menu that a remote view could contribute commands to, and nothing is contributed. The whole surface
 * takes input, its transparent parts too. Main thread only. All lengths are in points.
 */
class FVColorPickerServiceFront : public platform::ViewController,
                                  public remote::RemoteViewController,
                                  public HostedPickerParent
{
    Q_OBJECT

public:
    explicit FVColorPickerServiceFront(RemoteHostProvider host);
    ~FVColorPickerServiceFront() override;

    /** The picker shows nothing private and may be shown over a lock screen. */
    bool canShowWhileLocked() const { return true; }
    /** The hosted picker; null before the view is loaded, or when its class is not registered. */
    ViewController *childViewController() const { return m_childViewController; }
    /** The last record that the host sent. */
    const std::optional<remote::Configuration> &configuration() const { return m_configuration; }
    /** To be called when the texts of the process are those of another language. */
    void localeDidChange();
    /** Height at the bottom that is left free for the host's keyboard. */
    double keyboardSpace() const;
    /** None at first; the host is told of every change. */
    remote::BackgroundEffect backgroundEffect() const { return m_backgroundEffect; }

    /** The eyedropper's way to this front: whoever reaches the eyedropper service reports to it. */
    EyedropperSession &eyedropper() { return m_eyedropper; }
    /** False while the eyedropper has the user's attention. */
    bool isInteractionEnabled() const { return m_interactionEnabled; }

    /** To be called right before a picker that was made ahead of time is presented. */
    void reloadPersistedValues();

    // From the host.
    void setSelectedColor(const std::optional<platform::Color> &color,
                          const std::optional<std::string> &colorspace) override;
    void setConfiguration(const remote::Configuration &configuration) override;
    void prepareForDisplay(std::function<void()> completion) override;

    // From the host and from the hosted picker alike.
    void colorPickerDidFinish() override;

    // From the hosted picker.
    void pickerDidSelectColor(const std::optional<platform::Color> &color, bool isVolatile) override;
    void pickerDidShowEyedropper(EyedropperSelectionBlock selectionBlock, EyedropperDismissBlock dismissBlock) override;
    void pickerDidFloatEyeDropper() override;
    void pickerDidCancelEyeDropper() override;
    void updatePreferredContentSize() override;

protected:
    std::unique_ptr<QQuickItem> loadView() override;
    void viewWillLayoutSubviews() override;
    void viewDidLayoutSubviews() override;
    void traitsDidChange(const std::optional<platform::TraitCollection> &previous) override;

private:
    /** The hosted picker's messages, the view loaded first; null when there is no hosted picker. */
    FVColorPickerRemoteViewController *loadedChild();
    bool isPresentedAsPopover() const;
    void updateBackground();
    QSizeF hostWindowSize() const;
    void setInteractionEnabled(bool enabled);
    void tellPreferredContentSize();

    RemoteHostProvider m_host;
    ViewController *m_childViewController = nullptr;
    /** The same controller as what this front knows of it: its messages. */
    FVColorPickerRemoteViewController *m_child = nullptr;
    InputShield *m_inputShield = nullptr;
    bool m_interactionEnabled = true;
    EyedropperSession m_eyedropper;
    std::optional<remote::Configuration> m_configuration;
    remote::BackgroundEffect m_backgroundEffect = remote::BackgroundEffect::None;
};

} // namespace favrin::service

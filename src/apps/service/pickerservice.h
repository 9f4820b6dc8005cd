#pragma once

#include "apps/service/focusborder.h"
#include "remote/client/remoteviewconnection.h"

#include <QObject>

#include <memory>
#include <optional>

class QQuickWindow;

namespace favrin::service {
class FVColorPickerServiceFront;
}

namespace favrin::apps {

/**
 * One presentation of the picker in this process: waits for the host's traits and for the views to be loaded, builds
 * the front and its views, and shows its window when the host presents. Main thread.
 */
class PickerService : public QObject, private remote::client::RemoteViewConnectionDelegate
{
    Q_OBJECT

public:
    /** Connects on Qt's Wayland connection; what comes in waits for the event loop. */
    explicit PickerService(wl_display *display);
    ~PickerService() override;

    /** The picker's view can be made from now on. What the host said meanwhile, beside its traits, was kept. */
    void viewsDidLoad();

Q_SIGNALS:
    /** The other end is no host of ours. */
    void hostIsMissing() override;

private:
    void traitsDidChange(const remote::Traits &traits) override;
    void shouldPresent() override;
    void focusWillEnter(remote::FocusDirection direction) override;
    void presentationWillEnd() override;
    remote::RemoteViewController *remoteViewController() override;

    void applySurroundings(const remote::Traits &traits);
    void applyTraits();
    void build();
    void warmUp();
    void settleBeforePresenting();
    void followWindowSize();
    bool passFocusOn(remote::FocusDirection direction);

    remote::client::RemoteViewConnection m_connection;
    bool m_viewsAreLoaded = false;
    std::optional<remote::Traits> m_traits;
    std::unique_ptr<service::FVColorPickerServiceFront> m_front;
    std::unique_ptr<QQuickWindow> m_window;
    std::unique_ptr<FocusBorder> m_focusBorder;
};

} // namespace favrin::apps

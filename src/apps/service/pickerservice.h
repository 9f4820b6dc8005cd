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
 * One presentation of the picker in this process: waits for the host's traits, builds the front and its views, and
 * shows its window when the host presents. Main thread.
 */
class PickerService : public QObject, private remote::client::RemoteViewConnectionDelegate
{
    Q_OBJECT

public:
    /** Connects on Qt's Wayland connection. */
    explicit PickerService(wl_display *display);
    ~PickerService() override;

    /** False when the other end is no host of ours. */
    bool connectToHost();

private:
    void traitsDidChange(const remote::Traits &traits) override;
    void shouldPresent() override;
    void focusWillEnter(remote::FocusDirection direction) override;
    void presentationWillEnd() override;
    remote::RemoteViewController *remoteViewController() override;

    void applySurroundings(const remote::Traits &traits);
    void build();
    void warmUp();
    void settleBeforePresenting();
    void followWindowSize();
    bool passFocusOn(remote::FocusDirection direction);

    remote::client::RemoteViewConnection m_connection;
    std::optional<remote::Traits> m_traits;
    std::unique_ptr<service::FVColorPickerServiceFront> m_front;
    std::unique_ptr<QQuickWindow> m_window;
    std::unique_ptr<FocusBorder> m_focusBorder;
};

} // namespace favrin::apps

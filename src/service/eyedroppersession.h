#pragma once

#include "service/eyedropperclient.h"
#include "service/remotehostprovider.h"

#include <functional>
#include <memory>
#include <string>

namespace favrin::service {

using EyedropperSelectionBlock = std::function<void(const platform::Color &)>;
using EyedropperDismissBlock = std::function<void()>;

/**
 * The front's side of the eyedropper: asks the service for it, keeps the picker from being touched meanwhile, and
 * passes what comes back to the host and to whoever asked. Main thread only.
 */
class EyedropperSession : public EyedropperClientDelegate
{
public:
    /** @p setInteractionEnabled lets the user touch the picker, or not. */
    EyedropperSession(RemoteHostProvider host, std::function<void(bool)> setInteractionEnabled);
    ~EyedropperSession() override;

    /** The way to the service; without one the eyedropper is dismissed as soon as it is asked for. */
    void setClient(std::unique_ptr<EyedropperClient> client);
    /** Hardware identifier of the display that shows the picker. */
    void setDisplayIdentifier(std::string identifier);

    /** The actions are kept until the eyedropper is dismissed; they replace those of an earlier request. */
    void show(EyedropperSelectionBlock selectionBlock, EyedropperDismissBlock dismissBlock);
    void floatEyedropper();
    void cancel();

    void eyedropperDidSelectColor(const platform::Color &color) override;
    void eyedropperDidFloat() override;
    void eyedropperDidDismiss() override;

private:
    RemoteHostProvider m_host;
    std::function<void(bool)> m_setInteractionEnabled;
    std::unique_ptr<EyedropperClient> m_client;
    std::string m_displayIdentifier;
    EyedropperSelectionBlock m_selectionBlock;
    EyedropperDismissBlock m_dismissBlock;
};

} // namespace favrin::service

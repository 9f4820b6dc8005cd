#include "service/eyedroppersession.h"

#include "remote/remotehost.h"

#include <utility>

namespace favrin::service {

EyedropperSession::EyedropperSession(RemoteHostProvider host, std::function<void(bool)> setInteractionEnabled)
    : m_host(std::move(host)), m_setInteractionEnabled(std::move(setInteractionEnabled))
{
}

EyedropperSession::~EyedropperSession() = default;

void EyedropperSession::setClient(std::unique_ptr<EyedropperClient> client)
{
    m_client = std::move(client);
}

void EyedropperSession::setDisplayIdentifier(std::string identifier)
{
    m_displayIdentifier = std::move(identifier);
}

void EyedropperSession::show(EyedropperSelectionBlock selectionBlock, EyedropperDismissBlock dismissBlock)
{
    m_setInteractionEnabled(false);
    if (m_client)
        m_client->invoke(m_displayIdentifier);
    if (auto *host = m_host())
        host->pickerDidShowEyedropper();
    m_selectionBlock = std::move(selectionBlock);
    m_dismissBlock = std::move(dismissBlock);

    // Only the service's dismissal lets the user touch the picker again. With nobody to send it the picker would stay
    // locked for ever, so this side sends it.
    if (!m_client)
        eyedropperDidDismiss();
}

void EyedropperSession::floatEyedropper()
{
    if (m_client)
        m_client->floatEyedropper();
}

void EyedropperSession::cancel()
{
    if (m_client)
        m_client->cancel();
}

void EyedropperSession::eyedropperDidSelectColor(const platform::Color &color)
{
    // The host hears of the color twice: here without the name of its space, and once more when the state has it.
    if (auto *host = m_host())
        host->pickerDidSelectColor(color, std::nullopt, false);
    if (m_selectionBlock)
        m_selectionBlock(color);
}

void EyedropperSession::eyedropperDidFloat()
{
    if (auto *host = m_host())
        host->pickerDidFloatEyedropper();
}

void EyedropperSession::eyedropperDidDismiss()
{
    m_setInteractionEnabled(true);
    if (auto *host = m_host())
        host->pickerDidDismissEyedropper();
    if (m_dismissBlock)
        m_dismissBlock();
    m_selectionBlock = nullptr;
    m_dismissBlock = nullptr;
}

} // namespace favrin::service

#include "service/fvcolorpickerservicefront.h"

#include "service/colorpickerlog.h"
#include "service/inputshield.h"
#include "service/preferredcontentsize.h"

#include <QQuickItem>

#include <algorithm>

namespace favrin::service {

FVColorPickerServiceFront::FVColorPickerServiceFront(RemoteHostProvider host)
    : m_host(host ? std::move(host) : [] { return nullptr; })
    , m_eyedropper(m_host, [this](bool enabled) { setInteractionEnabled(enabled); })
{
    connect(this, &ViewController::preferredContentSizeChanged, this,
            &FVColorPickerServiceFront::tellPreferredContentSize);
}

FVColorPickerServiceFront::~FVColorPickerServiceFront() = default;

std::unique_ptr<QQuickItem> FVColorPickerServiceFront::loadView()
{
    auto root = std::make_unique<QQuickItem>();
    m_inputShield = new InputShield(root.get());
    m_inputShield->setRaised(!m_interactionEnabled);

    if (auto child = platform::viewcontrollerregistry::create(hostedPickerClassName)) {
        m_childViewController = addChild(std::move(child));
        m_child = dynamic_cast<FVColorPickerRemoteViewController *>(m_childViewController);
        m_childViewController->view()->setParentItem(root.get());
        m_childViewController->didMoveToParent(this);
    } else {
        colorPickerLog().error("No hosted picker is registered; the picker stays empty");
    }
    updateBackground();
    return root;
}

void FVColorPickerServiceFront::viewWillLayoutSubviews()
{
    ViewController::viewWillLayoutSubviews();
    const QSizeF room = view()->size();
    m_inputShield->setSize(room);
    if (m_childViewController)
        m_childViewController->view()->setSize({room.width(), std::max(0.0, room.height() - keyboardSpace())});
}

void FVColorPickerServiceFront::viewDidLayoutSubviews()
{
    ViewController::viewDidLayoutSubviews();
    updatePreferredContentSize();
}

void FVColorPickerServiceFront::traitsDidChange(const std::optional<platform::TraitCollection> &previous)
{
    ViewController::traitsDidChange(previous);
    if (!previous || previous->presentationContext != traits().presentationContext)
        updateBackground();
}

bool FVColorPickerServiceFront::isPresentedAsPopover() const
{
    return traits().presentationContext == platform::PresentationContext::Popover;
}

void FVColorPickerServiceFront::updateBackground()
{
    const bool popover = isPresentedAsPopover();
    const bool hostsOwn = popover || (m_configuration && m_configuration->isEmbedded);
    const auto effect = hostsOwn ? remote::BackgroundEffect::None : remote::BackgroundEffect::ThickMaterial;
    if (effect != m_backgroundEffect) {
        m_backgroundEffect = effect;
        if (auto *host = m_host())
            host->backgroundEffectDidChange(effect);
    }
    if (m_child)
        m_child->setIsPresentedAsPopover(popover);
}

QSizeF FVColorPickerServiceFront::hostWindowSize() const
{
    using preferredcontentsize::saneLength;
    if (!m_configuration)
        return {0.0, 0.0};
    return {saneLength(m_configuration->hostWindowWidth), saneLength(m_configuration->hostWindowHeight)};
}

double FVColorPickerServiceFront::keyboardSpace() const
{
    return m_configuration ? preferredcontentsize::saneLength(m_configuration->keyboardSpace) : 0.0;
}

void FVColorPickerServiceFront::updatePreferredContentSize()
{
    using namespace preferredcontentsize;
    const QSizeF hostWindow = hostWindowSize();
    const bool landscape =
        isLandscape(hostWindow, isPresentedAsPopover() ? Presentation::Popover : Presentation::Other);
    if (m_child)
        m_child->setIsLandscape(landscape);
    const auto *childView = m_childViewController ? m_childViewController->view() : nullptr;
    const QSizeF intrinsic = childView ? QSizeF(childView->implicitWidth(), childView->implicitHeight()) : QSizeF(0, 0);
    const QSizeF size = wanted(landscape, intrinsic, hostWindow);
    if (isWorthChanging(preferredContentSize(), size))
        setPreferredContentSize(size);
}

void FVColorPickerServiceFront::tellPreferredContentSize()
{
    if (auto *host = m_host())
        host->preferredContentSizeDidChange(preferredContentSize().width(), preferredContentSize().height());
}

void FVColorPickerServiceFront::setInteractionEnabled(bool enabled)
{
    m_interactionEnabled = enabled;
    if (m_inputShield)
        m_inputShield->setRaised(!enabled);
}

} // namespace favrin::service

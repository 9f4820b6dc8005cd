#include "apps/service/pickerservice.h"

#include "eyedropper/busconnection.h"
#include "eyedropper/client/dbuseyedropperclient.h"
#include "platform/color/displaygamut.h"
#include "platform/strings/translationtable.h"
#include "remote/limits.h"
#include "service/displaycolor.h"
#include "service/fvcolorpickerservicefront.h"
#include "theme/theme.h"

#include <QGuiApplication>
#include <QLocale>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSurfaceFormat>
#include <QTimer>

#include <chrono>

namespace favrin::apps {

namespace {

using namespace std::chrono_literals;

/** Nobody presents for so long: then this service was started ahead of time. */
constexpr auto quietTime = 100ms;
/** Points; what a picker asks for when it knows nothing of its host yet. */
constexpr QSize usualSize(360, 560);

platform::TraitCollection traitCollection(const remote::Traits &traits)
{
    const bool dark = traits.appearance == remote::Appearance::Dark;
    return {.presentationContext = static_cast<platform::PresentationContext>(traits.presentationContext),
            .userInterfaceStyle = dark ? platform::UserInterfaceStyle::Dark : platform::UserInterfaceStyle::Light};
}

} // namespace

PickerService::PickerService(wl_display *display) : m_connection(display, *this) {}

PickerService::~PickerService() = default;

remote::RemoteViewController *PickerService::remoteViewController()
{
    return m_front.get();
}

void PickerService::traitsDidChange(const remote::Traits &traits)
{
    applySurroundings(traits);
    m_traits = traits;
    if (m_front)
        applyTraits();
    else if (m_viewsAreLoaded)
        build();
}

void PickerService::viewsDidLoad()
{
    m_viewsAreLoaded = true;
    if (m_traits)
        build();
}

void PickerService::applyTraits()
{
    m_front->eyedropper().setDisplayIdentifier(m_traits->displayIdentifier);
    m_front->setTraits(traitCollection(*m_traits));
}

void PickerService::warmUp()
{
    // A service that was started ahead of time draws once for nobody: fonts, glyphs and pictures are then there.
    if (m_window->isVisible())
        return;
    if (m_window->size().isEmpty()) {
        m_window->resize(usualSize);
        m_front->view()->setSize(usualSize);
    }
    m_window->grabWindow();
}

void PickerService::applySurroundings(const remote::Traits &traits)
{
    const bool p3 = traits.displayGamut == remote::DisplayGamut::P3;
    // The default space of the device is decided once, by the first color that is made.
    if (!m_traits)
        platform::setDisplayGamut(p3 ? platform::DisplayGamut::P3 : platform::DisplayGamut::SRGB);
    service::DisplayColor::instance().setSurfaceColorSpace(p3 ? model::SomeColor::ColorSpace::displayP3
                                                              : model::SomeColor::ColorSpace::sRGB);
    if (!m_traits || m_traits->locale != traits.locale) {
        const auto name = QString::fromStdString(traits.locale);
        QLocale::setDefault(name.isEmpty() ? QLocale::system() : QLocale(name));
        // By the name itself: what the library knows no numbers and dates for may still have a translation.
        platform::installTranslations(name.isEmpty() ? QLocale().bcp47Name() : name);
        theme::Theme::instance().noteLocaleChanged();
        if (m_front)
            m_front->localeDidChange();
    }
    const auto direction =
        traits.layoutDirection == remote::LayoutDirection::RightToLeft ? Qt::RightToLeft : Qt::LeftToRight;
    QGuiApplication::setLayoutDirection(direction);
    auto &theme = theme::Theme::instance();
    theme.setColorScheme(traits.appearance == remote::Appearance::Dark ? service::ColorScheme::Dark
                                                                       : service::ColorScheme::Light);
    theme.setTextSizeCategory(static_cast<theme::TextSizeCategory>(traits.textSizeCategory));
    theme.setIncreaseContrast(traits.increaseContrast);
    theme.setReduceMotion(traits.reduceMotion);
    theme.setLayoutDirection(direction);
}

void PickerService::build()
{
    m_front = std::make_unique<service::FVColorPickerServiceFront>([this] { return &m_connection; });
    // It connects with the first use. Where there can be no bus, nobody could ever dismiss an eyedropper.
    if (eyedropper::BusConnection::sessionBusMayExist())
        m_front->eyedropper().setClient(std::make_unique<eyedropper::DBusEyedropperClient>(m_front->eyedropper()));
    m_window = std::make_unique<QQuickWindow>();
    m_window->setFlag(Qt::FramelessWindowHint);
    m_window->setColor(Qt::transparent);
    auto format = m_window->format();
    format.setAlphaBufferSize(8);
    m_window->setFormat(format);
    // The platform plugin fails on absurd sizes; these bound what it will accept from the host.
    m_window->setMinimumSize(QSize(1, 1));
    m_window->setMaximumSize(QSize(remote::limits::largestSurface, remote::limits::largestSurface));
    m_front->view()->setParentItem(m_window->contentItem());
    m_focusBorder = std::make_unique<FocusBorder>(
        *m_window, [this](remote::FocusDirection direction) { return passFocusOn(direction); });
    connect(m_window.get(), &QQuickWindow::widthChanged, this, &PickerService::followWindowSize);
    connect(m_window.get(), &QQuickWindow::heightChanged, this, &PickerService::followWindowSize);
    connect(m_front.get(), &service::FVColorPickerServiceFront::preferredContentSizeChanged, this,
            &PickerService::settleBeforePresenting);
    applyTraits();
    m_connection.sendReady();
    m_connection.deliverEvents();
    QTimer::singleShot(quietTime, this, &PickerService::warmUp);
}

void PickerService::settleBeforePresenting()
{
    // The height of the picker depends on its width. While nothing is shown, the front takes the size it asks for, so
    // that the host knows the right size, and the first frame has it, before anything is on screen.
    if (m_window->isVisible() || m_front->preferredContentSize().isEmpty())
        return;
    m_window->resize(m_front->preferredContentSize().toSize());
    m_front->view()->setSize(m_front->preferredContentSize());
    m_front->layoutNow();
}

void PickerService::followWindowSize()
{
    if (m_window->isVisible())
        m_front->view()->setSize(QSizeF(m_window->size()));
}

void PickerService::shouldPresent()
{
    if (!m_front || m_window->isVisible())
        return;
    m_front->reloadPersistedValues();
    m_front->setAppeared(true);
    m_window->show();
    // Keys go to the picker's root view, which passes Tab on and ends the presentation on Escape.
    if (auto *picker = m_front->childViewController())
        picker->view()->forceActiveFocus();
}

void PickerService::focusWillEnter(remote::FocusDirection direction)
{
    if (m_focusBorder)
        m_focusBorder->enter(direction);
}

bool PickerService::passFocusOn(remote::FocusDirection direction)
{
    // A picker that lies over the host's content keeps the focus until it goes.
    if (m_traits->presentationContext != remote::PresentationContext::Embedded)
        return false;
    m_connection.sendFocusDidLeave(direction);
    return true;
}

void PickerService::presentationWillEnd()
{
    // A gesture that the end cuts off reports its last color as final.
    if (m_front)
        m_front->setAppeared(false);
}

} // namespace favrin::apps

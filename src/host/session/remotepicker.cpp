#include "host/session/remotepicker.h"

#include "eyedropper/displayidentifier.h"
#include "eyedropper/eyedropperavailability.h"
#include "host/session/remoteviewsession.h"
#include "host/session/serviceahead.h"
#include "host/session/servicewatch.h"

#include <QEvent>
#include <QGuiApplication>
#include <QInputMethod>
#include <QPalette>
#include <QPointer>
#include <QScreen>
#include <QWindow>

#include <utility>

namespace favrin::host {

using namespace std::chrono_literals;

namespace {

/** A service that was told of the end and does not confirm it is left behind. */
constexpr auto farewellPatience = 500ms;

remote::PresentationContext contextOf(PresentationStyle style)
{
    switch (style) {
    case PresentationStyle::Presented:
        return remote::PresentationContext::Presented;
    case PresentationStyle::Popover:
        return remote::PresentationContext::Popover;
    case PresentationStyle::Embedded:
        return remote::PresentationContext::Embedded;
    }
    return remote::PresentationContext::Unspecified;
}

std::string displayIdentifier(const QWindow *window)
{
    const QScreen *screen = window ? window->screen() : QGuiApplication::primaryScreen();
    return eyedropper::displayIdentifier(screen).toStdString();
}

/** The one question of this process, asked when the first picker wants to know. */
eyedropper::EyedropperAvailability &eyedropperAvailability()
{
    static QPointer<eyedropper::EyedropperAvailability> availability;
    if (!availability) {
        availability = new eyedropper::EyedropperAvailability({}, QCoreApplication::instance());
        availability->ask();
    }
    return *availability;
}

} // namespace

std::unique_ptr<Picker> Picker::create()
{
    return std::make_unique<RemotePicker>();
}

RemotePicker::RemotePicker(QObject *parent) : Picker(parent)
{
    m_farewell.setSingleShot(true);
    m_farewell.setInterval(farewellPatience);
    connect(&m_farewell, &QTimer::timeout, this, &RemotePicker::serviceFinished);
    // For its changes of palette, which have no signal.
    qGuiApp->installEventFilter(this);
    connect(qGuiApp, &QGuiApplication::layoutDirectionChanged, this, &RemotePicker::scheduleUpdate);
}

RemotePicker::~RemotePicker()
{
    tearDown();
}

bool RemotePicker::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::ApplicationPaletteChange)
        scheduleUpdate();
    return Picker::eventFilter(watched, event);
}

bool RemotePicker::isDark() const
{
    return traits().appearance == remote::Appearance::Dark;
}

remote::Traits RemotePicker::traits() const
{
    const QWindow *window = m_place ? m_place->window() : nullptr;
    remote::Traits traits;
    traits.presentationContext = m_place ? contextOf(m_place->style()) : remote::PresentationContext::Unspecified;
    traits.appearance = wishes().appearance;
    if (traits.appearance == remote::Appearance::Unspecified) {
        const bool dark = QGuiApplication::palette().color(QPalette::Window).lightnessF() < 0.5f;
        traits.appearance = dark ? remote::Appearance::Dark : remote::Appearance::Light;
    }
    const auto direction = wishes().layoutDirection.value_or(QGuiApplication::layoutDirection());
    traits.layoutDirection =
        direction == Qt::RightToLeft ? remote::LayoutDirection::RightToLeft : remote::LayoutDirection::LeftToRight;
    traits.textSizeCategory = wishes().textSizeCategory;
    traits.displayGamut = wishes().displayGamut;
    traits.displayIdentifier = displayIdentifier(window);
    traits.locale = wishes().locale.value_or(QLocale()).bcp47Name().toStdString();
    traits.reduceMotion = wishes().reduceMotion;
    traits.increaseContrast = wishes().increaseContrast;
    return traits;
}

QSizeF RemotePicker::hostWindowSize() const
{
    if (wishes().hostWindowSize)
        return *wishes().hostWindowSize;
    return m_place ? m_place->surroundingSize() : QSizeF(0, 0);
}

double RemotePicker::keyboardSpace() const
{
    if (wishes().keyboardSpace)
        return *wishes().keyboardSpace;
    const auto *inputMethod = QGuiApplication::inputMethod();
    if (!m_place || !inputMethod->isVisible())
        return 0;
    const QRectF keyboard = inputMethod->keyboardRectangle();
    if (keyboard.isEmpty())
        return 0;
    return std::max(0.0, m_place->rectangle().bottom() - keyboard.top());
}

bool RemotePicker::isEyedropperAvailable()
{
    auto &availability = eyedropperAvailability();
    if (!std::exchange(m_watchesEyedropper, true))
        connect(&availability, &eyedropper::EyedropperAvailability::changed, this,
                &RemotePicker::eyedropperAvailableChanged);
    return availability.isAvailable();
}

qint64 RemotePicker::serviceProcessIdentifier() const
{
    return m_session ? m_session->processIdentifier() : 0;
}

void RemotePicker::present(const MakePlace &makePlace)
{
    if (isPresented())
        return;
    tearDown();
    m_place = makePlace();
    setEmbedded(m_place->style() == PresentationStyle::Embedded);
    QString error;
    m_session = ServiceAhead::instance().take(traits(), &error);
    setState(State::Starting);
    if (!m_session) {
        // Reported in a later turn, like any other end of a service.
        QMetaObject::invokeMethod(
            this, [this, error] { serviceEnded(error); }, Qt::QueuedConnection);
        return;
    }
    connectSession();
    connectSurroundings();
    m_place->setAppearance(isDark());
    sendUpdate();
    if (m_selectedColorIsSet)
        setSelectedColor(m_selectedColor);
    m_session->server().sendPrepareForDisplay(++m_serial);
    m_session->flush();
}

void RemotePicker::connectSession()
{
    auto *session = m_session.get();
    connect(session, &RemoteViewSession::prepared, this, &RemotePicker::servicePrepared);
    connect(session, &RemoteViewSession::frameArrived, this, &RemotePicker::serviceDrew);
    connect(session, &RemoteViewSession::pickerDidSelectColor, this,
            [this](const auto &color, const auto &colorspace, bool isVolatile) {
                m_selectedColor = color;
                m_selectedColorIsSet = true;
                Q_EMIT picked(color, colorspace, isVolatile);
            });
    connect(session, &RemoteViewSession::pickerDidShowEyedropper, this, &RemotePicker::eyedropperShown);
    connect(session, &RemoteViewSession::pickerDidFloatEyedropper, this, &RemotePicker::eyedropperFloated);
    connect(session, &RemoteViewSession::pickerDidDismissEyedropper, this, &RemotePicker::eyedropperDismissed);
    // The session must not go while it speaks; and when its last word is heard, another one may be shown already.
    connect(
        session, &RemoteViewSession::colorPickerDidFinish, this,
        [this, session] {
            if (m_session.get() == session)
                serviceFinished();
        },
        Qt::QueuedConnection);
    connect(
        session, &RemoteViewSession::ended, this,
        [this, session](const QString &error) {
            if (m_session.get() == session)
                serviceEnded(error);
        },
        Qt::QueuedConnection);
    connect(session, &RemoteViewSession::preferredContentSizeDidChange, this, &RemotePicker::followService);
    connect(session, &RemoteViewSession::backgroundEffectDidChange, this, &RemotePicker::followService);
    m_watch = std::make_unique<ServiceWatch>(*session);
    connect(m_watch.get(), &ServiceWatch::respondingChanged, this, &RemotePicker::respondingChanged);
    connect(m_watch.get(), &ServiceWatch::gaveUp, session, &RemoteViewSession::giveUp);
    followService();
}

void RemotePicker::followService()
{
    const bool material = m_session->backgroundEffect() == remote::BackgroundEffect::ThickMaterial;
    m_place->setPreferredContentSize(m_session->preferredContentSize());
    Q_EMIT preferredContentSizeChanged(m_session->preferredContentSize());
    Q_EMIT materialChanged(material);
}

void RemotePicker::connectSurroundings()
{
    connect(m_place.get(), &PickerPlace::dismissRequested, this, &RemotePicker::dismiss);
    connect(m_place.get(), &PickerPlace::wasLost, this, &RemotePicker::serviceFinished, Qt::QueuedConnection);
    const auto update = [this] {
        scheduleUpdate();
        Q_EMIT surroundingsChanged();
    };
    connect(m_place.get(), &PickerPlace::changed, this, update);
    const auto *inputMethod = QGuiApplication::inputMethod();
    connect(inputMethod, &QInputMethod::keyboardRectangleChanged, m_place.get(), update);
    connect(inputMethod, &QInputMethod::visibleChanged, m_place.get(), update);
}

void RemotePicker::scheduleUpdate()
{
    if (!isPresented() || !m_session || std::exchange(m_updateScheduled, true))
        return;
    QMetaObject::invokeMethod(this, &RemotePicker::sendUpdate, Qt::QueuedConnection);
}

void RemotePicker::sendUpdate()
{
    m_updateScheduled = false;
    if (!isPresented() || !m_session || m_session->hasEnded())
        return;
    auto now = traits();
    if (now != m_sentTraits) {
        m_session->server().sendTraits(now);
        m_sentTraits = std::move(now);
        m_place->setAppearance(isDark());
    }
    auto configuration = wishes().configuration;
    configuration.hostWindowWidth = hostWindowSize().width();
    configuration.hostWindowHeight = hostWindowSize().height();
    configuration.keyboardSpace = keyboardSpace();
    if (configuration != m_sentConfiguration) {
        m_session->server().sendConfiguration(configuration);
        m_sentConfiguration = std::move(configuration);
    }
    m_session->flush();
}

void RemotePicker::setSelectedColor(const std::optional<platform::Color> &color)
{
    m_selectedColor = color;
    m_selectedColorIsSet = true;
    if (!isPresented() || !m_session || m_session->hasEnded())
        return;
    // A configuration that waits was asked for before this color.
    sendUpdate();
    const auto space = color && color->colorSpace() ? color->colorSpace()->name() : std::nullopt;
    m_session->server().sendSelectedColor(color, space);
    m_session->flush();
}

void RemotePicker::servicePrepared(quint32 serial)
{
    if (serial != m_serial || state() != State::Starting)
        return;
    // The preferred size came before the answer, so the first frame has the right size already.
    m_place->setSession(m_session.get());
    m_place->takeFocus();
    m_session->server().sendPresent();
    m_session->flush();
}

void RemotePicker::serviceDrew()
{
    if (state() != State::Starting)
        return;
    m_place->reveal(!wishes().reduceMotion);
    setState(State::Ready);
}

void RemotePicker::dismiss()
{
    if (!isPresented())
        return;
    setState(State::Stopping);
    if (m_session && !m_session->hasEnded()) {
        m_session->server().sendColorPickerDidFinish();
        m_session->flush();
    }
    m_farewell.start();
}

void RemotePicker::serviceFinished()
{
    if (!isPresented() && state() != State::Stopping)
        return;
    tearDown();
    Q_EMIT respondingChanged(true);
    setState(State::NotRunning);
    Q_EMIT finished();
}

void RemotePicker::serviceEnded(const QString &error)
{
    if (state() == State::Stopping) {
        serviceFinished();
        return;
    }
    if (!isPresented())
        return;
    tearDown();
    Q_EMIT respondingChanged(true);
    setState(State::Failed);
    Q_EMIT terminated(error);
}

void RemotePicker::tearDown()
{
    m_farewell.stop();
    m_watch.reset();
    m_sentTraits.reset();
    m_sentConfiguration.reset();
    if (m_place)
        m_place->setSession(nullptr);
    m_place.reset();
    if (m_session) {
        m_session->disconnect(this);
        m_session.release()->abandon();
    }
}

} // namespace favrin::host

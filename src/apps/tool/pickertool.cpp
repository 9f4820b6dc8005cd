#include "apps/tool/pickertool.h"

#include "host/window/windowplace.h"

#include <QGuiApplication>
#include <QKeyEvent>

#include <algorithm>
#include <utility>

namespace favrin::tool {

using host::Picker;

namespace {

/** Until the picker has said what it needs; higher than wide, so that it lays itself out like that. */
constexpr QSize firstSize(360, 600);

std::optional<platform::Color> platformColor(const Choice &choice)
{
    return choice ? std::optional(choice->platformColor()) : std::nullopt;
}

Choice choiceOf(const std::optional<platform::Color> &color)
{
    return color ? Choice(*color) : std::nullopt;
}

} // namespace

PickerTool::PickerTool(ToolOptions options, std::unique_ptr<Picker> picker, Print print, Attach attach)
    : m_options(std::move(options)), m_print(std::move(print)), m_attach(std::move(attach)), m_picker(std::move(picker))
{
    configurePicker();
    m_timeout.setSingleShot(true);
    connect(&m_timeout, &QTimer::timeout, this, [this] { end(ExitStatus::TimedOut); });
    connect(m_picker.get(), &Picker::picked, this, [this](const auto &color, const auto &colorspace, bool isVolatile) {
        // The eyedropper's own report has no space; the same color follows with it.
        if (!color || colorspace)
            takePick(choiceOf(color), isVolatile);
    });
    connect(m_picker.get(), &Picker::finished, this, &PickerTool::finish);
    connect(m_picker.get(), &Picker::terminated, this,
            [this](const QString &error) { end(ExitStatus::Failed, error); });
    connect(m_picker.get(), &Picker::stateChanged, this, &PickerTool::show);
}

PickerTool::~PickerTool() = default;

void PickerTool::configurePicker()
{
    m_picker->change([this](host::PickerWishes &wishes) {
        auto &configuration = wishes.configuration;
        if (!m_options.title.isEmpty())
            configuration.title = m_options.title.toStdString();
        configuration.showsAlpha = m_options.allowsOpacity;
        configuration.allowsNoColor = m_options.allowsNoColor;
        if (m_options.suggestions.empty())
            return;
        auto &colors = configuration.suggestedColors.emplace();
        for (const auto &suggestion : m_options.suggestions)
            colors.push_back(suggestion.color.platformColor());
    });
    const auto offerEyedropper = [this] {
        m_picker->change([this](host::PickerWishes &wishes) {
            wishes.configuration.showsEyedropper = m_picker->isEyedropperAvailable();
        });
    };
    connect(m_picker.get(), &Picker::eyedropperAvailableChanged, this, offerEyedropper);
    offerEyedropper();
    if (!m_options.color)
        return;
    Choice color = *m_options.color;
    if (color && !m_options.allowsOpacity)
        color->a = 1.0;
    m_picker->setSelectedColor(platformColor(color));
}

void PickerTool::start()
{
    m_window = std::make_unique<host::RemoteViewWindow>();
    m_window->setFlags(Qt::Dialog);
    m_window->setTitle(m_options.title.isEmpty() ? QGuiApplication::applicationDisplayName() : m_options.title);
    m_window->resize(firstSize);
    m_window->installEventFilter(this);
    m_picker->present([this] { return std::make_unique<host::WindowPlace>(*m_window); });
    // While the picker starts: the display server is asked a dozen questions for it.
    m_window->create();
    if (m_options.timeout)
        m_timeout.start(*m_options.timeout);
}

void PickerTool::show()
{
    // The picker has drawn, so the window never appears empty.
    if (m_picker->state() != Picker::State::Ready || m_window->isVisible())
        return;
    m_window->show();
    if (m_attach)
        m_attach(*m_window);
}

bool PickerTool::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        m_escaped = static_cast<QKeyEvent *>(event)->key() == Qt::Key_Escape;
        break;
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
    case QEvent::TabletPress:
        m_escaped = false;
        break;
    case QEvent::Close:
        end(ExitStatus::Cancelled);
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

void PickerTool::takePick(const Choice &choice, bool isVolatile)
{
    if (!isVolatile)
        m_chosen = choice;
    if (m_options.reportsLive && !m_print(pickText(choice, nameOf(choice), isVolatile)))
        end(ExitStatus::Failed, QStringLiteral("the answer cannot be written"));
}

void PickerTool::finish()
{
    if (!m_chosen || m_escaped) {
        end(ExitStatus::Cancelled);
        return;
    }
    if (m_options.reportsLive || m_print(m_options.format.text(*m_chosen, nameOf(*m_chosen))))
        end(ExitStatus::Chosen);
    else
        end(ExitStatus::Failed, QStringLiteral("the answer cannot be written"));
}

void PickerTool::end(ExitStatus status, const QString &reason)
{
    if (std::exchange(m_ended, true))
        return;
    m_timeout.stop();
    Q_EMIT ended(status, reason);
}

std::string PickerTool::nameOf(const Choice &color) const
{
    const auto found = std::ranges::find_if(
        m_options.suggestions, [&color](const Suggestion &suggestion) { return Choice(suggestion.color) == color; });
    return found == m_options.suggestions.end() ? std::string() : found->name;
}

} // namespace favrin::tool

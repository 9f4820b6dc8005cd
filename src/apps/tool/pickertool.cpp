#include "apps/tool/pickertool.h"

#include <QGuiApplication>
#include <QKeyEvent>
#include <QPalette>
#include <QScreen>

#include <algorithm>
#include <utility>

namespace favrin::tool {

using model::SomeColor;

namespace {

/** Until the picker has said what it needs; higher than wide, so that it lays itself out like that. */
constexpr QSize firstSize(360, 600);

FVColor publicColor(const Choice &color)
{
    if (!color)
        return {};
    const auto space = model::platformName(color->colorSpace);
    return FVColor(color->r, color->g, color->b, color->a,
                   QString::fromUtf8(space.data(), static_cast<qsizetype>(space.size())));
}

Choice choiceOf(const FVColor &color)
{
    if (!color.isValid())
        return std::nullopt;
    const auto space = model::colorSpaceFromPlatformName(color.colorSpace().toStdString());
    return SomeColor(color.red(), color.green(), color.blue(), color.alpha(),
                     space.value_or(SomeColor::ColorSpace::sRGB));
}

} // namespace

PickerTool::PickerTool(ToolOptions options, Print print, Attach attach)
    : m_options(std::move(options)), m_print(std::move(print)), m_attach(std::move(attach))
{
    configurePicker();
    m_timeout.setSingleShot(true);
    connect(&m_timeout, &QTimer::timeout, this, [this] { end(ExitStatus::TimedOut); });
    connect(&m_picker, &FVColorPickerViewController::pickerDidSelectColor, this,
            [this](const FVColor &color, const QString &colorspace, bool isVolatile) {
                // The eyedropper's own report has no space; the same color follows with it.
                if (color.isValid() && colorspace.isEmpty())
                    return;
                takePick(color, isVolatile);
            });
    connect(&m_picker, &FVColorPickerViewController::colorPickerDidFinish, this, &PickerTool::finish);
    connect(&m_picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError, this,
            [this](const QString &error) { end(ExitStatus::Failed, error); });
    connect(&m_picker, &FVColorPickerViewController::preferredContentSizeChanged, this,
            &PickerTool::followPreferredSize);
    connect(&m_picker, &FVColorPickerViewController::stateChanged, this, &PickerTool::show);
}

PickerTool::~PickerTool() = default;

void PickerTool::configurePicker()
{
    if (!m_options.title.isEmpty())
        m_picker.setTitle(m_options.title);
    m_picker.setShowsAlpha(m_options.allowsOpacity);
    m_picker.setAllowsNoColor(m_options.allowsNoColor);
    const auto offerEyedropper = [this] { m_picker.setShowsEyedropper(m_picker.isEyedropperAvailable()); };
    connect(&m_picker, &FVColorPickerViewController::eyedropperAvailableChanged, this, offerEyedropper);
    offerEyedropper();
    if (m_options.color) {
        Choice color = *m_options.color;
        if (color && !m_options.allowsOpacity)
            color->a = 1.0;
        m_picker.setSelectedColor(publicColor(color));
    }
    QList<FVColor> colors;
    for (const auto &suggestion : m_options.suggestions)
        colors.append(publicColor(suggestion.color));
    if (!colors.isEmpty())
        m_picker.setSuggestedColors(colors);
}

void PickerTool::start()
{
    m_window = std::make_unique<QQuickWindow>();
    m_window->setFlags(Qt::Dialog);
    m_window->setTitle(m_options.title.isEmpty() ? QGuiApplication::applicationDisplayName() : m_options.title);
    m_window->setColor(QGuiApplication::palette().color(QPalette::Window));
    m_window->resize(firstSize);
    m_window->installEventFilter(this);
    m_picker.present(m_window.get());
    if (m_options.timeout)
        m_timeout.start(*m_options.timeout);
}

void PickerTool::followPreferredSize()
{
    const QSizeF preferred = m_picker.preferredContentSize();
    // Once it is on screen its size is the user's.
    if (preferred.isEmpty() || m_window->isVisible())
        return;
    const QScreen *screen = m_window->screen();
    m_window->resize(preferred.toSize().boundedTo(screen ? screen->availableSize() : firstSize));
}

void PickerTool::show()
{
    // The picker has drawn, so the window never appears empty.
    if (m_picker.state() != FVColorPickerViewController::State::Ready || m_window->isVisible())
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

void PickerTool::takePick(const FVColor &color, bool isVolatile)
{
    const Choice choice = choiceOf(color);
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

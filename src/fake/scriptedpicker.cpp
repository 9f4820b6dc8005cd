#include "fake/scriptedpicker.h"

#include "host/colorbridge.h"

#include <QQuickItem>
#include <QQuickWindow>

std::unique_ptr<favrin::host::Picker> favrin::host::Picker::create()
{
    return std::make_unique<fake::ScriptedPicker>();
}

namespace favrin::fake {

using host::PresentationStyle;
using Kind = ScriptStep::Kind;

namespace {

/** What a picker with all of its parts asks for in a window that is higher than wide. */
constexpr QSizeF usualSize(360, 560);

} // namespace

ScriptedPicker::~ScriptedPicker()
{
    delete m_view;
}

QSizeF ScriptedPicker::hostWindowSize() const
{
    if (wishes().hostWindowSize)
        return *wishes().hostWindowSize;
    return m_view && m_view->window() ? QSizeF(m_view->window()->size()) : QSizeF(0, 0);
}

void ScriptedPicker::present(PresentationStyle style, QQuickItem &place)
{
    if (isPresented())
        return;
    ++m_presentation;
    setEmbedded(style == PresentationStyle::Embedded);
    placeView(style, place);
    m_steps = takeWaitingScript().value_or(ScriptSteps());
    setState(State::Starting);
    Q_EMIT surroundingsChanged();
    later(&ScriptedPicker::open);
}

void ScriptedPicker::placeView(PresentationStyle style, QQuickItem &place)
{
    delete m_view;
    QQuickItem *parent = style == PresentationStyle::Embedded ? &place : place.window()->contentItem();
    m_view = new QQuickItem(parent);
    const QRectF anchor = place.mapRectToItem(parent, place.boundingRect());
    const auto layout = host::layoutPresentation(style, parent->size(), usualSize, anchor);
    m_view->setPosition(layout.panel.topLeft());
    m_view->setSize(layout.panel.size());
    // Like a real picker, it ends when the app takes its place away.
    connect(&place, &QObject::destroyed, this, [this] { later(&ScriptedPicker::finish); });
}

void ScriptedPicker::later(void (ScriptedPicker::*action)())
{
    QMetaObject::invokeMethod(
        this,
        [this, action, presentation = m_presentation] {
            if (presentation == m_presentation && (isPresented() || state() == State::Stopping))
                (this->*action)();
        },
        Qt::QueuedConnection);
}

void ScriptedPicker::open()
{
    if (state() != State::Starting)
        return;
    Q_EMIT preferredContentSizeChanged(usualSize);
    setState(State::Ready);
    playNextStep();
}

void ScriptedPicker::playNextStep()
{
    if (m_steps.isEmpty() || !isPresented())
        return;
    const auto presentation = m_presentation;
    play(m_steps.takeFirst());
    if (presentation == m_presentation && isPresented())
        later(&ScriptedPicker::playNextStep);
    else if (presentation == m_presentation && !m_steps.isEmpty())
        qWarning("FVColorPickerScript: %d steps are left after the end of the picker", int(m_steps.size()));
}

void ScriptedPicker::play(const ScriptStep &step)
{
    switch (step.kind) {
    case Kind::Pick:
        pick(step);
        break;
    case Kind::ShowEyedropper:
        Q_EMIT eyedropperShown();
        break;
    case Kind::FloatEyedropper:
        Q_EMIT eyedropperFloated();
        break;
    case Kind::DismissEyedropper:
        Q_EMIT eyedropperDismissed();
        break;
    case Kind::Finish:
        finish();
        break;
    case Kind::Terminate:
        end(State::Failed);
        Q_EMIT terminated(step.error);
        break;
    }
}

void ScriptedPicker::pick(const ScriptStep &step)
{
    const auto color = host::toPlatformColor(step.color);
    if (!color && !wishes().configuration.allowsNoColor) {
        qWarning("FVColorPickerScript: this picker does not allow no color, so none is picked");
        return;
    }
    const auto space = color && step.namesSpace ? std::optional(step.color.colorSpace().toStdString()) : std::nullopt;
    Q_EMIT picked(color, space, step.isVolatile);
}

void ScriptedPicker::dismiss()
{
    if (!isPresented())
        return;
    setState(State::Stopping);
    later(&ScriptedPicker::finish);
}

void ScriptedPicker::end(State state)
{
    delete m_view;
    setState(state);
}

void ScriptedPicker::finish()
{
    end(State::NotRunning);
    Q_EMIT finished();
}

} // namespace favrin::fake

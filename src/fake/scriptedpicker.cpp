#include "fake/scriptedpicker.h"

#include "host/colorbridge.h"

namespace favrin::fake {

using Kind = ScriptStep::Kind;

namespace {

/** What a picker with all of its parts asks for in a window that is higher than wide. */
constexpr QSizeF usualSize(360, 560);

} // namespace

ScriptedPicker::~ScriptedPicker() = default;

QSizeF ScriptedPicker::hostWindowSize() const
{
    if (wishes().hostWindowSize)
        return *wishes().hostWindowSize;
    return m_place ? m_place->surroundingSize() : QSizeF(0, 0);
}

void ScriptedPicker::present(const MakePlace &makePlace)
{
    if (isPresented())
        return;
    ++m_presentation;
    m_place.reset();
    m_place = makePlace();
    setEmbedded(m_place->style() == host::PresentationStyle::Embedded);
    m_place->setPreferredContentSize(usualSize);
    // Like a real picker, it ends when the app takes its place away.
    connect(m_place.get(), &host::PickerPlace::wasLost, this, [this] { later(&ScriptedPicker::finish); });
    m_steps = takeWaitingScript().value_or(ScriptSteps());
    setState(State::Starting);
    Q_EMIT surroundingsChanged();
    later(&ScriptedPicker::open);
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
    m_place.reset();
    setState(state);
}

void ScriptedPicker::finish()
{
    end(State::NotRunning);
    Q_EMIT finished();
}

} // namespace favrin::fake

#pragma once

#include "fake/scriptstep.h"
#include "host/session/picker.h"

namespace favrin::fake {

/**
 * A picker without a process: goes through the states of a real one and plays a script, one step in each turn of the
 * event loop. Its place stays without a picture.
 */
class ScriptedPicker : public host::Picker
{
    Q_OBJECT

public:
    using Picker::Picker;
    ~ScriptedPicker() override;

    void setSelectedColor(const std::optional<platform::Color> &) override {}
    QSizeF hostWindowSize() const override;
    double keyboardSpace() const override { return wishes().keyboardSpace.value_or(0.0); }

    void present(const MakePlace &makePlace) override;
    void dismiss() override;
    host::PickerPlace *place() const override { return m_place.get(); }
    /** Scripts play one. */
    bool isEyedropperAvailable() override { return true; }

private:
    void wishesDidChange() override {}
    /** In the next turn of the event loop, unless the presentation has ended by then. */
    void later(void (ScriptedPicker::*action)());
    void open();
    void playNextStep();
    void play(const ScriptStep &step);
    void pick(const ScriptStep &step);
    void end(State state);
    void finish();

    std::unique_ptr<host::PickerPlace> m_place;
    ScriptSteps m_steps;
    /** Counts presentations, so that what one has queued does not reach the next. */
    int m_presentation = 0;
};

} // namespace favrin::fake

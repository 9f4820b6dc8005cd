#include "fake/fvcolorpickerscript.h"

#include "fake/scriptstep.h"

using favrin::fake::ScriptStep;
using favrin::fake::ScriptSteps;
using Kind = ScriptStep::Kind;

namespace {

QList<ScriptSteps> &waitingScripts()
{
    static QList<ScriptSteps> scripts;
    return scripts;
}

} // namespace

std::optional<ScriptSteps> favrin::fake::takeWaitingScript()
{
    if (waitingScripts().isEmpty())
        return std::nullopt;
    return waitingScripts().takeFirst();
}

class FVColorPickerScript::Private
{
public:
    ScriptSteps steps;
};

FVColorPickerScript::FVColorPickerScript() : d(std::make_unique<Private>()) {}

FVColorPickerScript::~FVColorPickerScript() = default;

FVColorPickerScript::FVColorPickerScript(const FVColorPickerScript &other) : d(std::make_unique<Private>(*other.d)) {}

FVColorPickerScript &FVColorPickerScript::operator=(const FVColorPickerScript &other)
{
    *d = *other.d;
    return *this;
}

FVColorPickerScript &FVColorPickerScript::pick(const FVColor &color)
{
    d->steps.append({.kind = Kind::Pick, .color = color});
    return *this;
}

FVColorPickerScript &FVColorPickerScript::pickNoColor()
{
    return pick({});
}

FVColorPickerScript &FVColorPickerScript::drag(const QList<FVColor> &colors)
{
    for (const auto &color : colors)
        d->steps.append({.kind = Kind::Pick, .color = color, .isVolatile = true});
    return colors.isEmpty() ? *this : pick(colors.constLast());
}

FVColorPickerScript &FVColorPickerScript::sample(const FVColor &color)
{
    d->steps.append({.kind = Kind::ShowEyedropper});
    d->steps.append({.kind = Kind::FloatEyedropper});
    d->steps.append({.kind = Kind::Pick, .color = color, .namesSpace = false});
    d->steps.append({.kind = Kind::Pick, .color = color});
    d->steps.append({.kind = Kind::DismissEyedropper});
    return *this;
}

FVColorPickerScript &FVColorPickerScript::finish()
{
    d->steps.append({.kind = Kind::Finish});
    return *this;
}

FVColorPickerScript &FVColorPickerScript::terminate(const QString &error)
{
    d->steps.append({.kind = Kind::Terminate, .error = error});
    return *this;
}

void FVColorPickerScript::play() const
{
    waitingScripts().append(d->steps);
}

int FVColorPickerScript::waiting()
{
    return static_cast<int>(waitingScripts().size());
}

void FVColorPickerScript::clear()
{
    waitingScripts().clear();
}

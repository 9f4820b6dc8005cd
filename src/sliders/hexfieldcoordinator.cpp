#include "sliders/hexfieldcoordinator.h"

#include "model/hexcolor.h"
#include "sliders/colormimedata.h"
#include "sliders/colorspacelabel.h"
#include "sliders/hexfieldrules.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QMimeData>

namespace favrin::sliders {

using model::SomeColor;
using service::ColorPickerState;

HexFieldCoordinator::HexFieldCoordinator(QObject *parent) : CPTextFieldCoordinator(parent)
{
    setTextField(textField());
    connect(this, &CPTextFieldCoordinator::colorPickerStateChanged, this, [this] {
        if (colorPickerState())
            connect(colorPickerState(), &ColorPickerState::selectedColorChanged, this,
                    &HexFieldCoordinator::nameChanged);
        Q_EMIT nameChanged();
    });
}

QString HexFieldCoordinator::name() const
{
    return colorPickerState() ? colorSpaceLabel(colorPickerState()->colorBinding().colorSpace) : QString();
}

bool HexFieldCoordinator::handleKey(QKeyEvent &event)
{
    const QString text = inputText();
    if (!event.matches(QKeySequence::Copy) || text.isEmpty() || inputSelection() != TextRange{0, text.size()})
        return false;
    const auto space = model::platformName(colorPickerState()->colorBinding().colorSpace);
    const auto color = model::hexValuedColor(text.toStdU16String(), space);
    if (!color)
        return false;
    QGuiApplication::clipboard()->setMimeData(colorMimeData(*color, text).release());
    return true;
}

CPTextField<SomeColor> HexFieldCoordinator::textField()
{
    return {
        .value = {.read = [this] { return colorPickerState()->colorBinding(); },
                  .write = [this](const SomeColor &color) { colorPickerState()->setColorBinding(color); }},
        .allowUpdatesWhileEditing = false,
        .selectionOnNumber = false,
        .keyboardType = KeyboardType::AsciiCapable,
        .conversionToStringBlock =
            [](const SomeColor &color) { return QString::fromStdString(model::hexString(color)); },
        .conversionToTypeBlock = [this](const QString &text) -> std::optional<SomeColor> {
            const auto space = colorPickerState()->colorBinding().colorSpace;
            const auto color = model::hexValuedColor(text.toStdU16String(), model::platformName(space));
            return color ? std::optional(SomeColor(color->platformColor(), space)) : std::nullopt;
        },
        .shouldChangeCharacters = acceptsHexEdit,
        .editBeforeFilter =
            [this](const QString &text, const TextEdit &edit) {
                return withColorAsDigits(text, edit, colorPickerState()->colorBinding().colorSpace);
            },
    };
}

} // namespace favrin::sliders

#include "host/fvcolorpickerviewcontroller.h"

#include "host/colorbridge.h"
#include "host/fvcolorpickerviewcontroller_p.h"
#include "host/itemplace.h"

#include <QQuickWindow>

#include <utility>

using favrin::host::ItemPlace;
using favrin::host::Picker;
using favrin::host::PresentationStyle;

FVColorPickerViewController::Private::Private(FVColorPickerViewController &controller)
{
    auto *self = &controller;
    QObject::connect(picker.get(), &Picker::picked, self,
                     [this, self](const auto &color, const auto &colorspace, bool isVolatile) {
                         selectedColor = favrin::host::toPublicColor(color);
                         Q_EMIT self->selectedColorChanged();
                         Q_EMIT self->pickerDidSelectColor(
                             selectedColor, colorspace ? QString::fromStdString(*colorspace) : QString(), isVolatile);
                     });
    QObject::connect(picker.get(), &Picker::eyedropperShown, self,
                     &FVColorPickerViewController::pickerDidShowEyedropper);
    QObject::connect(picker.get(), &Picker::eyedropperFloated, self,
                     &FVColorPickerViewController::pickerDidFloatEyedropper);
    QObject::connect(picker.get(), &Picker::eyedropperDismissed, self,
                     &FVColorPickerViewController::pickerDidDismissEyedropper);
    QObject::connect(picker.get(), &Picker::eyedropperAvailableChanged, self,
                     &FVColorPickerViewController::eyedropperAvailableChanged);
    QObject::connect(picker.get(), &Picker::finished, self, &FVColorPickerViewController::colorPickerDidFinish);
    QObject::connect(picker.get(), &Picker::terminated, self,
                     &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError);
    QObject::connect(picker.get(), &Picker::stateChanged, self, &FVColorPickerViewController::stateChanged);
    QObject::connect(picker.get(), &Picker::preferredContentSizeChanged, self, [this, self](QSizeF size) {
        if (std::exchange(preferredContentSize, size) == size)
            return;
        Q_EMIT self->preferredContentSizeChanged();
    });
    QObject::connect(picker.get(), &Picker::materialChanged, self, [this, self](bool wanted) {
        if (std::exchange(wantsMaterial, wanted) == wanted)
            return;
        Q_EMIT self->wantsMaterialChanged();
    });
    QObject::connect(picker.get(), &Picker::respondingChanged, self, [this, self](bool responds) {
        if (std::exchange(responding, responds) == responds)
            return;
        Q_EMIT self->respondingChanged();
    });
    QObject::connect(picker.get(), &Picker::surroundingsChanged, self, [self] {
        Q_EMIT self->hostWindowSizeChanged();
        Q_EMIT self->keyboardSpaceChanged();
    });
}

void FVColorPickerViewController::Private::present(PresentationStyle style, QQuickItem &place)
{
    picker->present([style, &place] { return ItemPlace::create(style, place); });
}

FVColorPickerViewController::FVColorPickerViewController(QObject *parent)
    : QObject(parent), d(std::make_unique<Private>(*this))
{
}

FVColorPickerViewController::~FVColorPickerViewController() = default;

FVColor FVColorPickerViewController::selectedColor() const
{
    return d->selectedColor;
}

void FVColorPickerViewController::setSelectedColor(const FVColor &color)
{
    const bool changed = color != d->selectedColor;
    d->selectedColor = color;
    // An equal color is sent too: the picker may be in the middle of a pick that this one ends.
    d->picker->setSelectedColor(favrin::host::toPlatformColor(color));
    if (changed)
        Q_EMIT selectedColorChanged();
}

QSizeF FVColorPickerViewController::preferredContentSize() const
{
    return d->preferredContentSize;
}

bool FVColorPickerViewController::wantsMaterial() const
{
    return d->wantsMaterial;
}

bool FVColorPickerViewController::isResponding() const
{
    return d->responding;
}

bool FVColorPickerViewController::isEyedropperAvailable() const
{
    return d->picker->isEyedropperAvailable();
}

FVColorPickerViewController::State FVColorPickerViewController::state() const
{
    return static_cast<State>(d->picker->state());
}

void FVColorPickerViewController::present(QQuickWindow *window)
{
    if (window)
        d->present(PresentationStyle::Presented, *window->contentItem());
}

void FVColorPickerViewController::presentPopover(QQuickItem *anchor)
{
    if (anchor && anchor->window())
        d->present(PresentationStyle::Popover, *anchor);
}

void FVColorPickerViewController::embed(QQuickItem *container)
{
    if (container && container->window())
        d->present(PresentationStyle::Embedded, *container);
}

void FVColorPickerViewController::dismiss()
{
    d->picker->dismiss();
}

QQuickItem *FVColorPickerViewController::view() const
{
    const auto *place = qobject_cast<ItemPlace *>(d->picker->place());
    return place ? place->view() : nullptr;
}

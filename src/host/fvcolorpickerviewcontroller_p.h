#pragma once

#include "host/fvcolorpickerviewcontroller.h"
#include "host/session/picker.h"

class FVColorPickerViewController::Private
{
public:
    explicit Private(FVColorPickerViewController &controller);

    const std::unique_ptr<favrin::host::Picker> picker = favrin::host::Picker::create();
    FVColor selectedColor;
    QList<FVColor> suggestedColors;
    QSizeF preferredContentSize = QSizeF(0, 0);
    bool wantsMaterial = false;
    bool responding = true;

    void present(favrin::host::PresentationStyle style, QQuickItem &place);

    /** Stores @p value through @p field of the wishes; false when it is there already. */
    template<class Field, class Value>
    bool store(Field field, const Value &value)
    {
        if (field(picker->wishes()) == value)
            return false;
        picker->change([&](favrin::host::PickerWishes &wishes) { field(wishes) = value; });
        return true;
    }
};

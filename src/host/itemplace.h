#pragma once

#include "host/session/pickerplace.h"

#include <memory>

class QQuickItem;

namespace favrin::host {

/** A place among the items of a scene. */
class ItemPlace : public PickerPlace
{
    Q_OBJECT

public:
    using PickerPlace::PickerPlace;

    /**
     * The place of the library that is linked, which shows a picker or, in the one for apps' tests, nothing. @p place
     * is the anchor of a popover or the container of an embedded picker, else the window's content.
     */
    static std::unique_ptr<ItemPlace> create(PresentationStyle style, QQuickItem &place);

    /** The item that the picker fills; null when it has gone with its window. */
    virtual QQuickItem *view() const = 0;
};

} // namespace favrin::host

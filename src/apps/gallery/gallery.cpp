#include "apps/gallery/gallery.h"

namespace favrin::gallery {

using Picker = FVColorPickerViewController;
using Kind = MessageLog::Kind;

Gallery::Gallery(QObject *parent) : QObject(parent), m_presenter(&m_picker)
{
    m_picker.setAppearance(Picker::Appearance::Light);
    m_picker.setSuggestedColors(m_poster.colors());
    connectPoster();
    connectMessages();
    offerEyedropper();
    showSelectedPart();
}

bool Gallery::isDark() const
{
    return m_picker.appearance() == Picker::Appearance::Dark;
}

void Gallery::setDark(bool dark)
{
    if (dark == isDark())
        return;
    m_picker.setAppearance(dark ? Picker::Appearance::Dark : Picker::Appearance::Light);
    Q_EMIT darkChanged();
}

bool Gallery::isMirrored() const
{
    return m_picker.layoutDirection() == Qt::RightToLeft;
}

void Gallery::setMirrored(bool mirrored)
{
    if (mirrored == isMirrored())
        return;
    m_picker.setLayoutDirection(mirrored ? Qt::RightToLeft : Qt::LeftToRight);
    Q_EMIT mirroredChanged();
}

void Gallery::connectPoster()
{
    connect(&m_poster, &Poster::selectedPartChanged, this, &Gallery::showSelectedPart);
    connect(&m_picker, &Picker::pickerDidSelectColor, this, &Gallery::takePick);
}

void Gallery::offerEyedropper()
{
    // Only where one can work; that may be known only later, and may change.
    const auto offer = [this] { m_picker.setShowsEyedropper(m_picker.isEyedropperAvailable()); };
    connect(&m_picker, &Picker::eyedropperAvailableChanged, this, offer);
    offer();
}

void Gallery::connectMessages()
{
    connect(&m_picker, &Picker::pickerDidShowEyedropper, &m_messages,
            [this] { m_messages.add(Kind::Eyedropper, tr("Eyedropper shown")); });
    connect(&m_picker, &Picker::pickerDidFloatEyedropper, &m_messages,
            [this] { m_messages.add(Kind::Eyedropper, tr("Eyedropper floats")); });
    connect(&m_picker, &Picker::pickerDidDismissEyedropper, &m_messages,
            [this] { m_messages.add(Kind::Eyedropper, tr("Eyedropper dismissed")); });
    connect(&m_picker, &Picker::colorPickerDidFinish, &m_messages,
            [this] { m_messages.add(Kind::Finish, tr("Finished")); });
    connect(&m_picker, &Picker::colorPickerViewServiceDidTerminateWithError, &m_messages,
            [this](const QString &error) { m_messages.add(Kind::Failure, tr("The picker ended by itself"), error); });
}

void Gallery::showSelectedPart()
{
    m_picker.setTitle(m_poster.selectedName());
    m_picker.setSelectedColor(m_poster.selectedFill());
}

void Gallery::takePick(const FVColor &color, const QString &colorspace, bool isVolatile)
{
    m_messages.addPick(color, colorspace, isVolatile);
    m_poster.setSelectedFill(color);
    if (!isVolatile)
        m_picker.setSuggestedColors(m_poster.colors());
}

} // namespace favrin::gallery

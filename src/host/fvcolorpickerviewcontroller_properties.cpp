#include "host/fvcolorpickerviewcontroller.h"

#include "host/colorbridge.h"
#include "host/fvcolorpickerviewcontroller_p.h"

#include <QGuiApplication>

// The properties: each reads and writes what the picker wishes, and says so when it changed.

namespace remote = favrin::remote;

QString FVColorPickerViewController::title() const
{
    const auto &title = d->picker->wishes().configuration.title;
    return title ? QString::fromStdString(*title) : QString();
}

void FVColorPickerViewController::setTitle(const QString &title)
{
    const auto value = title.isNull() ? std::nullopt : std::optional(title.toStdString());
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.title; }, value))
        Q_EMIT titleChanged();
}

void FVColorPickerViewController::resetTitle()
{
    setTitle(QString());
}

bool FVColorPickerViewController::showsAlpha() const
{
    return d->picker->wishes().configuration.showsAlpha;
}

void FVColorPickerViewController::setShowsAlpha(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.showsAlpha; }, value))
        Q_EMIT showsAlphaChanged();
}

bool FVColorPickerViewController::allowsNoColor() const
{
    return d->picker->wishes().configuration.allowsNoColor;
}

void FVColorPickerViewController::setAllowsNoColor(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.allowsNoColor; }, value))
        Q_EMIT allowsNoColorChanged();
}

bool FVColorPickerViewController::showsEyedropper() const
{
    return d->picker->wishes().configuration.showsEyedropper;
}

void FVColorPickerViewController::setShowsEyedropper(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.showsEyedropper; }, value))
        Q_EMIT showsEyedropperChanged();
}

bool FVColorPickerViewController::usesDarkGridInDarkMode() const
{
    return d->picker->wishes().configuration.shouldUseDarkGridInDarkMode;
}

void FVColorPickerViewController::setUsesDarkGridInDarkMode(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.shouldUseDarkGridInDarkMode; }, value))
        Q_EMIT usesDarkGridInDarkModeChanged();
}

bool FVColorPickerViewController::reduceMotion() const
{
    return d->picker->wishes().reduceMotion;
}

void FVColorPickerViewController::setReduceMotion(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.reduceMotion; }, value))
        Q_EMIT reduceMotionChanged();
}

bool FVColorPickerViewController::increaseContrast() const
{
    return d->picker->wishes().increaseContrast;
}

void FVColorPickerViewController::setIncreaseContrast(bool value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.increaseContrast; }, value))
        Q_EMIT increaseContrastChanged();
}

QList<FVColor> FVColorPickerViewController::suggestedColors() const
{
    return d->suggestedColors;
}

void FVColorPickerViewController::setSuggestedColors(const QList<FVColor> &colors)
{
    std::vector<favrin::platform::Color> list;
    for (const auto &color : colors) {
        if (const auto platformColor = favrin::host::toPlatformColor(color))
            list.push_back(*platformColor);
    }
    d->suggestedColors = colors;
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.suggestedColors; }, std::optional(list)))
        Q_EMIT suggestedColorsChanged();
}

void FVColorPickerViewController::resetSuggestedColors()
{
    d->suggestedColors.clear();
    const std::optional<std::vector<favrin::platform::Color>> none;
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.suggestedColors; }, none))
        Q_EMIT suggestedColorsChanged();
}

FVColorPickerViewController::Appearance FVColorPickerViewController::gridAppearance() const
{
    return static_cast<Appearance>(d->picker->wishes().configuration.userInterfaceStyleForGrid);
}

void FVColorPickerViewController::setGridAppearance(Appearance appearance)
{
    const auto value = static_cast<std::int32_t>(appearance);
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.configuration.userInterfaceStyleForGrid; }, value))
        Q_EMIT gridAppearanceChanged();
}

FVColorPickerViewController::Appearance FVColorPickerViewController::appearance() const
{
    return static_cast<Appearance>(d->picker->wishes().appearance);
}

void FVColorPickerViewController::setAppearance(Appearance value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.appearance; }, static_cast<remote::Appearance>(value)))
        Q_EMIT appearanceChanged();
}

FVColorPickerViewController::TextSizeCategory FVColorPickerViewController::textSizeCategory() const
{
    return static_cast<TextSizeCategory>(d->picker->wishes().textSizeCategory);
}

void FVColorPickerViewController::setTextSizeCategory(TextSizeCategory value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.textSizeCategory; },
            static_cast<remote::TextSizeCategory>(value)))
        Q_EMIT textSizeCategoryChanged();
}

FVColorPickerViewController::DisplayGamut FVColorPickerViewController::displayGamut() const
{
    return static_cast<DisplayGamut>(d->picker->wishes().displayGamut);
}

void FVColorPickerViewController::setDisplayGamut(DisplayGamut value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.displayGamut; }, static_cast<remote::DisplayGamut>(value)))
        Q_EMIT displayGamutChanged();
}

Qt::LayoutDirection FVColorPickerViewController::layoutDirection() const
{
    return d->picker->wishes().layoutDirection.value_or(QGuiApplication::layoutDirection());
}

void FVColorPickerViewController::setLayoutDirection(Qt::LayoutDirection value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.layoutDirection; }, std::optional(value)))
        Q_EMIT layoutDirectionChanged();
}

void FVColorPickerViewController::resetLayoutDirection()
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.layoutDirection; }, std::optional<Qt::LayoutDirection>()))
        Q_EMIT layoutDirectionChanged();
}

QLocale FVColorPickerViewController::locale() const
{
    return d->picker->wishes().locale.value_or(QLocale());
}

void FVColorPickerViewController::setLocale(const QLocale &value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.locale; }, std::optional(value)))
        Q_EMIT localeChanged();
}

void FVColorPickerViewController::resetLocale()
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.locale; }, std::optional<QLocale>()))
        Q_EMIT localeChanged();
}

QSizeF FVColorPickerViewController::hostWindowSize() const
{
    return d->picker->hostWindowSize();
}

void FVColorPickerViewController::setHostWindowSize(QSizeF value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.hostWindowSize; }, std::optional(value)))
        Q_EMIT hostWindowSizeChanged();
}

void FVColorPickerViewController::resetHostWindowSize()
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.hostWindowSize; }, std::optional<QSizeF>()))
        Q_EMIT hostWindowSizeChanged();
}

double FVColorPickerViewController::keyboardSpace() const
{
    return d->picker->keyboardSpace();
}

void FVColorPickerViewController::setKeyboardSpace(double value)
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.keyboardSpace; }, std::optional(value)))
        Q_EMIT keyboardSpaceChanged();
}

void FVColorPickerViewController::resetKeyboardSpace()
{
    if (d->store(
            [](auto &wishes) -> auto & { return wishes.keyboardSpace; }, std::optional<double>()))
        Q_EMIT keyboardSpaceChanged();
}

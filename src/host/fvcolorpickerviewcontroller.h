#pragma once

#include "favrinhostexport.h"
#include "fvcolor.h"

#include <QList>
#include <QLocale>
#include <QObject>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSizeF>

#include <memory>

/**
 * A color picker for an app: shown inside the app's window, running in a process of its own.
 *
 * Set what the picker shall show, then present() it over a window, presentPopover() it beside an item, or place view()
 * in a scene of your own. The picker reports every color the user picks through pickerDidSelectColor(): volatile ones
 * while a gesture goes on, then the last one again as final. A color set by the app is never reported back.
 *
 * The picker's process may end at any moment; colorPickerViewServiceDidTerminateWithError() says so, and presenting
 * again works. No call waits for that process. Sizes are in points (device-independent pixels). GUI thread only.
 */
class FAVRIN_HOST_EXPORT FVColorPickerViewController : public QObject
{
    Q_OBJECT
    QML_ELEMENT

    Q_PROPERTY(QString title READ title WRITE setTitle RESET resetTitle NOTIFY titleChanged)
    Q_PROPERTY(FVColor selectedColor READ selectedColor WRITE setSelectedColor NOTIFY selectedColorChanged)
    Q_PROPERTY(bool showsAlpha READ showsAlpha WRITE setShowsAlpha NOTIFY showsAlphaChanged)
    Q_PROPERTY(bool allowsNoColor READ allowsNoColor WRITE setAllowsNoColor NOTIFY allowsNoColorChanged)
    Q_PROPERTY(bool showsEyedropper READ showsEyedropper WRITE setShowsEyedropper NOTIFY showsEyedropperChanged)
    Q_PROPERTY(bool eyedropperAvailable READ isEyedropperAvailable NOTIFY eyedropperAvailableChanged)
    Q_PROPERTY(QList<FVColor> suggestedColors READ suggestedColors WRITE setSuggestedColors RESET resetSuggestedColors
                   NOTIFY suggestedColorsChanged)
    Q_PROPERTY(bool usesDarkGridInDarkMode READ usesDarkGridInDarkMode WRITE setUsesDarkGridInDarkMode NOTIFY
                   usesDarkGridInDarkModeChanged)
    Q_PROPERTY(Appearance gridAppearance READ gridAppearance WRITE setGridAppearance NOTIFY gridAppearanceChanged)
    Q_PROPERTY(Appearance appearance READ appearance WRITE setAppearance NOTIFY appearanceChanged)
    Q_PROPERTY(Qt::LayoutDirection layoutDirection READ layoutDirection WRITE setLayoutDirection RESET
                   resetLayoutDirection NOTIFY layoutDirectionChanged)
    Q_PROPERTY(TextSizeCategory textSizeCategory READ textSizeCategory WRITE setTextSizeCategory NOTIFY
                   textSizeCategoryChanged)
    Q_PROPERTY(QLocale locale READ locale WRITE setLocale RESET resetLocale NOTIFY localeChanged)
    Q_PROPERTY(DisplayGamut displayGamut READ displayGamut WRITE setDisplayGamut NOTIFY displayGamutChanged)
    Q_PROPERTY(bool reduceMotion READ reduceMotion WRITE setReduceMotion NOTIFY reduceMotionChanged)
    Q_PROPERTY(bool increaseContrast READ increaseContrast WRITE setIncreaseContrast NOTIFY increaseContrastChanged)
    Q_PROPERTY(QSizeF hostWindowSize READ hostWindowSize WRITE setHostWindowSize RESET resetHostWindowSize NOTIFY
                   hostWindowSizeChanged)
    Q_PROPERTY(double keyboardSpace READ keyboardSpace WRITE setKeyboardSpace RESET resetKeyboardSpace NOTIFY
                   keyboardSpaceChanged)
    Q_PROPERTY(QSizeF preferredContentSize READ preferredContentSize NOTIFY preferredContentSizeChanged)
    Q_PROPERTY(bool wantsMaterial READ wantsMaterial NOTIFY wantsMaterialChanged)
    Q_PROPERTY(State state READ state NOTIFY stateChanged)
    Q_PROPERTY(bool presented READ isPresented NOTIFY stateChanged)
    Q_PROPERTY(bool responding READ isResponding NOTIFY respondingChanged)

public:
    /** A light or a dark look; Unspecified leaves the choice to what surrounds. */
    enum class Appearance { Unspecified = 0, Light = 1, Dark = 2 };
    Q_ENUM(Appearance)

    /** The text size the user asked for; Large is the ordinary size. */
    enum class TextSizeCategory {
        ExtraSmall,
        Small,
        Medium,
        Large,
        ExtraLarge,
        ExtraExtraLarge,
        ExtraExtraExtraLarge,
        AccessibilityMedium,
        AccessibilityLarge,
        AccessibilityExtraLarge,
        AccessibilityExtraExtraLarge,
        AccessibilityExtraExtraExtraLarge,
    };
    Q_ENUM(TextSizeCategory)

    /** P3 only when the app's window is shown as Display P3: the picker's pixels are then in that space. */
    enum class DisplayGamut { SRGB, P3 };
    Q_ENUM(DisplayGamut)

    /** Where a picker stands; each presentation goes from Starting to Ready, and ends in NotRunning or Failed. */
    enum class State {
        /** Nothing is shown and no process runs for this picker. */
        NotRunning,
        /** Presented; the process has not drawn yet. */
        Starting,
        /** The picker is on screen. */
        Ready,
        /** The end was asked for and not yet confirmed. */
        Stopping,
        /** The process ended by itself; presenting again is possible. */
        Failed,
    };
    Q_ENUM(State)

    /** A picker that is not presented; nothing is started yet. Needs a QGuiApplication. */
    explicit FVColorPickerViewController(QObject *parent = nullptr);
    /** Ends a presentation at once; nothing is reported any more. */
    ~FVColorPickerViewController() override;

    ///@{
    /** The headline; a null text (the default) shows the picker's own. At most 1,024 bytes of UTF-8 are shown. */
    QString title() const;
    void setTitle(const QString &title);
    void resetTitle();
    ///@}

    /** What the app set or the user picked last; no color while there is none. Setting it never comes back as a pick.
     */
    FVColor selectedColor() const;
    /**
     * Shows @p color in the picker. It works in the color's own space when that is sRGB or Display P3, otherwise in the
     * default space of the display.
     */
    void setSelectedColor(const FVColor &color);

    ///@{
    /** Opacity can be edited; true at first. */
    bool showsAlpha() const;
    void setShowsAlpha(bool shows);
    ///@}
    ///@{
    /** The user may choose no color at all; false at first. */
    bool allowsNoColor() const;
    void setAllowsNoColor(bool allows);
    ///@}
    ///@{
    /** The eyedropper button is offered; true at first. */
    bool showsEyedropper() const;
    void setShowsEyedropper(bool shows);
    ///@}
    /**
     * Whether an eyedropper can work here: an eyedropper service is there and has a screen to sample. False until that
     * is known, which takes some milliseconds after the first call; no call waits. An app that must not offer what
     * cannot work binds showsEyedropper to it.
     */
    bool isEyedropperAvailable() const;
    ///@{
    /** Colors the app proposes; at most 2,048 are shown and the rest is left out, which the log says. */
    QList<FVColor> suggestedColors() const;
    void setSuggestedColors(const QList<FVColor> &colors);
    ///@}
    /** Takes the proposals away, which is not the same as proposing none. */
    void resetSuggestedColors();
    ///@{
    /** The grid may switch to its dark palette in the dark appearance; false at first. */
    bool usesDarkGridInDarkMode() const;
    void setUsesDarkGridInDarkMode(bool uses);
    ///@}
    ///@{
    /** Forces the grid's appearance; Unspecified follows the picker. */
    Appearance gridAppearance() const;
    void setGridAppearance(Appearance appearance);
    ///@}

    ///@{
    /** Appearance of the picker; Unspecified (at first) follows the palette of the window that shows it. */
    Appearance appearance() const;
    void setAppearance(Appearance appearance);
    ///@}
    ///@{
    /** Reading direction; that of the application until it is set. */
    Qt::LayoutDirection layoutDirection() const;
    void setLayoutDirection(Qt::LayoutDirection direction);
    void resetLayoutDirection();
    ///@}
    ///@{
    /** Size of the picker's text; Large at first. */
    TextSizeCategory textSizeCategory() const;
    void setTextSizeCategory(TextSizeCategory category);
    ///@}
    ///@{
    /** Language and number formats; QLocale() until it is set. */
    QLocale locale() const;
    void setLocale(const QLocale &locale);
    void resetLocale();
    ///@}
    ///@{
    /** What the window that shows the picker is shown in; SRGB at first. */
    DisplayGamut displayGamut() const;
    void setDisplayGamut(DisplayGamut gamut);
    ///@}
    ///@{
    /** The user wants no animations; false at first. */
    bool reduceMotion() const;
    void setReduceMotion(bool reduce);
    ///@}
    ///@{
    /** The user wants clearer borders and texts; false at first. */
    bool increaseContrast() const;
    void setIncreaseContrast(bool increase);
    ///@}

    ///@{
    /**
     * Size in points of what the picker adapts its layout to: of the window that shows it, or of the container that it
     * is embedded in, until it is set.
     */
    QSizeF hostWindowSize() const;
    void setHostWindowSize(QSizeF size);
    void resetHostWindowSize();
    ///@}
    ///@{
    /** Height that the on-screen keyboard covers at the bottom of the picker; followed by itself until it is set. */
    double keyboardSpace() const;
    void setKeyboardSpace(double space);
    void resetKeyboardSpace();
    ///@}

    /** How large the picker would like to be; 0 × 0 until it has said so. */
    QSizeF preferredContentSize() const;
    /** The picker wants a translucent material behind it. Presented pickers have it drawn; view() leaves it to the app.
     */
    bool wantsMaterial() const;

    /** Where the picker stands. */
    State state() const;
    /** The picker is on screen, or will be as soon as its process has drawn. */
    bool isPresented() const { return state() == State::Starting || state() == State::Ready; }

    /**
     * False while the picker's process has not answered for some seconds. One that never answers again is ended after
     * ten more, which colorPickerViewServiceDidTerminateWithError() reports; an app that does not want to wait may
     * dismiss() and present() at any moment, and gets another process. A picker that is merely slow is left alone.
     */
    bool isResponding() const;

    /** Shows the picker over the content of the window. Does nothing while it is presented already. */
    Q_INVOKABLE void present(QQuickWindow *window);
    /** Shows the picker in a popover that points at @p anchor. */
    Q_INVOKABLE void presentPopover(QQuickItem *anchor);
    /**
     * Shows the picker inside @p container, which it fills; it follows the container's size. The container may be any
     * item of the app's scene.
     */
    Q_INVOKABLE void embed(QQuickItem *container);
    /** Ends the presentation; colorPickerDidFinish() follows. */
    Q_INVOKABLE void dismiss();

    /** The item that shows the picker while it is presented, or null. */
    Q_INVOKABLE QQuickItem *view() const;

    /**
     * Starts one picker process ahead of time, so that the next presentation in this app is instant. It waits without
     * using any processor time. Calling it again while one waits does nothing. A program that shows the picker at once
     * may call it before it makes its QGuiApplication too, so that both start side by side.
     */
    Q_INVOKABLE static void startServiceAhead();

    /** Opens nothing: the file that is run as the picker's process, for those who must start it by hand or test it. */
    static QString servicePath();

Q_SIGNALS:
    /**
     * The user picked @p color (no color when it is not valid). @p colorspace is the platform name of its space; it is
     * empty for no color, and for the first of the two reports of a color sampled by the eyedropper. @p isVolatile is
     * true while a gesture goes on; the last color of a gesture comes again with false.
     */
    void pickerDidSelectColor(const FVColor &color, const QString &colorspace, bool isVolatile);
    /** The user took up the eyedropper, which waits to be moved. */
    void pickerDidShowEyedropper();
    /** The eyedropper moves over the screen. */
    void pickerDidFloatEyedropper();
    /** The eyedropper is gone, with or without a color. */
    void pickerDidDismissEyedropper();
    /** The presentation has ended, by the user or by dismiss(). */
    void colorPickerDidFinish();
    /** The picker's process ended by itself or broke a rule; the picker is no longer shown. */
    void colorPickerViewServiceDidTerminateWithError(const QString &error);

    ///@{
    /** The property of this name has a new value. */
    void titleChanged();
    void selectedColorChanged();
    void showsAlphaChanged();
    void allowsNoColorChanged();
    void showsEyedropperChanged();
    void eyedropperAvailableChanged();
    void suggestedColorsChanged();
    void usesDarkGridInDarkModeChanged();
    void gridAppearanceChanged();
    void appearanceChanged();
    void layoutDirectionChanged();
    void textSizeCategoryChanged();
    void localeChanged();
    void displayGamutChanged();
    void reduceMotionChanged();
    void increaseContrastChanged();
    void hostWindowSizeChanged();
    void keyboardSpaceChanged();
    void preferredContentSizeChanged();
    void wantsMaterialChanged();
    void stateChanged();
    void respondingChanged();
    ///@}

private:
    class Q_DECL_HIDDEN Private;
    std::unique_ptr<Private> d;
};

#pragma once

#include "favrinhostexport.h"
#include "fvcolor.h"

#include <QList>
#include <QString>

#include <memory>

/**
 * What a picker of the test library does, in the place of a user. GUI thread.
 *
 * An app's test links `FavrinColorPicker::Fake` where the app links `FavrinColorPicker::Host`. The class
 * FVColorPickerViewController is then the same, but starts no process: each presentation plays the script that was
 * queued first, or, without one, waits as if the user did nothing.
 *
 * @code
 * FVColorPickerScript().drag({red, orange}).finish().play();
 * app.chooseColor();
 * QTRY_COMPARE(app.color(), orange);
 * @endcode
 *
 * Each step is one turn of the event loop, as messages of a process are: nothing is reported inside present(). What a
 * real picker would never say is left out with a warning: no color where it is not allowed, and anything after the end.
 */
class FAVRIN_HOST_EXPORT FVColorPickerScript
{
public:
    /** The picker opens and does nothing. */
    FVColorPickerScript();
    ~FVColorPickerScript();
    ///@{
    /** The same steps; scripts may be kept and played again. */
    FVColorPickerScript(const FVColorPickerScript &other);
    FVColorPickerScript &operator=(const FVColorPickerScript &other);
    ///@}

    /** The user picks @p color at once: one final report. Invalid colors are no color, as in pickNoColor(). */
    FVColorPickerScript &pick(const FVColor &color);
    /** The user takes the color away, which the app must have allowed. */
    FVColorPickerScript &pickNoColor();
    /** The user drags over @p colors: each is reported as volatile, then the last one again as final. */
    FVColorPickerScript &drag(const QList<FVColor> &colors);
    /**
     * The user samples @p color from the screen: the eyedropper is shown, floats, reports the color twice (at first
     * without the name of its space) and is dismissed.
     */
    FVColorPickerScript &sample(const FVColor &color);
    /** The user closes the picker. */
    FVColorPickerScript &finish();
    /** The picker's process ends by itself, for the reason @p error. */
    FVColorPickerScript &terminate(const QString &error);

    /** The next presentation that has no script yet plays this one. Scripts are played in the order of these calls. */
    void play() const;

    /** Scripts that no presentation has begun yet; an app's test ends with 0. */
    static int waiting();
    /** Forgets the scripts that wait, so that one test does not reach into the next. */
    static void clear();

private:
    class Q_DECL_HIDDEN Private;
    std::unique_ptr<Private> d;
};

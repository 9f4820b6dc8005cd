#pragma once

#include "apps/gallery/contactsheet.h"
#include "apps/gallery/fingertip.h"
#include "apps/gallery/stillness.h"
#include "apps/gallery/tour.h"
#include "host/fvcolorpickerviewcontroller.h"

#include <QQuickItem>
#include <QQuickWindow>

namespace favrin::gallery {

/**
 * Every face of the picker: each tab, upright and on its side, light and dark, in both directions, without a color,
 * with an opaque and with a translucent one. One picker shows them all, one after the other, as a host changes its
 * mind.
 */
class PictureBook : public QObject
{
    Q_OBJECT

public:
    /** Leaves the pictures and a contact sheet for each appearance in @p folder, as steps of @p tour. */
    PictureBook(const QString &folder, Tour *tour);

    void addEverything();

private:
    enum class Appearance { Light, Dark };
    enum class Layout { Portrait, Landscape };
    struct Look
    {
        Appearance appearance;
        Qt::LayoutDirection direction;
        Layout layout;
        int tab;
        int color;

        QString caption() const;
        QString fileName() const;
    };

    void addOpening();
    void addRow(Look look);
    void addTab(const Look &look);
    void addPicture(const Look &look);
    void addSheet(Appearance appearance);
    void addClosing();

    void wear(const Look &look);
    void setColor(int color);
    void fitContainer();

    QString m_folder;
    Tour *m_tour;
    FVColorPickerViewController m_picker;
    QQuickWindow m_window;
    QQuickItem m_container;
    Fingertip m_finger;
    Stillness m_stillness;
    ContactSheet m_sheet;
};

} // namespace favrin::gallery

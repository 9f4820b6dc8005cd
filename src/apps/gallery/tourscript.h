#pragma once

#include "apps/gallery/fingertip.h"
#include "apps/gallery/gallery.h"
#include "apps/gallery/pickrecorder.h"
#include "apps/gallery/stillness.h"
#include "apps/gallery/tour.h"

#include <QProcess>
#include <QSize>

namespace favrin::gallery {

/** What the tour does: touches the window like a person would, and leaves a picture of everything worth seeing. */
class TourScript : public QObject
{
    Q_OBJECT

public:
    /** @param folder exists and takes the pictures and picks.jsonl */
    TourScript(QQuickWindow *window, Gallery *gallery, const QString &folder, Tour *tour);

    /** Every presentation in every appearance, with picks, and the window in other sizes and at a larger scale. */
    void addEverything();
    /** The one picture that needs a process of its own, started with another scale factor. */
    void addScaledPicture();

private:
    enum class Appearance { Light, Dark };
    enum class Direction { LeftToRight, RightToLeft };
    struct Scene;
    static const Scene presented;
    static const Scene popover;
    static const Scene embedded;

    void addStep(const QString &text, Tour::Action action, Tour::Condition isDone);
    void addSurroundings(Appearance appearance, Direction direction, QSize windowSize);
    void addScene(const Scene &scene, const QString &picture);
    void addStroke(const Scene &scene);
    void addTap(const QString &text, const QString &itemName, Tour::Condition isDone);
    void addPicture(const QString &name);
    void addDismissal();
    void addScaledProcess();

    QQuickItem *item(const QString &name) const;
    void tap(const QString &itemName);
    /** A place among the picker's colors, in fractions of their width and height, as a point of the window. */
    QPointF colorAt(QPointF place) const;
    bool isStill() { return m_stillness.isReached(); }

    QQuickWindow *m_window;
    Gallery *m_gallery;
    QString m_folder;
    Tour *m_tour;
    Fingertip m_finger;
    Stillness m_stillness;
    PickRecorder *m_recorder = nullptr;
    QProcess m_scaledProcess;

    int m_picksBefore = 0;
};

} // namespace favrin::gallery

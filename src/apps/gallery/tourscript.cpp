#include "apps/gallery/tourscript.h"

#include "apps/gallery/pickerplaces.h"

#include <QCoreApplication>
#include <QDir>

namespace favrin::gallery {

using Presentation = PickerPresenter::Presentation;

namespace {

constexpr QSize desktopSize(1240, 820);
constexpr QSize tabletSize(820, 1180);
constexpr QSize phoneSize(390, 844);

/** What lists create is a child in the scene only, not in the tree of objects. */
QQuickItem *findItem(QQuickItem *root, const QString &name)
{
    if (root->objectName() == name)
        return root;
    const QList<QQuickItem *> children = root->childItems();
    for (QQuickItem *child : children) {
        if (QQuickItem *found = findItem(child, name))
            return found;
    }
    return nullptr;
}

/** Nothing of what lies behind shows through any more. */
bool isOpaque(const QQuickItem *item)
{
    for (; item; item = item->parentItem()) {
        if (!item->isVisible() || item->opacity() < 1.0)
            return false;
    }
    return true;
}

} // namespace

/** One way to show the picker, and what is done with it. */
struct TourScript::Scene
{
    QString text;
    QString button;
    /** The part of the poster that is colored. */
    QString part;
    /** A stroke over the colors, in fractions of their width and height. */
    QPointF from;
    QPointF to;
};

const TourScript::Scene TourScript::presented{QStringLiteral("presents the picker over the poster"),
                                              QStringLiteral("presentButton"),
                                              QStringLiteral("partSun"),
                                              {0.06, 0.30},
                                              {0.62, 0.55}};
const TourScript::Scene TourScript::popover{QStringLiteral("shows the picker in a popover"),
                                            QStringLiteral("popoverButton"),
                                            QStringLiteral("partHills"),
                                            {0.70, 0.75},
                                            {0.06, 0.35}};
const TourScript::Scene TourScript::embedded{QStringLiteral("embeds the picker in the inspector"),
                                             QStringLiteral("embedButton"),
                                             QStringLiteral("partWater"),
                                             {0.55, 0.80},
                                             {0.15, 0.15}};

TourScript::TourScript(QQuickWindow *window, Gallery *gallery, const QString &folder, Tour *tour)
    : QObject(tour)
    , m_window(window)
    , m_gallery(gallery)
    , m_folder(folder)
    , m_tour(tour)
    , m_finger(window)
    , m_stillness(window)
{
}

void TourScript::addEverything()
{
    m_recorder = new PickRecorder(QDir(m_folder).filePath(QStringLiteral("picks.jsonl")), this);
    connect(m_gallery->picker(), &FVColorPickerViewController::pickerDidSelectColor, m_recorder, &PickRecorder::record);

    for (const Appearance appearance : {Appearance::Light, Appearance::Dark}) {
        const QString suffix = appearance == Appearance::Dark ? QStringLiteral("-dark") : QStringLiteral("-light");
        addSurroundings(appearance, Direction::LeftToRight, desktopSize);
        addScene(presented, QStringLiteral("presented") + suffix);
        addScene(popover, QStringLiteral("popover") + suffix);
        addScene(embedded, QStringLiteral("embedded") + suffix);
    }
    addSurroundings(Appearance::Light, Direction::RightToLeft, desktopSize);
    addScene(presented, QStringLiteral("presented-right-to-left"));
    addScene(embedded, QStringLiteral("embedded-right-to-left"));
    addSurroundings(Appearance::Light, Direction::LeftToRight, phoneSize);
    addScene(presented, QStringLiteral("presented-phone"));
    addSurroundings(Appearance::Dark, Direction::LeftToRight, phoneSize);
    addScene(embedded, QStringLiteral("embedded-phone-dark"));
    addSurroundings(Appearance::Light, Direction::LeftToRight, tabletSize);
    addScene(popover, QStringLiteral("popover-tablet"));
    addScaledProcess();
}

void TourScript::addScaledPicture()
{
    addSurroundings(Appearance::Light, Direction::LeftToRight, desktopSize);
    addScene(presented, QStringLiteral("presented-light-3x"));
}

void TourScript::addStep(const QString &text, Tour::Action action, Tour::Condition isDone)
{
    m_tour->add(
        text,
        [this, action = std::move(action)] {
            // What was still before this step says nothing about what it brings.
            m_stillness.forget();
            if (action)
                action();
        },
        std::move(isDone));
}

void TourScript::addSurroundings(Appearance appearance, Direction direction, QSize windowSize)
{
    const bool dark = appearance == Appearance::Dark;
    const bool mirrored = direction == Direction::RightToLeft;
    addStep(
        QStringLiteral("gives the window %1 × %2 points").arg(windowSize.width()).arg(windowSize.height()),
        [this, windowSize] { m_window->resize(windowSize); },
        [this, windowSize] { return m_window->size() == windowSize && isStill(); });
    addTap(dark ? QStringLiteral("turns to the dark appearance") : QStringLiteral("turns to the light appearance"),
           dark ? QStringLiteral("segmentDark") : QStringLiteral("segmentLight"),
           [this, dark] { return m_gallery->isDark() == dark; });
    addTap(mirrored ? QStringLiteral("lays out from right to left") : QStringLiteral("lays out from left to right"),
           mirrored ? QStringLiteral("segmentRTL") : QStringLiteral("segmentLTR"),
           [this, mirrored] { return m_gallery->isMirrored() == mirrored && isStill(); });
}

void TourScript::addScene(const Scene &scene, const QString &picture)
{
    addTap(QStringLiteral("selects a part of the poster"), scene.part, [] { return true; });
    addTap(scene.text, scene.button,
           [this] { return m_gallery->presenter()->isReady() && isOpaque(m_gallery->picker()->view()) && isStill(); });
    if (m_recorder)
        addStroke(scene);
    addPicture(picture);
    addDismissal();
}

void TourScript::addTap(const QString &text, const QString &itemName, Tour::Condition isDone)
{
    addStep(
        text, [this, itemName] { tap(itemName); }, std::move(isDone));
}

void TourScript::addStroke(const Scene &scene)
{
    constexpr int moves = 4;
    const auto anotherPick = [this] { return m_recorder->volatilePicks() > m_picksBefore; };
    for (int move = 0; move <= moves; ++move) {
        const QPointF place = scene.from + (scene.to - scene.from) * move / moves;
        addStep(
            move == 0 ? QStringLiteral("touches a color") : QStringLiteral("drags on"),
            [this, place, move] {
                m_picksBefore = m_recorder->volatilePicks();
                if (move == 0)
                    m_finger.press(colorAt(place));
                else
                    m_finger.move(colorAt(place));
            },
            anotherPick);
    }
    addStep(
        QStringLiteral("lifts the finger"),
        [this] {
            m_picksBefore = m_recorder->finalPicks();
            m_finger.lift();
        },
        [this] { return m_recorder->finalPicks() > m_picksBefore; });
}

void TourScript::addPicture(const QString &name)
{
    const QString path = QDir(m_folder).filePath(name + QStringLiteral(".png"));
    addStep(QStringLiteral("takes the picture %1").arg(path), {}, [this, path] {
        if (!isStill())
            return false;
        if (!m_stillness.picture().save(path))
            m_tour->fail(QStringLiteral("the picture cannot be written"));
        return true;
    });
}

void TourScript::addDismissal()
{
    addStep(
        QStringLiteral("ends the presentation"), [this] { m_gallery->presenter()->dismiss(); },
        [this] { return m_gallery->picker()->state() == FVColorPickerViewController::State::NotRunning && isStill(); });
}

void TourScript::addScaledProcess()
{
    connect(&m_scaledProcess, &QProcess::finished, this, [this](int exitCode) {
        if (exitCode != 0)
            m_tour->fail(QStringLiteral("the process ended with status %1").arg(exitCode));
    });
    connect(&m_scaledProcess, &QProcess::errorOccurred, this, [this] { m_tour->fail(m_scaledProcess.errorString()); });
    addStep(
        QStringLiteral("starts again at three times the scale"),
        [this] {
            QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
            environment.insert(QStringLiteral("QT_SCALE_FACTOR"), QStringLiteral("3"));
            m_scaledProcess.setProcessEnvironment(environment);
            m_scaledProcess.setProcessChannelMode(QProcess::ForwardedChannels);
            m_scaledProcess.start(QCoreApplication::applicationFilePath(),
                                  {QStringLiteral("--tour=") + m_folder, QStringLiteral("--only-scaled-picture")});
        },
        [this] { return m_scaledProcess.state() == QProcess::NotRunning; });
}

QQuickItem *TourScript::item(const QString &name) const
{
    QQuickItem *found = findItem(m_window->contentItem(), name);
    if (!found)
        m_tour->fail(QStringLiteral("the window has no '%1'").arg(name));
    return found;
}

void TourScript::tap(const QString &itemName)
{
    if (const QQuickItem *target = item(itemName))
        m_finger.tap(target->mapToScene(target->boundingRect().center()));
}

QPointF TourScript::colorAt(QPointF place) const
{
    const QQuickItem *view = m_gallery->picker()->view();
    if (!view)
        return {};
    const QRectF colors = PickerPlaces(view->size(), m_gallery->picker()->layoutDirection()).tabArea();
    return view->mapToScene(colors.topLeft() + QPointF(place.x() * colors.width(), place.y() * colors.height()));
}

} // namespace favrin::gallery

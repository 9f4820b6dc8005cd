#include "apps/gallery/tourscript.h"

#include "apps/gallery/vividarea.h"

#include <QCoreApplication>
#include <QDir>

#include <chrono>

namespace favrin::gallery {

using namespace std::chrono_literals;
using Presentation = PickerPresenter::Presentation;

namespace {

constexpr QSize desktopSize(1240, 820);
constexpr QSize tabletSize(820, 1180);
constexpr QSize phoneSize(390, 844);

/** Whatever moves, or is yet to arrive from the picker's process, shows within this time. */
constexpr std::chrono::milliseconds stillness = 120ms;

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

} // namespace

TourScript::TourScript(QQuickWindow *window, Gallery *gallery, const QString &folder, Tour *tour)
    : QObject(tour), m_window(window), m_gallery(gallery), m_folder(folder), m_tour(tour), m_finger(window)
{
}

void TourScript::addEverything()
{
    m_recorder = new PickRecorder(QDir(m_folder).filePath(QStringLiteral("picks.jsonl")), this);
    connect(m_gallery->picker(), &FVColorPickerViewController::pickerDidSelectColor, m_recorder, &PickRecorder::record);

    for (const Appearance appearance : {Appearance::Light, Appearance::Dark}) {
        const QString suffix = appearance == Appearance::Dark ? QStringLiteral("-dark") : QStringLiteral("-light");
        addSurroundings(appearance, Direction::LeftToRight, desktopSize);
        addPresentation(QStringLiteral("present"), QStringLiteral("presented") + suffix);
        addPresentation(QStringLiteral("popover"), QStringLiteral("popover") + suffix);
        addPresentation(QStringLiteral("embed"), QStringLiteral("embedded") + suffix);
    }
    addSurroundings(Appearance::Light, Direction::RightToLeft, desktopSize);
    addPresentation(QStringLiteral("present"), QStringLiteral("presented-right-to-left"));
    addPresentation(QStringLiteral("embed"), QStringLiteral("embedded-right-to-left"));
    addSurroundings(Appearance::Light, Direction::LeftToRight, phoneSize);
    addPresentation(QStringLiteral("present"), QStringLiteral("presented-phone"));
    addSurroundings(Appearance::Dark, Direction::LeftToRight, phoneSize);
    addPresentation(QStringLiteral("embed"), QStringLiteral("embedded-phone-dark"));
    addSurroundings(Appearance::Light, Direction::LeftToRight, tabletSize);
    addPresentation(QStringLiteral("popover"), QStringLiteral("popover-tablet"));
    addScaledProcess();
}

void TourScript::addScaledPicture()
{
    addSurroundings(Appearance::Light, Direction::LeftToRight, desktopSize);
    addPresentation(QStringLiteral("present"), QStringLiteral("presented-light-3x"));
}

void TourScript::addSurroundings(Appearance appearance, Direction direction, QSize windowSize)
{
    const bool dark = appearance == Appearance::Dark;
    const bool mirrored = direction == Direction::RightToLeft;
    m_tour->add(
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

void TourScript::addPresentation(const QString &button, const QString &picture)
{
    addTap(QStringLiteral("shows the picker: %1").arg(button), button + QStringLiteral("Button"), [this] {
        if (!m_gallery->presenter()->isReady() || !isStill())
            return false;
        m_colors = colors();
        return !m_colors.isEmpty();
    });
    if (m_recorder)
        addDrag();
    addPicture(picture);
    addDismissal();
}

void TourScript::addTap(const QString &text, const QString &itemName, Tour::Condition isDone)
{
    m_tour->add(
        text, [this, itemName] { tap(itemName); }, std::move(isDone));
}

void TourScript::addDrag()
{
    const auto anotherPick = [this] { return m_recorder->volatilePicks() > m_picksBefore; };
    const auto touch = [this](double x, double y, void (Fingertip::*touches)(QPointF)) {
        return [this, x, y, touches] {
            m_picksBefore = m_recorder->volatilePicks();
            (m_finger.*touches)(colorAt(x, y));
        };
    };
    m_tour->add(QStringLiteral("touches a color"), touch(0.06, 0.3, &Fingertip::press), anotherPick);
    for (const double way : {0.2, 0.35, 0.5, 0.62})
        m_tour->add(QStringLiteral("drags on"), touch(way, 0.3 + 0.4 * way, &Fingertip::move), anotherPick);
    m_tour->add(
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
    m_tour->add(QStringLiteral("takes the picture %1").arg(path), {}, [this, path] {
        if (!isStill())
            return false;
        if (!m_lastGrab.save(path))
            m_tour->fail(QStringLiteral("the picture cannot be written"));
        return true;
    });
}

void TourScript::addDismissal()
{
    m_tour->add(
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
    m_tour->add(
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

QRectF TourScript::colors() const
{
    const QQuickItem *view = m_gallery->picker()->view();
    if (!view)
        return {};
    const double scale = m_window->effectiveDevicePixelRatio();
    const QRectF bounds = view->mapRectToScene(view->boundingRect());
    const QRectF area = vividArea(m_lastGrab, QRectF(bounds.topLeft() * scale, bounds.size() * scale).toRect());
    return {area.topLeft() / scale, area.size() / scale};
}

QPointF TourScript::colorAt(double x, double y) const
{
    return m_colors.topLeft() + QPointF(x * m_colors.width(), y * m_colors.height());
}

bool TourScript::isStill()
{
    if (m_sinceGrab.isValid() && m_sinceGrab.elapsed() < stillness.count())
        return false;
    const QImage grab = m_window->grabWindow();
    const bool still = grab == m_lastGrab;
    m_lastGrab = grab;
    m_sinceGrab.start();
    return still;
}

} // namespace favrin::gallery

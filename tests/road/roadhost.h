#pragma once

#include "host/fvcolorpickerviewcontroller.h"

#include <QDir>
#include <QFileInfo>
#include <QPointingDevice>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSignalSpy>
#include <QTest>

#include <csignal>
#include <vector>

#include <unistd.h>

/** A host app with one window and one picker, which records what it hears. */
class RoadHost
{
public:
    struct Pick
    {
        FVColor color;
        QString space;
        bool isVolatile;
        bool operator==(const Pick &) const = default;
    };

    explicit RoadHost(QSize size = QSize(900, 700))
    {
        window.resize(size);
        window.show();
        QObject::connect(&picker, &FVColorPickerViewController::pickerDidSelectColor, &window,
                         [this](const FVColor &color, const QString &space, bool isVolatile) {
                             picks.push_back({color, space, isVolatile});
                         });
    }

    bool isReady() const { return picker.state() == FVColorPickerViewController::State::Ready; }
    bool hasFinalPick() const { return !picks.empty() && !picks.back().isVolatile; }
    /** Over the whole window; false when the picker does not come. */
    bool present()
    {
        picker.present(&window);
        return QTest::qWaitFor([this] { return isReady(); });
    }
    bool present(const FVColor &color)
    {
        picker.setSelectedColor(color);
        return present();
    }
    bool embed(QQuickItem &container)
    {
        picker.embed(&container);
        return QTest::qWaitFor([this] { return isReady(); });
    }
    void click(QPoint place) { QTest::mouseClick(&window, Qt::LeftButton, {}, place); }
    QRgb pixel(QPoint place) { return window.grabWindow().pixel(place); }

    /** A place in the tab's area, in fractions of its width and height, as a point of the window. */
    QPoint inTab(double x, double y) const { return inWindow(tabArea(), {x, y}); }
    /** Where the center of a swatch of the grid lies in the window. */
    QPoint swatch(int row, int column) const { return inTab((column + 0.5) / 12, (row + 0.5) / 10); }
    QPoint closeButton() const
    {
        return picker.view()->mapToScene(QPointF(picker.view()->width() - padding() - 15, 55.0 / 2)).toPoint();
    }
    /** The segment of a tab, counted from 0. */
    QPoint tabSegment(int index) const
    {
        const QRectF segments(padding(), 55.0, picker.view()->width() - 2 * padding(), 32.0);
        return inWindow(segments, {(index + 0.5) / 3, 0.5});
    }

    // The picker's layout: side by side in a wide window, one above the other in a narrow one.
    bool isLandscape() const { return picker.view()->width() > 500; }
    double padding() const { return isLandscape() ? 20.0 : 16.0; }
    QRectF tabArea() const
    {
        const double inner = picker.view()->width() - 2 * padding();
        const double width = isLandscape() ? (inner - 18.0) / 2 : inner;
        // Below the navigation bar, the tab picker and the space between.
        return {padding(), 55.0 + 32.0 + (isLandscape() ? 16.0 : 20.0), width, width / 1.2};
    }
    /** Without the opacity. */
    QRectF footerArea() const
    {
        const QRectF tab = tabArea();
        return isLandscape() ? QRectF(tab.right() + 18.0, tab.top(), tab.width(), 72.0)
                             : QRectF(tab.left(), tab.bottom() + 18.0, tab.width(), 78.0);
    }
    /** The center of a place of the favorites strip, on the page that is shown. */
    QPoint favorite(int row, int column) const
    {
        const QRectF footer = footerArea();
        const double size = isLandscape() ? 28.0 : 30.0;
        const double gap = isLandscape() ? 16.0 : 18.0;
        const double start = footer.height() + (isLandscape() ? 20.0 : 16.0);
        const double room = footer.width() - start;
        const int columns = std::min(8, static_cast<int>((room + gap) / (size + gap)));
        const double inset = (room - (columns * size + (columns - 1) * gap)) / 2;
        const QPointF center(footer.left() + start + inset + column * (size + gap) + size / 2,
                             footer.top() + row * (size + gap) + size / 2);
        return picker.view()->mapToScene(center).toPoint();
    }

    QPoint inWindow(const QRectF &area, QPointF place) const
    {
        return picker.view()
            ->mapToScene(area.topLeft() + QPointF(place.x() * area.width(), place.y() * area.height()))
            .toPoint();
    }

    QQuickWindow window;
    FVColorPickerViewController picker;
    QSignalSpy finished{&picker, &FVColorPickerViewController::colorPickerDidFinish};
    QSignalSpy terminated{&picker, &FVColorPickerViewController::colorPickerViewServiceDidTerminateWithError};
    std::vector<Pick> picks;
};

/** The picker processes that are children of @p parent. */
inline std::vector<pid_t> servicesOf(pid_t parent)
{
    std::vector<pid_t> found;
    const auto service = QFileInfo(FVColorPickerViewController::servicePath()).canonicalFilePath();
    const QDir processes(QStringLiteral("/proc"));
    for (const auto &name : processes.entryList(QDir::Dirs)) {
        bool isNumber = false;
        const int pid = name.toInt(&isNumber);
        if (!isNumber || QFile::symLinkTarget(QStringLiteral("/proc/%1/exe").arg(pid)) != service)
            continue;
        QFile status(QStringLiteral("/proc/%1/stat").arg(pid));
        if (!status.open(QIODevice::ReadOnly))
            continue;
        // "pid (name) state parent …"; a zombie is no service any more.
        const auto fields = status.readAll().split(')').last().trimmed().split(' ');
        if (fields.size() > 1 && fields[0] != "Z" && fields[1].toInt() == parent)
            found.push_back(pid);
    }
    return found;
}

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

    /** Where the center of a swatch of the grid lies in the window. */
    QPoint swatch(int row, int column) const
    {
        const auto *view = picker.view();
        const double padding = view->width() > 500 ? 20 : 16;
        const double width = view->width() - 2 * padding;
        // Below the navigation bar, the tab picker and the space between.
        const double top = 55 + 32 + (view->width() > 500 ? 16 : 20);
        const QPointF inView(padding + (column + 0.5) * width / 12, top + (row + 0.5) * (width / 1.2) / 10);
        return view->mapToScene(inView).toPoint();
    }
    QPoint closeButton() const
    {
        const auto *view = picker.view();
        const double padding = view->width() > 500 ? 20 : 16;
        return view->mapToScene(QPointF(view->width() - padding - 15, 55.0 / 2)).toPoint();
    }

    QQuickWindow window;
    FVColorPickerViewController picker;
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

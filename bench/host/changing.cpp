// Times what changes while a picker is shown, and what grows: the first frame with each tab saved as the last one, the
// switch of tabs, the window's other size, suggested colors, and many presentations in one host with what they leave
// behind. One JSON object is printed.
//
// usage: favrin-bench-changing [rounds [presentations]]

#include "host/benchhost.h"

#include <QDir>
#include <QJsonDocument>
#include <QTemporaryDir>

#include <array>

using namespace favrin::bench;

namespace {

constexpr std::array<const char *, 3> tabNames = {
    "first frame with the grid saved", "first frame with the spectrum saved", "first frame with the sliders saved"};
constexpr std::array<const char *, 3> switchNames = {"switch to the grid", "switch to the spectrum",
                                                     "switch to the sliders"};

std::vector<Samples> samplesOf(const std::array<const char *, 3> &names)
{
    std::vector<Samples> list;
    for (const char *name : names)
        list.push_back({name, "ms"});
    return list;
}

bool firstFrames(BenchHost &host, std::vector<Samples> &frames, std::vector<Samples> &switches, int rounds)
{
    Samples unused{"", ""};
    for (int round = 0; round < rounds; ++round) {
        for (int tab = 0; tab < 3; ++tab) {
            // Whatever was saved, the tab is chosen and saved now. The second switch finds its view made.
            if (!host.present(unused, false))
                return false;
            host.choose((tab + 1) % 3);
            if (!host.switchTo(switches[static_cast<std::size_t>(tab)], tab))
                return false;
            if (!host.finish() || !host.present(frames[static_cast<std::size_t>(tab)], false) || !host.finish())
                return false;
        }
    }
    return true;
}

bool sizes(BenchHost &host, Samples &rotation, int rounds)
{
    Samples unused{"", ""};
    if (!host.present(unused, false))
        return false;
    for (int round = 0; round < 2 * rounds; ++round) {
        if (!host.resize(rotation, round % 2 ? QSize(900, 700) : QSize(700, 900)))
            return false;
    }
    return host.finish();
}

bool suggestions(BenchHost &host, Samples &without, Samples &with, int rounds)
{
    QList<FVColor> colors;
    for (int i = 0; i < 1000; ++i)
        colors.append(FVColor(double(i % 10) / 10, double(i / 10 % 10) / 10, double(i / 100) / 10));
    for (int round = 0; round < rounds; ++round) {
        host.picker().setSuggestedColors({});
        if (!host.present(without, false) || !host.finish())
            return false;
        host.picker().setSuggestedColors(colors);
        if (!host.present(with, false) || !host.finish())
            return false;
    }
    host.picker().setSuggestedColors({});
    return true;
}

qsizetype openHandles()
{
    return QDir(QStringLiteral("/proc/self/fd"))
        .entryList(QDir::NoDotAndDotDot | QDir::AllEntries | QDir::System)
        .size();
}

QJsonObject holdings()
{
    return {{QStringLiteral("private_mb"),
             processMemory(QCoreApplication::applicationPid(), "Private_Dirty:", "smaps_rollup")},
            {QStringLiteral("handles"), openHandles()}};
}

/** Presents again and again. The first ones fill caches, so what grows is counted from the tenth part on. */
bool manyPresentations(BenchHost &host, int count, QJsonObject &report)
{
    Samples times{"present to first frame, again and again", "ms"};
    for (int i = 0; i < count; ++i) {
        if (!host.present(times, false) || !host.finish())
            return false;
        if (i + 1 == std::max(1, count / 10))
            report[QStringLiteral("after the first tenth")] = holdings();
    }
    BenchHost::rest(500);
    report[QStringLiteral("count")] = count;
    report[QStringLiteral("after all")] = holdings();
    report[QStringLiteral("times")] = times.report();
    return true;
}

} // namespace

int main(int argc, char *argv[])
{
    const QTemporaryDir data;
    qputenv("FAVRIN_DEFAULTS_FILE", QFile::encodeName(data.path() + QStringLiteral("/defaults.sqlite")));
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QQuickWindow::setGraphicsApi(QSGRendererInterface::Software);
    QGuiApplication application(argc, argv);
    const int rounds = argc > 1 ? std::max(1, atoi(argv[1])) : 5;
    const int presentations = argc > 2 ? atoi(argv[2]) : 500;

    BenchHost host;
    auto frames = samplesOf(tabNames);
    auto switches = samplesOf(switchNames);
    Samples rotation{"window's other size to settled frame", "ms"};
    Samples without{"present to first frame, no suggested colors", "ms"};
    Samples with{"present to first frame, 1000 suggested colors", "ms"};
    QJsonObject report;
    if (!firstFrames(host, frames, switches, rounds) || !sizes(host, rotation, rounds) ||
        !suggestions(host, without, with, rounds))
        return 1;
    for (auto *list : {&frames, &switches}) {
        for (auto &samples : *list)
            report[QLatin1String(samples.name)] = samples.report();
    }
    for (auto *samples : {&rotation, &without, &with})
        report[QLatin1String(samples->name)] = samples->report();
    QJsonObject growth;
    if (presentations > 0 && !manyPresentations(host, presentations, growth))
        return 1;
    report[QStringLiteral("presentations")] = growth;
    std::printf("%s\n", QJsonDocument(report).toJson(QJsonDocument::Compact).constData());
    return 0;
}

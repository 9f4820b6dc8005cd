// Times what changes while a picker is shown, and what grows: the first frame with each tab saved as the last one, the
// switch of tabs, the window's other size, numbers of suggested colors, and many presentations in one host and many
// steps of one drag with what they leave behind. One JSON object is printed.
//
// usage: favrin-bench-changing [rounds [presentations [drag steps]]]

#include "host/benchhost.h"

#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>

#include <array>
#include <cstdlib>

using namespace favrin::bench;

namespace {

constexpr std::array<const char *, 3> tabNames = {
    "first frame with the grid saved", "first frame with the spectrum saved", "first frame with the sliders saved"};
constexpr std::array<const char *, 3> switchNames = {"switch to the grid", "switch to the spectrum",
                                                     "switch to the sliders"};

struct Suggestions
{
    int count;
    Samples frames;
};

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

QList<FVColor> suggestedColors(int count)
{
    QList<FVColor> colors;
    for (int i = 0; i < count; ++i)
        colors.append(FVColor(double(i % 10) / 10, double(i / 10 % 10) / 10, double(i / 100) / 10));
    return colors;
}

bool suggestions(BenchHost &host, std::array<Suggestions, 4> &numbers, int rounds)
{
    for (int round = 0; round < rounds; ++round) {
        for (auto &[count, frames] : numbers) {
            host.picker().setSuggestedColors(suggestedColors(count));
            if (!host.present(frames, false) || !host.finish())
                return false;
        }
    }
    host.picker().setSuggestedColors({});
    return true;
}

qsizetype openHandles(qint64 process)
{
    return QDir(QStringLiteral("/proc/%1/fd").arg(process))
        .entryList(QDir::NoDotAndDotDot | QDir::AllEntries | QDir::System)
        .size();
}

/** What a process holds after so much of something. */
QJsonObject holdings(qint64 process, int count)
{
    const auto memory = [process](const char *field) { return processMemory(process, field, "smaps_rollup"); };
    return {{QStringLiteral("count"), count},
            {QStringLiteral("private_mb"), memory("Private_Dirty:") + memory("Private_Clean:")},
            {QStringLiteral("pss_mb"), memory("Pss:")},
            {QStringLiteral("handles"), openHandles(process)}};
}

/** After every tenth part. */
bool isLookedAt(int done, int count)
{
    return done % std::max(1, count / 10) == 0;
}

bool manyPresentations(BenchHost &host, int count, QJsonArray &points)
{
    Samples times{"", ""};
    for (int done = 1; done <= count; ++done) {
        if (!host.present(times, false) || !host.finish())
            return false;
        if (isLookedAt(done, count)) {
            // Processes that leave are reaped, and what is to be deleted is.
            BenchHost::rest(300);
            points.append(holdings(QCoreApplication::applicationPid(), done));
        }
    }
    return true;
}

/** One drag in the spectrum, as fast as the picker takes it. */
bool manySteps(BenchHost &host, int count, QJsonArray &points)
{
    constexpr int spectrum = 1;
    constexpr int batch = 100;
    Samples unused{"", ""};
    if (!host.present(unused, false))
        return false;
    host.choose(spectrum);
    host.beginDrag();
    for (int done = batch; done <= count; done += batch) {
        if (!host.dragSome(batch))
            return false;
        if (isLookedAt(done, count))
            points.append(holdings(servicePid(), done));
    }
    host.endDrag();
    return host.finish();
}

} // namespace

int main(int argc, char *argv[])
{
    const Surroundings surroundings;
    QGuiApplication application(argc, argv);
    const auto argument = [&](int place, int usual) { return argc > place ? std::atoi(argv[place]) : usual; };
    const int rounds = std::max(1, argument(1, 5));
    const int presentations = argument(2, 500);
    const int steps = argument(3, 100'000);

    BenchHost host;
    auto frames = samplesOf(tabNames);
    auto switches = samplesOf(switchNames);
    Samples rotation{"window's other size to settled frame", "ms"};
    std::array<Suggestions, 4> numbers = {{
        {0, {"present to first frame, no suggested colors", "ms"}},
        {10, {"present to first frame, 10 suggested colors", "ms"}},
        {100, {"present to first frame, 100 suggested colors", "ms"}},
        {1000, {"present to first frame, 1000 suggested colors", "ms"}},
    }};
    QJsonArray afterPresentations;
    QJsonArray afterSteps;
    const char *failed = !firstFrames(host, frames, switches, rounds)                  ? "first frames"
                         : !sizes(host, rotation, rounds)                              ? "sizes"
                         : !suggestions(host, numbers, rounds)                         ? "suggested colors"
                         : !manyPresentations(host, presentations, afterPresentations) ? "presentations"
                         : !manySteps(host, steps, afterSteps)                         ? "drag steps"
                                                                                       : nullptr;
    if (failed) {
        std::fprintf(stderr, "failed: %s\n", failed);
        return 1;
    }
    QJsonObject report;
    for (auto *list : {&frames, &switches}) {
        for (auto &samples : *list)
            report[QLatin1String(samples.name)] = samples.report();
    }
    report[QLatin1String(rotation.name)] = rotation.report();
    for (auto &[count, samples] : numbers)
        report[QLatin1String(samples.name)] = samples.report();
    report[QStringLiteral("after presentations")] = afterPresentations;
    report[QStringLiteral("after drag steps")] = afterSteps;
    std::printf("%s\n", QJsonDocument(report).toJson(QJsonDocument::Compact).constData());
    return 0;
}

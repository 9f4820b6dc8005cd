// Times what an app and its user wait for: from present() to the first frame of the picker in the app's window, with a
// process started for it (cold) and with one started ahead, and from an input event at the app to the pick message and
// to the changed frame. Also the memory of the picker's process. Medians with ranges; one JSON object on the last line.
//
// usage: favrin-bench-presenting [rounds [cold|ahead|drags]...]

#include "host/benchhost.h"

#include <QJsonDocument>

#include <array>

using namespace favrin::bench;

namespace {

QPointF swatch(int step)
{
    return {(step % 12 + 0.5) / 12, (step / 12 % 10 + 0.5) / 10};
}

QPointF fieldPlace(int step)
{
    return {0.05 + 0.9 * (step * 7 % 101) / 101, 0.05 + 0.9 * (step * 13 % 97) / 97};
}

/** On the red track, the first row of its tab. */
QPointF trackPlace(int step)
{
    return {0.1 + 0.45 * (step * 7 % 101) / 101, 0.19};
}

/** What a drag in a tab costs. */
struct Drags
{
    int tab;
    QPointF (*place)(int step);
    Samples message;
    Samples frame;
};

} // namespace

int main(int argc, char *argv[])
{
    const Surroundings surroundings;
    QGuiApplication application(argc, argv);
    const int rounds = argc > 1 ? std::max(1, atoi(argv[1])) : 15;
    // All parts, unless some are named.
    const auto includes = [&](const char *part) {
        return argc < 3 ||
               std::any_of(argv + 2, argv + argc, [part](const char *name) { return !qstrcmp(name, part); });
    };

    Samples cold{"present to first frame, cold", "ms"};
    Samples ahead{"present to first frame, started ahead", "ms"};
    std::array<Drags, 3> drags = {{
        {0, swatch, {"grid drag: event to pick message", "ms"}, {"grid drag: event to changed frame", "ms"}},
        {1,
         fieldPlace,
         {"spectrum drag: event to pick message", "ms"},
         {"spectrum drag: event to changed frame", "ms"}},
        {2,
         trackPlace,
         {"red slider drag: event to pick message", "ms"},
         {"red slider drag: event to changed frame", "ms"}},
    }};
    Samples memory{"service: proportional memory", "MB"};
    Samples peak{"service: peak resident memory", "MB"};
    BenchHost bench;
    for (int round = 0; round < rounds; ++round) {
        // In turns, so that a busy moment of the machine meets both.
        if (includes("cold")) {
            if (!bench.present(cold, false))
                return 1;
            bench.memory(memory, peak);
            if (!bench.finish())
                return 1;
        }
        if (includes("ahead") && (!bench.present(ahead, true) || !bench.finish()))
            return 1;
    }
    std::vector<Samples *> all = {&cold, &ahead, &memory, &peak};
    if (includes("drags") && !bench.present(cold, false))
        return 1;
    for (auto &[tab, place, message, frame] : drags) {
        if (!includes("drags"))
            break;
        bench.choose(tab);
        if (!bench.drag(message, frame, place))
            return 1;
        all.insert(all.end(), {&message, &frame});
    }
    QJsonObject report;
    for (auto *samples : all)
        report[QLatin1String(samples->name)] = samples->report();
    std::printf("%s\n", QJsonDocument(report).toJson(QJsonDocument::Compact).constData());
    return 0;
}

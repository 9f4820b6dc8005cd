"""The tables of bench/run."""

import outcomes
import startup
from outcomes import column, known, total
from statistics import median


def spread(values, digits=1):
    return f"{median(values):.{digits}f} ({min(values):.{digits}f}–{max(values):.{digits}f})"


def table(head, rows):
    lines = ["| " + " | ".join(head) + " |", "|" + "---|" * len(head)]
    return "\n".join(lines + ["| " + " | ".join(str(cell) for cell in row) + " |" for row in rows]) + "\n"


def aims(found):
    return table(["figure", "value", "first and second half of the rounds", "at most", "reached"], [
        (each["figure"], "–" if each["value"] is None else f"{each['value']:.3g}",
         ", ".join(f"{half:.3g}" for half in each["halves"]) or "–", each["at_most"],
         "yes" if each["reached"] else "**no**") for each in found])


def largest(field):
    return lambda run: max(process[field] for process in run["processes"])


def start(results):
    programs, processes = [], []
    for name, runs in results.items():
        runs = known(runs)
        if not runs:
            continue
        programs.append((name, spread(column(runs, lambda run: run["painted"])),
                         *(spread(column(runs, total(field))) for field in ("peak", "pss", "private")),
                         round(median(column(runs, largest("peak"))), 1), int(median(column(runs, total("processor_ms")))),
                         len(runs[0]["processes"])))
        for i, process in enumerate(runs[0]["processes"]):
            middle = {field: median(run["processes"][i][field] for run in runs if i < len(run["processes"]))
                      for field in ("peak", "pss", "private", "faults", "disk_faults", "libraries", "threads")}
            processes.append((name if process["name"] in name else f"{name}: {process['name']}",
                              *(f"{middle[field]:.1f}" for field in ("peak", "pss", "private")),
                              *(int(middle[field]) for field in ("faults", "disk_faults", "libraries", "threads"))))
    return (table(["program", "first painted ms", "peak RSS MB, all processes", "PSS MB", "private MB",
                   "peak RSS MB, largest process", "processor ms", "processes"], programs)
            + "\n" + table(["process, 0.6 s after that", "peak RSS MB", "PSS MB", "private MB", "minor page faults",
                            "major page faults", "libraries mapped", "threads"], processes))


def linking(results):
    return table(["program", "linking before main, ms", "of it relocation, ms", "symbols looked up", "relative relocations"],
                 [(name, *(spread([run[field] for run in runs]) for field in ("ms", "relocation_ms")),
                   *(int(median(run[field] for run in runs)) for field in ("symbols", "relative")))
                  for name, runs in results.items() if runs])


def phases(results):
    return table(["phase, in the order of their ends", "ends, ms after exec", "after the one before, ms"],
                 startup.phase_rows(results))


def opening(results):
    return table(["first opening in a running app", "ms"],
                 [(name, spread(known(values))) for name, values in outcomes.opening_series(results).items()
                  if known(values)])


def drags(results):
    rows = [(scale + "x", name, *(", ".join(f"{report[name][key]:.2f}" for report in known(passes))
                                  for key in ("median", "min", "p99")))
            for scale, passes in results.items() for name in (passes[0] or {}) if "drag" in name]
    return table(["scale", "drag, two passes", "median ms", "smallest", "99th percentile"], rows)


def changes(results):
    text = table(["change", "ms"], [(name, f"{numbers['median']:.1f} ({numbers['min']:.1f}–{numbers['max']:.1f})")
                                    for name, numbers in results.items() if "median" in numbers])
    for title, what in (("Presentations in one host", "presentations"),
                        ("Steps of one drag, seen at the picker's process", "drag steps")):
        text += f"\n{title}:\n\n" + table(
            ["after " + what, "private memory MB", "PSS MB", "handles"],
            [(point["count"], f"{point['private_mb']:.1f}", f"{point['pss_mb']:.1f}", point["handles"])
             for point in results["after " + what]])
    return text


def hiding(results):
    return table(["100 changes of what the picker would show", "frames of the picker", "frames of the host",
                  "shown again to the first frame, ms"],
                 [(way, numbers["picker_frames"], numbers["host_frames"], f"{numbers['shown_again_ms']:.1f}")
                  for way, numbers in sorted(results.items())])


def conversions(results):
    naive = next(each["ns"] for each in results if each["name"].startswith("plain"))
    return table(["sRGB to Display P3", "ns per color", "ratio to the plain formula", "largest error"],
                 [(each["name"], f"{each['ns']:.0f} ({each['min']:.0f}–{each['max']:.0f})", f"{each['ns'] / naive:.2f}",
                   f"{each['error']:.1g}") for each in results])


def durations(results):
    return table(["benchmark", "time"], [(name, f"{each['time']:.1f} {each['unit']}") for name, each in results.items()])


def idle(results):
    return table([f"{results['idle_seconds']} s in which nobody does anything, 35 s after the opening", "count"],
                 [("frames", results["idle_frames"])]
                 + [(f"wake-ups of {name}", count) for name, count in results["idle_wake_ups"].items()])


TITLES = {
    "start": ("From exec to the first painted frame", start), "linking": ("Linking", linking),
    "phases": ("Where the start of the tool goes", phases), "opening": ("Opening in a running app", opening),
    "drags": ("Drags: from the event at the host", drags), "changes": ("Changes and growth", changes),
    "hiding": ("While the host does not show it", hiding), "conversions": ("Color conversions", conversions),
    "memory": ("Filling the spectrum beside writing memory", durations),
    "favorites": ("The number of favorites", durations), "idle": ("Idle", idle)}


def report(results):
    machine = results["machine"]
    text = (f"{machine['date']}; {machine['processor']}, {machine['processors']} processors, kernel {machine['kernel']}, "
            f"load before {machine['load']:.1f}; {machine['rounds']} rounds; {', '.join(machine['versions'])}. "
            "Medians (smallest–largest); ratios are medians of the ratios within a round.\n")
    text += "\n## What is aimed at\n\n" + aims(results["outcomes"])
    for stage, (title, write) in TITLES.items():
        if results.get(stage):
            text += f"\n## {title}\n\n{write(results[stage])}"
    return text

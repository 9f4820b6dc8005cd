"""The tables of bench/run."""

from statistics import median

PICKER = "favrin-color-picker"


def spread(values, digits=1):
    return f"{median(values):.{digits}f} ({min(values):.{digits}f}–{max(values):.{digits}f})"


def table(head, rows):
    lines = ["| " + " | ".join(head) + " |", "|" + "---|" * len(head)]
    return "\n".join(lines + ["| " + " | ".join(str(cell) for cell in row) + " |" for row in rows]) + "\n"


def ratio(ours, theirs):
    """The median of the ratios within a round."""
    both = [a / b for a, b in zip(ours, theirs) if a and b]
    return median(both) if both else float("nan")


def in_halves(ours, theirs):
    """A ratio over all rounds, and over the first and the second half of them: the same outcome twice, or not."""
    middle = len(ours) // 2
    halves = f" ({ratio(ours[:middle], theirs[:middle]):.2f}, {ratio(ours[middle:], theirs[middle:]):.2f})" if middle else ""
    return f"{ratio(ours, theirs):.2f}{halves}"


def verdict(value, aim):
    return "yes" if value <= aim else "**no**"


def aims(head, rows):
    """Rows of a name, the two series and the largest ratio that is aimed at."""
    return table([head, "ratio (first half, second half of the rounds)", "at most", "reached"],
                 [(name, in_halves(ours, theirs), aim, verdict(ratio(ours, theirs), aim))
                  for name, ours, theirs, aim in rows])


def column(runs, value):
    return [value(run) if run else None for run in runs]


def known(values):
    return [value for value in values if value is not None]


def total(field):
    return lambda run: sum(process[field] for process in run["processes"])


def largest(field):
    return lambda run: max(process[field] for process in run["processes"])


def start(results):
    rows = []
    for name, runs in results.items():
        if not any(runs):
            continue
        rows.append((name, spread(known(column(runs, lambda run: run["painted"]))),
                     *(spread(known(column(runs, total(field)))) for field in ("peak", "pss", "private")),
                     round(median(known(column(runs, largest("peak")))), 1),
                     *(int(median(known(column(runs, total(field))))) for field in ("faults", "processor_ms")),
                     int(median(known(column(runs, largest("libraries"))))),
                     len(next(run for run in runs if run)["processes"])))
    text = table(["program", "first painted ms", "peak RSS MB, all processes", "PSS MB", "private MB",
                  "peak RSS MB, largest process", "page faults", "processor ms", "libraries, most", "processes"], rows)

    def painted(name):
        return column(results[name], lambda run: run["painted"])

    def footprint(name):
        return column(results[name], total("pss"))
    against = [("zenity", 0.5), ("kdialog", 0.5), ("Qt Quick dialog, software", 1.0), ("Qt widget dialog", 1.4)]
    text += "\n" + aims("first painted, the picker to", [(name, painted(PICKER), painted(name), aim)
                                                         for name, aim in against])
    text += "\n" + aims("peak RSS of the picker's process alone to", [
        (name, column(results[PICKER], lambda run: run["processes"][-1]["peak"]), column(results[name], total("peak")), aim)
        for name, aim in against])
    return text + "\n" + aims("peak RSS of all processes to", [
        (name, column(results[PICKER], total("peak")), column(results[name], total("peak")), aim) for name, aim in against]
    ) + "\n" + aims("PSS of all processes to", [(name, footprint(PICKER), footprint(name), aim) for name, aim in against])


def opening(results):
    keys = {"picker, cold": "present to first frame, cold",
            "picker, service started ahead": "present to first frame, started ahead"}
    series = {name: column(runs, lambda run, key=keys.get(name): run[key]["median"] if key else run["first"])
              for name, runs in results.items()}
    text = table(["first opening in a running app", "ms"],
                 [(name, spread(known(values))) for name, values in series.items() if known(values)])
    return text + "\n" + aims("to the Qt widget dialog's first opening", [
        ("cold", series["picker, cold"], series["Qt widget dialog"], 3.5),
        ("service started ahead", series["picker, service started ahead"], series["Qt widget dialog"], 0.5)])


def drags(results):
    rows = []
    for scale, report in results.items():
        for name, numbers in (report or {}).items():
            if "drag" not in name:
                continue
            aim = 1.0 if "message" in name else 2.5 if scale == "1" else None
            rows.append((scale + "x", name, *(f"{numbers[key]:.2f}" for key in ("median", "min", "p99")), aim or "–",
                         verdict(numbers["median"], aim) if aim else "–"))
    return table(["scale", "drag", "median ms", "smallest", "99th percentile", "at most", "reached"], rows)


def changes(results):
    rows = [(name, f"{numbers['median']:.1f} ({numbers['min']:.1f}–{numbers['max']:.1f})")
            for name, numbers in results.items() if "median" in numbers]
    text = table(["change", "ms"], rows)
    many = results.get("presentations") or {}
    if "after all" in many:
        rows = [(when, f"{many[when]['private_mb']:.1f}", many[when]["handles"])
                for when in ("after the first tenth", "after all")]
        text += f"\n{many['count']} presentations in one host:\n\n" + table(
            ["host", "private memory MB", "handles"], rows)
    return text


def conversions(results):
    aims = {"the picker's, alone": 1.0, "the picker's, 120 at a time": 0.5}
    naive = next(each["ns"] for each in results if each["name"].startswith("plain"))
    rows = []
    for each in results:
        ratio, aim = each["ns"] / naive, aims.get(each["name"])
        rows.append((each["name"], f"{each['ns']:.0f} ({each['min']:.0f}–{each['max']:.0f})", f"{ratio:.2f}",
                     f"{each['error']:.1g}", aim or "–", verdict(ratio, aim) if aim else "–"))
    return table(["sRGB to Display P3", "ns per color", "ratio to the plain formula", "largest error", "at most",
                  "reached"], rows)


def durations(results):
    return table(["benchmark", "time"], [(name, f"{each['time']:.1f} {each['unit']}") for name, each in results.items()])


def idle(results):
    return table(["30 s in which nobody does anything", "count"],
                 [("frames", results["idle_frames"])]
                 + [(f"wake-ups of {name}", count) for name, count in results["idle_wake_ups"].items()])


TITLES = {
    "start": ("From exec to the first painted frame", start), "opening": ("Opening in a running app", opening),
    "drags": ("Drags: from the event at the host", drags), "changes": ("Changes and growth", changes),
    "conversions": ("Color conversions", conversions), "memory": ("Filling the spectrum beside writing memory", durations),
    "favorites": ("The number of favorites", durations), "idle": ("Idle", idle)}


def report(results):
    machine = results["machine"]
    text = (f"{machine['date']}; {machine['processor']}, {machine['processors']} processors, kernel {machine['kernel']}, "
            f"load before {machine['load']:.1f}; {', '.join(machine['versions'])}. "
            "Medians (smallest–largest); ratios are medians of the ratios within a round.\n")
    for stage, (title, write) in TITLES.items():
        if results.get(stage):
            text += f"\n## {title}\n\n{write(results[stage])}"
    return text

"""What bench/run aims at, and whether a run reached it."""

from itertools import combinations
from statistics import median

PICKER = "favrin-color-picker"
SHARED_AIMS = {"zenity": 0.5, "kdialog": 0.5, "Qt Quick dialog, software": 1.0, "Qt widget dialog": 1.4}


def known(values):
    return [value for value in values if value is not None]


def column(runs, value):
    return [value(run) if run else None for run in runs]


def total(field):
    return lambda run: sum(process[field] for process in run["processes"])


def picker_alone(run):
    """The one that shows the picker, without the tool that started it."""
    return run["processes"][-1]["peak"]


def ratio(ours, theirs):
    """The median of the ratios within a round."""
    both = [a / b for a, b in zip(ours, theirs) if a and b]
    return median(both) if both else None


def slope(points, field):
    """Growth per hundred: the median of the slopes between any two points, which no single odd point moves."""
    found = [(b[field] - a[field]) / (b["count"] - a["count"]) * 100 for a, b in combinations(points, 2)]
    return median(found) if found else None


def outcome(figure, value, aim, halves=()):
    """Halves: the same over the first and the second half of the rounds: the same outcome twice, or not."""
    return {"figure": figure, "value": value, "halves": known(halves), "at_most": aim,
            "reached": value is not None and value <= aim}


def ratio_outcome(figure, ours, theirs, aim):
    middle = len(ours) // 2
    halves = [ratio(ours[part], theirs[part]) for part in (slice(middle), slice(middle, None))] if middle else []
    return outcome(figure, ratio(ours, theirs), aim, halves)


def start(results):
    ours = results[PICKER]
    measures = [("exec to first painted frame", lambda run: run["painted"], lambda run: run["painted"]),
                ("peak memory of the picker's process", picker_alone, total("peak")),
                ("peak memory of all processes", total("peak"), total("peak")),
                ("proportional memory of all processes", total("pss"), total("pss"))]
    return [ratio_outcome(f"{figure}, to {name}", column(ours, our_value), column(results[name], their_value), aim)
            for figure, our_value, their_value in measures for name, aim in SHARED_AIMS.items()]


def opening_series(results):
    keys = {"picker, cold": "present to first frame, cold",
            "picker, service started ahead": "present to first frame, started ahead"}
    return {name: column(runs, lambda run, key=keys.get(name): run[key]["median"] if key else run["first"])
            for name, runs in results.items()}


def opening(results):
    series = opening_series(results)
    theirs = series["Qt widget dialog"]
    return [ratio_outcome("first opening in a running app, cold, to the Qt widget dialog's", series["picker, cold"], theirs,
                          3.5),
            ratio_outcome("the same with a service started ahead", series["picker, service started ahead"], theirs, 0.5)]


def drags(results):
    found = []
    for scale, passes in results.items():
        for name in (passes[0] or {}):
            aim = 1.0 if "message" in name else 2.5 if scale == "1" else None
            if "drag" in name and aim:
                medians = known(column(passes, lambda report, key=name: report[key]["median"]))
                found.append(outcome(f"{name} at {scale}x, median ms", median(medians), aim, medians))
    return found


def changes(results):
    found = []
    for what, aim in (("presentations", 0.2), ("drag steps", 0.02)):
        # The first point still fills caches.
        points = results["after " + what][1:]
        if len(points) < 2:
            continue
        found.append(outcome(f"private memory, MB per 100 {what}", slope(points, "private_mb"), aim))
        found.append(outcome(f"handles, per 100 {what}", slope(points, "handles"), 0))
    return found


def conversions(results):
    plain = next(each["ns"] for each in results if each["name"].startswith("plain"))
    found = []
    for each in results:
        if each["name"].startswith("the picker's"):
            aim = 0.5 if "120" in each["name"] else 1.0
            found.append(outcome(f"conversion, {each['name']}, to the plain formula", each["ns"] / plain, aim))
            found.append(outcome(f"conversion, {each['name']}, largest error", each["error"], 1e-12))
    return found


def hiding(results):
    return [outcome(f"frames of the picker, {way}", numbers["picker_frames"], 0)
            for way, numbers in results.items() if way != "shown"]


def idle(results):
    seconds = results["idle_seconds"]
    return [outcome(f"frames in {seconds} s idle", results["idle_frames"], 0)] + [
        outcome(f"wake-ups of {name} in {seconds} s idle", count, 0) for name, count in results["idle_wake_ups"].items()]


def outcomes(report):
    stages = {"start": start, "opening": opening, "drags": drags, "changes": changes, "hiding": hiding,
              "conversions": conversions, "idle": idle}
    return [each for stage, find in stages.items() if report.get(stage) for each in find(report[stage])]

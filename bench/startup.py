"""Where the start of the tool and of its picker goes: what is linked, and what passes from exec to the first frame."""

import json
import os
import pathlib
import re
import subprocess
import tempfile
from statistics import median

SYSTEM_CALLS = "execve,prctl,connect"
# Phases end with the first line, after the phase before, that has this text; of the tool's system calls, of the
# service's, or of what the service says on its connection.
PHASES = [
    ("tool: linked, service spawned", "service", "execve("),
    ("tool: display opened", "tool", "X11-unix"),
    ("service: linked", "service", "PR_SET_PDEATHSIG"),
    ("service: confined, application made, connection opened", "messages", "get_registry"),
    ("service: types registered, views loaded", "messages", "get_registry"),
    ("service: told about its host", "messages", "traits_done"),
    ("service: views made", "messages", ".ready()"),
    ("both: size settled, told to present", "messages", ".present()"),
    ("service: window made, first frame drawn", "messages", ".attach(wl_buffer"),
]


def watched(watch, command, environment, error=subprocess.DEVNULL):
    done = subprocess.run([watch, *command], env={**os.environ, **environment}, stdin=subprocess.DEVNULL,
                          stdout=subprocess.PIPE, stderr=error, text=True, timeout=120)
    return json.loads(done.stdout.strip().splitlines()[-1])


def system_calls(text):
    """Start of the tool, and the calls (process, seconds, text); the service's threads are not told from the tool's."""
    calls = [(int(process), float(time), rest) for process, time, rest
             in re.findall(r"^(\d+) +(\d+\.\d+) (.*)$", text, re.MULTILINE)]
    tool = calls[0][0]
    service = next(process for process, _, rest in calls if process != tool and rest.startswith("execve("))
    return calls[0][1], {"tool": [call[1:] for call in calls if call[0] == tool],
                         "service": [call[1:] for call in calls if call[0] == service]}


def messages(text, start):
    """What the service sent and heard; libwayland counts microseconds of the day's clock in 32 bits."""
    epoch = int(start * 1e6)
    found = []
    for stamp, rest in re.findall(r"^\[ *(\d+\.\d+)\] (.*)$", text, re.MULTILINE):
        after = (int(float(stamp) * 1000) - epoch) % 2**32
        found.append((start + after / 1e6, rest))
    return found


def ends(lines):
    """When each phase ended; nothing for one that was not seen."""
    last = {source: 0 for source in lines}
    times = []
    for _, source, text in PHASES:
        place = next((i for i in range(last[source], len(lines[source])) if text in lines[source][i][1]), None)
        times.append(None if place is None else lines[source][place][0])
        if place is not None:
            last[source] = place + 1
    return times


def phases(watch, tool, rounds):
    """For each phase its end in every run, in milliseconds after the exec of the tool. Being traced costs a little."""
    runs = []
    with tempfile.TemporaryDirectory() as scratch:
        calls, said = pathlib.Path(scratch, "calls"), pathlib.Path(scratch, "said")
        command = ["strace", "-f", "--seccomp-bpf", "-ttt", "-qq", "-o", str(calls), "-e", "trace=" + SYSTEM_CALLS, tool]
        for _ in range(rounds + 1):
            with said.open("w") as error:
                seen = watched(watch, command, {"WAYLAND_DEBUG": "client"}, error)
            start, lines = system_calls(calls.read_text())
            lines["messages"] = messages(said.read_text(), start)
            runs.append([time and (time - start) * 1000 for time in [*ends(lines), seen["painted_at"]]])
    names = [name for name, _, _ in PHASES] + ["tool: frame shown on the display"]
    # The first run fills caches.
    return [{"phase": name, "ends": [run[i] for run in runs[1:]]} for i, name in enumerate(names)]


def statistics(folder, name):
    """What the dynamic linker says of a program."""
    text = "".join(file.read_text() for file in sorted(pathlib.Path(folder).glob(name + ".*")))

    def largest(label):
        return max((int(value) for value in re.findall(re.escape(label) + r": (\d+)", text)), default=0)
    return {"cycles": largest("total startup time in dynamic loader"),
            "relocation_cycles": largest("time needed for relocation"),
            "symbols": largest("number of relocations"), "relative": largest("number of relative relocations")}


def clock_rate(linker_clock):
    """How many of the dynamic linker's cycles, as it prints them, are a second."""
    environment = {**os.environ, "LD_DEBUG": "statistics"}
    said = subprocess.run([linker_clock], env=environment, capture_output=True, text=True, check=True).stderr
    return int(re.search(r"total startup time in dynamic loader: (\d+)", said)[1]) / 0.05


def linking(watch, programs, service, rounds):
    """For each program what linking it took. The service starts by a script, since it inherits no variables of ours."""
    results = {name: [] for name in [*programs, "favrin-color-picker-service"]}
    rate = clock_rate(pathlib.Path(watch).with_name("linker-clock"))
    with tempfile.TemporaryDirectory() as scratch:
        script = pathlib.Path(scratch, "service")
        script.write_text(f'#!/bin/sh\nLD_DEBUG=statistics LD_DEBUG_OUTPUT={scratch}/linked exec "{service}"\n')
        script.chmod(0o755)
        for turn in range(rounds + 1):
            for name, (command, environment) in programs.items():
                own = {"LD_DEBUG": "statistics", "LD_DEBUG_OUTPUT": scratch + "/program",
                       "FAVRIN_COLOR_PICKER_SERVICE": str(script)}
                # The watcher is linked too; the linker of what it starts is what counts.
                watched(watch, ["env", *[f"{key}={value}" for key, value in {**environment, **own}.items()], *command], {})
                found = {name: statistics(scratch, "program"), "favrin-color-picker-service": statistics(scratch, "linked")}
                for program, numbers in found.items():
                    if turn and numbers["cycles"]:
                        results[program].append({**numbers, "ms": numbers["cycles"] / rate * 1000,
                                                 "relocation_ms": numbers["relocation_cycles"] / rate * 1000})
                for file in pathlib.Path(scratch).glob("*.*"):
                    file.unlink()
    return results


def phase_rows(found):
    rows, before = [], 0.0
    for each in found:
        times = [time for time in each["ends"] if time is not None]
        if not times:
            continue
        end = median(times)
        rows.append((each["phase"], f"{end:.1f} ({min(times):.1f}–{max(times):.1f})", f"{end - before:+.1f}"))
        before = end
    return rows

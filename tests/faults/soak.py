#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Drives a head unit for a long time, in every way that a driver has, and sees that it does not grow.

The head unit and its vehicle are processes of their own. What the head unit takes of memory, threads and descriptors is
written down every few seconds, drawn into a picture, and has to be level after a time of warming up.
"""

import argparse
import itertools
import json
import os
import pathlib
import random
import statistics
import subprocess
import sys
import tempfile
import time

PLOT = {"memory": "kB", "threads": "", "descriptors": ""}
COLOURS = {"memory": "#2f6f9f", "threads": "#b3541e", "descriptors": "#3f7d4f"}
WARMING_UP = 1 / 3  # of the whole time: caches fill, each screen has been shown
GROWTH = 0.03  # of memory that counts as level; what a cache of fonts or pictures still takes
LOCALES = 7
CALLERS = ("+15550100", "+49305550134", "+861055501123")

# What a round does, as commands to the vehicle. Each is as the control panel does it.
ROUND = (
    ("key navigation short", "turn tune_up 3", "turn tune_up -3"),
    ("key climate short",),
    ("key messages short",),
    ("key apps short",),
    ("key preset_1 short", "key preset_5 short", "key preset_3 short"),
    ("key seek_up short", "key seek_down short"),
    ("tune", "turn tune_up 5", "turn tune_up -5", "tune"),
    ("do ring CALLER", "do hang_up"),
    ("do ring CALLER", "key phone short", "do hang_up"),
    ("set FMTunerSource.trafficAnnouncementEnabled true", "do announce Queues_on_the_ring_road",
     "set FMTunerSource.announcementType 0"),
    ("do project wired", "do project off"),
    ("set GlobalSource.nightMode true", "set GlobalSource.nightMode false"),
    ("set GlobalSource.systemLanguage LANGUAGE",),
    ("turn volume_up 4", "turn volume_up -4"),
)


def state_of(process):
    """Of the head unit: kB of memory of its own, threads, open descriptors."""
    status = dict(line.split(":", 1) for line in pathlib.Path(f"/proc/{process.pid}/status").read_text().splitlines())
    return {"memory": int(status["RssAnon"].split()[0]), "threads": int(status["Threads"]),
            "descriptors": len(os.listdir(f"/proc/{process.pid}/fd"))}


class Vehicle:
    """A vehicle-sim, and the commands to it."""

    def __init__(self, program, directory):
        self.program, self.directory = program, directory
        self.process = subprocess.Popen([program, "--dir", directory], stdout=subprocess.PIPE, text=True)
        if "serves" not in self.process.stdout.readline():
            raise RuntimeError("the vehicle does not start")
        self.sent = self.refused = 0

    def send(self, *commands):
        done = subprocess.run([self.program, "--dir", self.directory, "send", *commands], capture_output=True, text=True,
                              check=False, timeout=60)
        self.sent += len(commands)
        if done.returncode != 0:
            self.refused += 1
            print(f"soak: {commands}: {done.stderr.strip() or done.stdout.strip()}", file=sys.stderr)
        return done.returncode == 0


def commands_of(step, chance):
    """Fills in what a round leaves open."""
    languages = [str(number) for number in range(1, LOCALES + 1)]
    for command in step:
        command = command.replace("CALLER", chance.choice(CALLERS)).replace("LANGUAGE", chance.choice(languages))
        yield "key tune_press short" if command == "tune" else command


def drive(vehicle, headunit, seconds, pause):
    """Returns the samples, each with its time."""
    chance = random.Random(4711)
    samples = []
    start = last = time.monotonic()
    for step in itertools.cycle(ROUND):
        now = time.monotonic()
        if now - start >= seconds:
            return samples
        if headunit.poll() is not None or vehicle.process.poll() is not None:
            raise RuntimeError(f"a process has ended: head unit {headunit.poll()}, vehicle {vehicle.process.poll()}")
        vehicle.send(*commands_of(step, chance))
        if now - last >= 5 or not samples:
            samples.append({"seconds": round(now - start, 1), **state_of(headunit)})
            last = now
        time.sleep(pause)


def verdict(samples):
    """What has grown, as sentences; nothing when all is level."""
    warm = samples[int(len(samples) * WARMING_UP):]
    half = len(warm) // 2
    if half == 0:
        return ["There are too few samples to tell."]
    problems = []
    for name in PLOT:
        first, second = ([sample[name] for sample in part] for part in (warm[:half], warm[half:]))
        if name == "memory":
            growth = statistics.median(second) / statistics.median(first) - 1
            if growth > GROWTH:
                problems.append(f"Memory has grown by {growth:.1%}.")
        elif max(second) > max(first):
            problems.append(f"The number of {name} has grown from {max(first)} to {max(second)}.")
    return problems


def picture(samples):
    """One diagram above the other, SVG."""
    width, height, left, gap = 900, 150, 90, 50
    end = max(samples[-1]["seconds"], 1)
    parts = []
    for number, (name, unit) in enumerate(PLOT.items()):
        values = [sample[name] for sample in samples]
        top = 30 + number * (height + gap)
        highest = max(values) * 1.1
        points = " ".join(f"{left + sample['seconds'] / end * width:.1f},{top + height - sample[name] / highest * height:.1f}"
                          for sample in samples)
        parts += [f'<text x="{left}" y="{top - 8}" font-size="14" fill="#1c2530">{name} {unit}</text>',
                  f'<rect x="{left}" y="{top}" width="{width}" height="{height}" fill="none" stroke="#d5dbe1"/>',
                  f'<polyline points="{points}" fill="none" stroke="{COLOURS[name]}" stroke-width="1.5"/>']
        for value in (min(values), max(values)):
            y = top + height - value / highest * height
            anchor = -3 if value == max(values) and value != min(values) else 11
            parts.append(f'<text x="{left - 8}" y="{y + anchor:.1f}" font-size="11" text-anchor="end" fill="#5a6673">{value}</text>')
        for share in (0, 0.25, 0.5, 0.75, 1):
            parts.append(f'<text x="{left + share * width:.1f}" y="{top + height + 16}" font-size="11" text-anchor="middle" '
                         f'fill="#5a6673">{share * end / 60:.1f} min</text>')
    total = 30 + len(PLOT) * (height + gap)
    return (f'<svg xmlns="http://www.w3.org/2000/svg" width="{left + width + 40}" height="{total}" '
            f'viewBox="0 0 {left + width + 40} {total}" font-family="sans-serif">'
            f'<rect width="100%" height="100%" fill="#ffffff"/>{"".join(parts)}</svg>\n')


def main():
    arguments = argparse.ArgumentParser(description=__doc__.split("\n", maxsplit=1)[0])
    arguments.add_argument("headunit")
    arguments.add_argument("vehicle", metavar="vehicle-sim")
    arguments.add_argument("--seconds", type=float, default=1800)
    arguments.add_argument("--pause", type=float, default=0.3, help="seconds between two steps")
    arguments.add_argument("--into", type=pathlib.Path, default=pathlib.Path("."), help="folder for soak.svg and soak.json")
    arguments = arguments.parse_args()

    arguments.into.mkdir(parents=True, exist_ok=True)
    with tempfile.TemporaryDirectory() as directory:
        vehicle = Vehicle(arguments.vehicle, directory)
        headunit = subprocess.Popen([arguments.headunit, "--vehicle", directory],
                                    env={"QT_QPA_PLATFORM": "offscreen", "QT_QUICK_BACKEND": "software",
                                         "XDG_RUNTIME_DIR": directory, **os.environ})
        try:
            if not vehicle.send("expect hmi"):
                return 1
            samples = drive(vehicle, headunit, arguments.seconds, arguments.pause)
        finally:
            for process in (headunit, vehicle.process):
                process.terminate()
                process.wait(30)
    problems = verdict(samples)
    (arguments.into / "soak.svg").write_text(picture(samples), encoding="utf-8")
    (arguments.into / "soak.json").write_text(json.dumps(samples), encoding="utf-8")
    first, last = samples[0], samples[-1]
    for name, unit in PLOT.items():
        print(f"{name}: {first[name]} at first, {last[name]} at last {unit}".rstrip())
    print(f"{vehicle.sent} commands in {last['seconds'] / 60:.1f} minutes, {vehicle.refused} refused")
    for problem in problems:
        print(f"soak: {problem}", file=sys.stderr)
    return 1 if problems or vehicle.refused else 0


if __name__ == "__main__":
    sys.exit(main())

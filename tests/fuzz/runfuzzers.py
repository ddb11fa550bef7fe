#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Runs fuzzers, two at a time, and prints what came of it: runfuzzers.py BUILD SECONDS [FUZZER...]

What they learn stays in BUILD/corpus/FUZZER and is where they go on the next time; inputs that break a rule are left in
BUILD/crashes. Exit code 1 when there is one.
"""
import os
import re
import subprocess
import sys
from concurrent.futures import ThreadPoolExecutor
from pathlib import Path

AT_A_TIME = 2
TREE = Path(__file__).resolve().parent.parent.parent


def options(build, name, seconds):
    """The engine's arguments: what it learns goes to the first folder, the others are read only."""
    seeds = build / "tests/fuzz/seeds"
    corpus = build / "corpus" / name
    corpus.mkdir(parents=True, exist_ok=True)
    folders = [corpus, seeds / name, TREE / "tests/fuzz/seeds" / name, TREE / "tests/fuzz/found" / name]
    dictionary = seeds / f"{name}.dict"
    return [
        f"-max_total_time={seconds}",
        "-timeout=20",
        "-print_final_stats=1",
        f"-artifact_prefix={build}/crashes/{name}-",
        *([f"-dict={dictionary}"] if dictionary.exists() else []),
        *(str(folder) for folder in folders if folder.is_dir()),
    ]


def last(pattern, text):
    found = re.findall(pattern, text)
    return found[-1] if found else "?"


def run(build, name, seconds):
    crashes = build / "crashes"
    before = set(crashes.glob(f"{name}-*"))
    suppressions = TREE / "tests/support/lsan.supp"
    environment = {**os.environ, "LC_ALL": "C.UTF-8", "LSAN_OPTIONS": f"suppressions={suppressions}:print_suppressions=0"}
    log = build / "crashes" / f"{name}.log"
    with log.open("wb") as output:
        status = subprocess.run([build / f"tests/fuzz/fuzz_{name}", *options(build, name, seconds)], env=environment,
                                stdin=subprocess.DEVNULL, stdout=output, stderr=subprocess.STDOUT).returncode
    text = log.read_text(errors="replace")
    found = sorted(set(crashes.glob(f"{name}-*")) - before)
    if status == 0 and not found:
        log.unlink()
    return {
        "name": name,
        "executions": last(r"stat::number_of_executed_units: (\d+)", text),
        "speed": last(r"stat::average_exec_per_sec: +(\d+)", text),
        "edges": last(r" cov: (\d+)", text),
        "corpus": last(r" corp: (\d+)/", text),
        "failed": status != 0 or bool(found),
        "found": found if found or status == 0 else [log],
    }


def main():
    build, seconds, names = Path(sys.argv[1]).resolve(), int(sys.argv[2]), sys.argv[3:]
    known = sorted(file.name[len("fuzz_"):] for file in (build / "tests/fuzz").glob("fuzz_*") if file.is_file())
    for name in names:
        if name not in known:
            sys.exit(f"there is no fuzzer '{name}'; there are: {' '.join(known)}")
    (build / "crashes").mkdir(parents=True, exist_ok=True)
    with ThreadPoolExecutor(AT_A_TIME) as pool:
        results = list(pool.map(lambda name: run(build, name, seconds), names or known))
    print(f"{'fuzzer':16} {'executions':>12} {'a second':>10} {'edges':>8} {'corpus':>8} {'found':>6}")
    for row in results:
        print(f"{row['name']:16} {row['executions']:>12} {row['speed']:>10} {row['edges']:>8} {row['corpus']:>8} {len(row['found']):>6}")
    for row in results:
        for file in row["found"]:
            print(f"{row['name']}: {file.relative_to(build.parent.parent)}")
    return 1 if any(row["failed"] for row in results) else 0


sys.exit(main())

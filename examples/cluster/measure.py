#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""measure.py WORK [LAYOUTS PICTURES FILES | --goals]: what a cluster of two workers does, printed as a table.

Layouts and pictures of many families of 60 persons, and one layout of each of many files of 3,000 persons; --goals is a
million, 500,000 and 10,000. The answers are written below WORK, counted and thrown away. Many numbers of files share one
file on disk.

Seconds are those of the clock, which other work on the machine lengthens; processor seconds are those of the workers and of
the scheduler together, and half of them is the least that two idle cores could take. The goal is a minute for a million
layouts and for 500,000 pictures, and for files the processor time that reading them alone takes, on two cores. Memory is that of
the larger worker at its peak so far: it is flat where the half and the whole take the same.
"""

import os
import pathlib
import resource
import shutil
import sys
import time

from dask.distributed import Client, LocalCluster

import make_families
import olvane
import on_dask

GOALS = [1_000_000, 500_000, 10_000]
USUAL = [60_000, 30_000, 200]
DIFFERENT = 20
JOBS_PER_TASK = 20


def prepared(folder: pathlib.Path, files: int, persons: int) -> str:
    shutil.rmtree(folder, ignore_errors=True)
    folder.mkdir(parents=True)
    for seed in range(1, min(files, DIFFERENT) + 1):
        (folder / f"{seed}.ged").write_text(make_families.family_file(seed, persons), encoding="utf-8")
    for number in range(DIFFERENT + 1, files + 1):
        os.link(folder / f"{(number - 1) % DIFFERENT + 1}.ged", folder / f"{number}.ged")
    return str(folder)


def peak_memory() -> int:
    return resource.getrusage(resource.RUSAGE_SELF).ru_maxrss // 1024


def processor_seconds() -> float:
    times = resource.getrusage(resource.RUSAGE_SELF)
    return times.ru_utime + times.ru_stime


def of_all(client: Client) -> float:
    """Of the workers and of this process, which schedules."""
    return sum(client.run(processor_seconds).values()) + processor_seconds()


def reading_goal(families: str, files: int) -> float:
    """The seconds that two cores take to read that many files and to do nothing else."""
    contents = [path.read_bytes() for path in sorted(pathlib.Path(families).glob("*.ged"))[:DIFFERENT]]
    start = time.process_time()
    for content in contents:
        olvane.File(content)
    return (time.process_time() - start) / len(contents) * files / 2


def measured(client: Client, work: pathlib.Path, name: str, families: str, jobs: list[str], goal: float) -> None:
    out = work / "answers"
    shutil.rmtree(out, ignore_errors=True)
    out.mkdir()
    start, before = time.perf_counter(), of_all(client)
    count = on_dask.run_all(client, families, jobs, str(out), False, JOBS_PER_TASK)
    seconds, used = time.perf_counter() - start, of_all(client) - before
    written = sum(path.stat().st_size for path in out.iterdir()) / 1e6
    memory = max(client.run(peak_memory).values())
    times = f"{seconds:.1f} | {used:.1f} | {used / 2:.1f} | {goal:.1f}"
    print(f"| {name} | {count} | {times} | {count / seconds:.0f} | {written:.0f} | {memory} |", flush=True)
    shutil.rmtree(out)


def main() -> None:
    work = pathlib.Path(sys.argv[1])
    counts = GOALS if sys.argv[2:] == ["--goals"] else [int(count) for count in sys.argv[2:]] or USUAL
    layouts, pictures, files = counts
    small = prepared(work / "small", (max(layouts, pictures) + 59) // 60, 60)
    large = prepared(work / "large", files, 3000)
    print(
        "| jobs | answers | seconds | processor seconds | on two idle cores | goal | per second | MB written | MB of a worker |"
    )
    print("| --- | ---: | ---: | ---: | ---: | ---: | ---: | ---: | ---: |")
    with LocalCluster(n_workers=2, threads_per_worker=1, dashboard_address=None) as cluster, Client(cluster) as client:
        for name, kind, count, of_a_minute in (
            ("layouts", "layout", layouts, GOALS[0]),
            ("pictures", "picture", pictures, GOALS[1]),
        ):
            jobs = [f"{kind}\t{number}\tall\n" for number in range(1, count // 60 + 1)]
            goal = 60 * count / of_a_minute
            measured(client, work, f"half of the {name}", small, jobs[: len(jobs) // 2], goal / 2)
            measured(client, work, name, small, jobs, goal)
        jobs = [f"layout\t{number}\t1\n" for number in range(1, files + 1)]
        goal = reading_goal(large, files)
        measured(client, work, "half of the files of 3,000 persons", large, jobs[: files // 2], goal / 2)
        measured(client, work, "files of 3,000 persons", large, jobs, goal)


if __name__ == "__main__":
    main()

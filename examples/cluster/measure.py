#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""measure.py WORK [LAYOUTS PICTURES FILES]: what a cluster of two workers does in a minute, printed as a table.

So many layouts and pictures of families of 60 persons, and one layout of each of so many files of 3,000 persons. The answers
are written below WORK, counted and thrown away; memory is that of the larger worker at its peak. Many numbers of files
share one file on disk.
"""

import os
import pathlib
import resource
import shutil
import sys
import time

from dask.distributed import Client, LocalCluster

import make_families
import on_dask

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


def measured(client: Client, work: pathlib.Path, name: str, families: str, jobs: list[str]) -> None:
    out = work / "answers"
    shutil.rmtree(out, ignore_errors=True)
    out.mkdir()
    start = time.perf_counter()
    count = on_dask.run_all(client, families, jobs, str(out), False, JOBS_PER_TASK)
    seconds = time.perf_counter() - start
    written = sum(path.stat().st_size for path in out.iterdir()) / 1e6
    memory = max(client.run(peak_memory).values())
    print(f"| {name} | {count} | {seconds:.1f} | {count / seconds:.0f} | {written:.0f} | {memory} |", flush=True)
    shutil.rmtree(out)


def main() -> None:
    work = pathlib.Path(sys.argv[1])
    layouts, pictures, files = (int(count) for count in sys.argv[2:] or (60000, 30000, 200))
    small = prepared(work / "small", (max(layouts, pictures) + 59) // 60, 60)
    large = prepared(work / "large", files, 3000)
    print("| jobs | answers | seconds | per second | MB written | MB of a worker |")
    print("| --- | ---: | ---: | ---: | ---: | ---: |")
    with LocalCluster(n_workers=2, threads_per_worker=1, dashboard_address=None) as cluster, Client(cluster) as client:
        for name, kind, count in (("layouts", "layout", layouts), ("pictures", "picture", pictures)):
            jobs = [f"{kind}\t{number}\tall\n" for number in range(1, count // 60 + 1)]
            measured(client, work, name, small, jobs)
            measured(client, work, f"half of the {name}", small, jobs[: len(jobs) // 2])
        measured(client, work, "files of 3,000 persons", large, [f"layout\t{i}\t1\n" for i in range(1, files + 1)])


if __name__ == "__main__":
    main()

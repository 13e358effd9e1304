#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The jobs of family_jobs.py on Dask.

    on_dask.py --families FOLDER|DATABASE --out FOLDER [--workers N|--scheduler ADDRESS] [--kill-one]
            [--jobs-per-task N] <jobs

Several jobs one after the other (--jobs-per-task) become one task, which writes its answers to a file of its own,
OUT/0000017.tsv for the 18th task, under another name first: a worker that dies in the middle leaves nothing that counts, the task runs again, and running it twice
changes nothing. The files one behind the other are what the pipe form prints. Printed are the number of answers and the SHA-256 of
them all. --kill-one kills a worker when a third of the jobs is done.
"""

from __future__ import annotations

import argparse
import hashlib
import os
import pathlib
import signal
import sys
import time

from dask.distributed import Client, LocalCluster, as_completed

import family_jobs


def run_jobs(families: str, jobs: list[str], out: str, number: int) -> int:
    """Answers the jobs of one task into its file; returns how many answers there are."""
    target = pathlib.Path(out, f"{number:07}.tsv")
    made = target.with_suffix(f".{os.getpid()}")
    count = 0
    with open(made, "w", encoding="utf-8", newline="") as file:
        for job in jobs:
            for line in family_jobs.answers(families, job):
                file.write(line)
                count += 1
    os.replace(made, target)
    return count


def kill_a_worker(client: Client) -> None:
    pid = next(iter(client.run(os.getpid).values()))
    os.kill(pid, signal.SIGKILL)
    print(f"killed worker {pid}", file=sys.stderr)


def run_all(client: Client, families: str, jobs: list[str], out: str, kill_one: bool, jobs_per_task: int = 1) -> int:
    tasks = [jobs[first : first + jobs_per_task] for first in range(0, len(jobs), jobs_per_task)]
    # A few tasks for each worker wait at a time, so that the scheduler's memory does not grow with their number.
    waiting = 8 * max(1, len(client.scheduler_info()["workers"]))
    numbered = iter(enumerate(tasks))

    def submitted():  # type: ignore[no-untyped-def]
        for number, task in numbered:
            return client.submit(run_jobs, families, task, out, number, pure=False, retries=5)
        return None

    running = as_completed([task for task in (submitted() for _ in range(waiting)) if task is not None])
    count = done = 0
    for task in running:
        count += task.result()
        done += 1
        if kill_one and done == len(tasks) // 3 + 1:
            kill_a_worker(client)
        following = submitted()
        if following is not None:
            running.add(following)
    return count


def digest_of(out: str) -> tuple[int, str]:
    """How many answers the files hold, and the SHA-256 of all."""
    digest, lines = hashlib.sha256(), 0
    for path in sorted(pathlib.Path(out).glob("*.tsv")):
        content = path.read_bytes()
        digest.update(content)
        lines += content.count(b"\n")
    return lines, digest.hexdigest()


def main() -> None:
    parser = argparse.ArgumentParser()
    parser.add_argument("--families", required=True)
    parser.add_argument("--out", required=True)
    parser.add_argument("--workers", type=int, default=2)
    parser.add_argument("--scheduler")
    parser.add_argument("--kill-one", action="store_true")
    parser.add_argument("--jobs-per-task", type=int, default=1)
    chosen = parser.parse_args()
    os.makedirs(chosen.out, exist_ok=True)
    if any(pathlib.Path(chosen.out).glob("*.tsv")):
        sys.exit(f"{chosen.out} holds answers of an earlier run: take another folder, or empty it")
    jobs = sys.stdin.readlines()
    start = time.perf_counter()
    if chosen.scheduler:
        with Client(chosen.scheduler) as client:
            client.upload_file(family_jobs.__file__)
            count = run_all(client, chosen.families, jobs, chosen.out, chosen.kill_one, chosen.jobs_per_task)
    else:
        with LocalCluster(n_workers=chosen.workers, threads_per_worker=1, dashboard_address=None) as cluster, Client(
            cluster
        ) as client:
            count = run_all(client, chosen.families, jobs, chosen.out, chosen.kill_one, chosen.jobs_per_task)
    seconds = time.perf_counter() - start
    lines, digest = digest_of(chosen.out)
    if lines != count:
        sys.exit(f"{count} answers were reported, and {lines} are there")
    print(f"{lines} {digest}")
    print(f"{len(jobs)} jobs, {lines} answers in {seconds:.1f} s", file=sys.stderr)


if __name__ == "__main__":
    main()

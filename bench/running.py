"""Runs commands in turn, and measures what they take."""

import os
import pathlib
import re
import statistics
import subprocess
import time

from limits import MB


def run(command, expected=0):
    """Wall seconds, peak MB and processor seconds of one run."""
    # A run that should fail prints why, which is not needed each time.
    errors = subprocess.DEVNULL if expected else None
    begin = time.perf_counter()
    with subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=errors) as process:
        _, status, usage = os.wait4(process.pid, 0)
        process.returncode = os.waitstatus_to_exitcode(status)
    seconds = time.perf_counter() - begin
    if process.returncode != expected:
        raise RuntimeError(f"{' '.join(map(str, command))} ended with {process.returncode}, not {expected}")
    return seconds, usage.ru_maxrss * 1024 / MB, usage.ru_utime + usage.ru_stime


def take_turns(commands, rounds, in_a_row=1):
    """Medians of what run() returns, by the names of the commands, each of which comes with its exit status.

    In its turn each command runs once uncounted, and then `in_a_row` times counted. A virtual machine gives memory
    that was free for some seconds back to its host, and takes long to get it again: without a run right before, whichever
    command comes after the longest one would pay for that.
    """
    samples = {name: [] for name in commands}
    for _ in range(rounds):
        for name, command in commands.items():
            run(*command)
            samples[name] += [run(*command) for _ in range(in_a_row)]
    return {name: [statistics.median(column) for column in zip(*sample)] for name, sample in samples.items()}


def instructions(command, status):
    """How many instructions a run takes, in all of its code."""
    counting = ["valgrind", "--tool=cachegrind", "--cache-sim=no", "--cachegrind-out-file=/dev/null", *command]
    done = subprocess.run(counting, capture_output=True, text=True, check=False)
    counted = re.search(r"I +refs: +([\d,]+)", done.stderr)
    if counted is None or done.returncode != status:
        raise RuntimeError(f"{' '.join(map(str, counting))} ended with {done.returncode}, not {status}: {done.stderr}")
    return int(counted.group(1).replace(",", ""))


def processor():
    for line in pathlib.Path("/proc/cpuinfo").read_text().splitlines():
        if line.startswith("model name"):
            return line.split(":", 1)[1].strip()
    return "unknown processor"

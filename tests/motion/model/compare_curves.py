"""Holds the values of generated curves to those of the model.

usage: compare_curves.py [--jobs N] CURVE_VALUES COUNT

CURVE_VALUES is the program that writes the curves of the seeds 1 to COUNT with their values. Every value agrees to 1e-9
of the larger of its own size and the curve's span, and to 1e-5 where handles were moved to keep time running. The span
is the range of values that the curve goes through between its first key and its last one.
"""

import argparse
import concurrent.futures
import subprocess
import sys

from curve_model import Key, Model

AGREES, AGREES_WHERE_MOVED = 1e-9, 1e-5
SHARE = 500  # curves of one run of the program
SHOWN = 10


class Tally:
    def __init__(self):
        self.curves = self.values = self.moved = self.wrong = 0
        self.worst = self.worst_moved = 0.0
        self.complaints = []

    def add(self, other):
        for name in ("curves", "values", "moved", "wrong"):
            setattr(self, name, getattr(self, name) + getattr(other, name))
        self.worst = max(self.worst, other.worst)
        self.worst_moved = max(self.worst_moved, other.worst_moved)
        self.complaints += other.complaints[: SHOWN - len(self.complaints)]


def tangent(x, y):
    return None if x == "-" else (float(x), float(y))


class Comparison:
    """Reads what the program writes, line by line."""

    def __init__(self):
        self.tally = Tally()
        self.seed = self.units = self.model = None
        self.values = []

    def curve(self, seed, weighted, units, pre, post):
        self.finish()
        self.tally.curves += 1
        self.seed, self.units = seed, float(units)
        self.model = Model(weighted == "1", int(pre), int(post))

    def key(self, time, value, in_type, out_type, in_x, in_y, out_x, out_y):
        self.model.keys.append(
            Key(float(time), float(value) * self.units, int(in_type), int(out_type), tangent(in_x, in_y), tangent(out_x, out_y))
        )

    def value(self, time, value):
        theirs = self.model.at(float(time))
        self.values.append((float(time), float(value) * self.units, theirs, self.model.moved))

    def finish(self):
        """Judges the values of the curve that is complete."""
        if not self.values:
            return
        keys = self.model.keys
        reached = [key.value for key in keys]
        reached += [theirs for time, _, theirs, _ in self.values if keys[0].time <= time <= keys[-1].time]
        span = max(reached) - min(reached)
        for time, ours, theirs, moved in self.values:
            self.judge(time, ours, theirs, moved, max(abs(theirs), span))
        self.values = []

    def judge(self, time, ours, theirs, moved, scale):
        tally = self.tally
        off = abs(ours - theirs) / scale if scale else abs(ours - theirs)
        tally.values += 1
        if moved:
            tally.moved += 1
            tally.worst_moved = max(tally.worst_moved, off)
        else:
            tally.worst = max(tally.worst, off)
        if not off <= (AGREES_WHERE_MOVED if moved else AGREES):
            tally.wrong += 1
            if len(tally.complaints) < SHOWN:
                tally.complaints.append(f"curve {self.seed} at {time}: {ours!r}, by the model {theirs!r}")


def compare(program, first, count):
    run = subprocess.run([program, str(first), str(count)], stdout=subprocess.PIPE, text=True, check=True)
    comparison = Comparison()
    for line in run.stdout.splitlines():
        kind, *words = line.split()
        {"curve": comparison.curve, "key": comparison.key, "value": comparison.value}[kind](*words)
    comparison.finish()
    return comparison.tally


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("--jobs", type=int, default=1)
    parser.add_argument("program")
    parser.add_argument("count", type=int)
    arguments = parser.parse_args()
    tally = Tally()
    with concurrent.futures.ProcessPoolExecutor(arguments.jobs) as pool:
        starts = range(1, arguments.count + 1, SHARE)
        shares = [pool.submit(compare, arguments.program, start, min(SHARE, arguments.count + 1 - start)) for start in starts]
        for share in shares:
            tally.add(share.result())
    for complaint in tally.complaints:
        print(complaint)
    print(
        f"{tally.curves} curves, {tally.values} values: {tally.wrong} differ, at most {tally.worst:.1e}; "
        f"{tally.moved} where handles were moved, at most {tally.worst_moved:.1e}"
    )
    complete = tally.curves == arguments.count and tally.moved > 0
    return 0 if complete and not tally.wrong else 1


if __name__ == "__main__":
    sys.exit(main())

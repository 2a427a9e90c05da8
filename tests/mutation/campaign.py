"""Changes the importer one token at a time, and looks whether the tests notice.

usage: scripts/mutate [--count N] [--seed N] [--only FOLDER] [--headers] [--quick | --own] [--jobs N] [--again]
       scripts/mutate --named [WORD...] [--by PROGRAM]

Chooses mutants of the sources of plugin, maya, comp, hostutil and scan, as many of each: comparisons that take in their
limit or lose it, arithmetic and logic turned round, constants replaced by their neighbours, conditions negated. Each
is built and tested by itself, in a copy of the sources below build/mutate: by the folder's own tests, then by whole
imports; and what neither notices, by everything. It is caught when a test fails, crashes or does not come back; what does
not compile is replaced by another one. Prints those that no test catches, and the shares. What
tests/mutation/equivalents.txt names changes nothing that can be seen: it is counted by itself.

--named applies the sixty faults of tests/mutation/faults.py instead, or those with one of the words in their names,
and shows which tests catch each; it ends with 0 when each is caught, 1 when one is not. --by leaves it to one program
of tests to catch them: with second_reader_test, to the second reader alone.

Ends with 0 when at least 95 % were caught, 1 when fewer were, 2 for a wrong command line, 10 when the machine could not
be set up or the unchanged sources do not pass.
"""

import argparse
import json
import random
import shutil
import subprocess
import sys
import threading
import time
from collections import Counter
from dataclasses import asdict
from pathlib import Path

import named
from mutants import Mutant, mutants_of
from workspace import FIRST_STAGE, LAST_STAGE, PROGRAMS, QUICK_STAGES, STAGES, Workspace, WorkspaceError

ROOT = Path(__file__).resolve().parents[2]
PLACE = ROOT / "build" / "mutate"
RESULTS = PLACE / "survivors.json"
FOLDERS = ("plugin", "maya", "comp", "hostutil", "scan")
LEAST_CAUGHT = 95  # percent
SETUP_FAILED = 10

EQUIVALENTS = ROOT / "tests" / "mutation" / "equivalents.txt"

NOT_COMPILED, SURVIVED, EQUIVALENT = "does not compile", "survived", "equivalent"
NOT_COUNTED = (NOT_COMPILED, EQUIVALENT)


def equivalents():
    """File and changed line of each mutant that is known to change nothing. The line may hold a bar of its own."""
    lines = EQUIVALENTS.read_text(encoding="utf-8").splitlines()
    named = (line.rsplit(" | ", 1)[0] for line in lines if line and not line.startswith("#"))
    return {tuple(entry.split(" | ", 1)) for entry in named}


def sources_of(folder, suffixes):
    return sorted(path for path in (ROOT / folder).iterdir() if path.suffix in suffixes)


def choose(folders, count, seed, suffixes):
    """For each folder the mutants to try, in the order in which they replace each other, and how many are wanted."""
    wanted = {}
    for number, folder in enumerate(folders):
        found = [mutant for path in sources_of(folder, suffixes)
                 for mutant in mutants_of(path.relative_to(ROOT).as_posix(), path.read_text(encoding="utf-8"))]
        random.Random(f"{seed} {folder}").shuffle(found)
        share = count // len(folders) + (number < count % len(folders))
        wanted[folder] = (found, min(share, len(found)))
    return wanted


class Campaign:
    """What is still to be tried, and what came out. Shared by the threads, one for each workspace."""

    def __init__(self, wanted):
        self.lock = threading.Lock()
        self.waiting, self.spares = [], {}
        for folder, (found, share) in wanted.items():
            self.waiting += found[:share]
            self.spares[folder] = found[share:]
        # Those of one file after each other: so each takes one compilation, not two.
        self.waiting.sort(reverse=True)
        self.results = {}  # verdicts by mutant
        self.equivalents = equivalents()

    def wait_for_survivors(self):
        """What has survived so far is to be tried again."""
        self.waiting = self.survivors()[::-1]

    def take(self):
        with self.lock:
            return self.waiting.pop() if self.waiting else None

    def note(self, mutant, verdict, seconds):
        with self.lock:
            source = (ROOT / mutant.file).read_text(encoding="utf-8")
            if verdict == SURVIVED and (mutant.file, mutant.before_and_after(source)[1]) in self.equivalents:
                verdict = EQUIVALENT
            self.results[mutant] = verdict
            spares = self.spares.get(mutant.file.split("/")[0])
            if verdict in NOT_COUNTED and spares:
                self.waiting.insert(0, spares.pop(0))
            print(f"{len(self.counted()):4} {mutant.file}:{mutant.line(source)} {mutant.kind}: {verdict}, {seconds:.0f} s",
                  flush=True)

    def counted(self):
        return [(mutant, verdict) for mutant, verdict in self.results.items() if verdict not in NOT_COUNTED]

    def survivors(self):
        return sorted(mutant for mutant, verdict in self.results.items() if verdict == SURVIVED)


def verdict_on(workspace, mutant, stages):
    with workspace.changed(mutant):
        for stage in stages:
            if not workspace.build(stage.targets(mutant.file)):
                return NOT_COMPILED
            if failing := workspace.first_failure(stage, mutant.file):
                return f"caught by {stage.name} ({failing})"
    return SURVIVED


def try_all(spaces, campaign, stages, folders):
    """Takes what waits through the stages, in all workspaces at once, which are shown to pass before."""
    for space in spaces:
        space.prepare(stages, folders)
    spaces[0].measure(stages, folders)

    def work(space):
        space.limits = spaces[0].limits
        while mutant := campaign.take():
            begin = time.monotonic()
            campaign.note(mutant, verdict_on(space, mutant, stages), time.monotonic() - begin)

    threads = [threading.Thread(target=work, args=(space,)) for space in spaces]
    for thread in threads:
        thread.start()
    for thread in threads:
        thread.join()


def print_survivors(survivors):
    for mutant in survivors:
        source = (ROOT / mutant.file).read_text(encoding="utf-8")
        before, after = mutant.before_and_after(source)
        print(f"\n{mutant.file}:{mutant.line(source)} {mutant.kind}\n  - {before}\n  + {after}")


def print_table(campaign):
    rows = {folder: Counter() for folder in (*FOLDERS, "together")}
    for mutant, verdict in campaign.results.items():
        column = next((stage.name for stage in STAGES if stage.name in verdict), verdict)
        for row in (mutant.file.split("/")[0], "together"):
            rows[row][column] += 1
    print("\n" + " ".join(f"{head:>16}" for head in ("folder", "tried", *(stage.name for stage in STAGES), SURVIVED,
                                                     "caught", *NOT_COUNTED)))
    for folder, row in rows.items():
        tried = row.total() - sum(row[verdict] for verdict in NOT_COUNTED)
        if tried:
            caught = f"{100 * (tried - row[SURVIVED]) / tried:.1f} %"
            cells = (folder, tried, *(row[stage.name] for stage in STAGES), row[SURVIVED], caught,
                     *(row[verdict] for verdict in NOT_COUNTED))
            print(" ".join(f"{cell:>16}" for cell in cells))


def arguments():
    parser = argparse.ArgumentParser(
        prog="scripts/mutate", usage=__doc__.split("usage: ")[1].split("\n\n")[0],
        description=__doc__.split("\n\n", 2)[2], formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--count", type=int, default=240, metavar="N", help="how many mutants (240)")
    parser.add_argument("--seed", type=int, default=1, metavar="N", help="which ones are chosen (1)")
    parser.add_argument("--only", choices=FOLDERS, metavar="FOLDER", help="only those of one folder")
    parser.add_argument("--headers", action="store_true", help="in headers too, each of which rebuilds much")
    stages = parser.add_mutually_exclusive_group()
    stages.add_argument("--quick", action="store_true", help="not by everything, which takes minutes for each")
    stages.add_argument("--own", action="store_true", help="by the folder's own tests alone")
    parser.add_argument("--jobs", type=int, default=1, metavar="N", help="how many are tried at a time (1)")
    parser.add_argument("--again", action="store_true", help="only those that survived when it ran last")
    parser.add_argument("--named", nargs="*", metavar="WORD", help="the faults of tests/mutation/faults.py")
    parser.add_argument("--by", choices=PROGRAMS, metavar="PROGRAM", help="the faults by this program of tests alone")
    options = parser.parse_args()
    if options.count < 1 or options.jobs < 1:
        parser.error("--count and --jobs are at least 1")
    if options.by and options.named is None:
        parser.error("--by goes with --named")
    if options.again and not RESULTS.exists():
        parser.error("there are no survivors to try again")
    return options


def survivors_of_last_run():
    """By folder, those whose place in the sources still reads as it did."""
    wanted = {folder: ([], 0) for folder in FOLDERS}
    for entry in json.loads(RESULTS.read_text(encoding="utf-8")):
        mutant = Mutant(**entry["mutant"])
        if mutant.before_and_after((ROOT / mutant.file).read_text(encoding="utf-8")) != tuple(entry["lines"]):
            sys.exit(f"scripts/mutate: {mutant.file} has changed since; run without --again")
        folder = mutant.file.split("/")[0]
        found, share = wanted[folder]
        wanted[folder] = (found + [mutant], share + 1)
    return wanted


def write_survivors(survivors):
    entries = [{"mutant": asdict(mutant),
                "lines": mutant.before_and_after((ROOT / mutant.file).read_text(encoding="utf-8"))}
               for mutant in survivors]
    RESULTS.write_text(json.dumps(entries, indent=1) + "\n", encoding="utf-8")


def try_named(words, program):
    try:
        return named.run(Workspace(ROOT, PLACE / "named"), words, program)
    except (WorkspaceError, OSError, subprocess.SubprocessError) as error:
        print(f"scripts/mutate: {error}", file=sys.stderr)
        return SETUP_FAILED


def main():
    options = arguments()
    if options.named is not None:
        return try_named(options.named, options.by)
    folders = (options.only,) if options.only else FOLDERS
    suffixes = (".h", ".cpp") if options.headers else (".cpp",)
    campaign = Campaign(survivors_of_last_run() if options.again
                        else choose(folders, options.count, options.seed, suffixes))
    spaces = [Workspace(ROOT, PLACE / str(number)) for number in range(1, options.jobs + 1)]
    try:
        try_all(spaces, campaign, (FIRST_STAGE,) if options.own else QUICK_STAGES, folders)
        write_survivors(campaign.survivors())
        campaign.wait_for_survivors()
        if campaign.waiting and not (options.own or options.quick):
            try_all(spaces, campaign, (LAST_STAGE,), folders)
    except (WorkspaceError, OSError, subprocess.SubprocessError) as error:
        print(f"scripts/mutate: {error}", file=sys.stderr)
        return SETUP_FAILED
    for space in spaces:
        shutil.rmtree(space.scratch, ignore_errors=True)
    write_survivors(campaign.survivors())
    print_survivors(campaign.survivors())
    print_table(campaign)
    counted = campaign.counted()
    caught = len(counted) - len(campaign.survivors())
    return 0 if counted and 100 * caught >= LEAST_CAUGHT * len(counted) else 1


if __name__ == "__main__":
    sys.exit(main())

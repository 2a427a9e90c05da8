"""Applies the faults of faults.py one by one and shows which tests catch each: scripts/mutate --named.

Each is built and tested by itself in a copy of the sources: by the tests of its room; where those pass, by whole
imports; where those pass too, by everything. Each program runs to its end, so that all its tests that fail are known.
Prints a row of a table for each fault.

So a row names the nearest tests that notice a fault, and says nothing of the others. What one program notices by
itself is shown with --by. scripts/mutate --named "every rotation" --by second_reader_test shows that the second
reader, which shares no code with the product, notices rotations that turn the other way, without any other test.
"""

import re
import tempfile

from faults import FAULTS
from workspace import LAST_STAGE, QUICK_STAGES, OneProgram

STAGES = (*QUICK_STAGES, LAST_STAGE)
SHOWN_TESTS = 2
FAILED = re.compile(r"^\[  FAILED  \] (\w[\w/]*\.[\w/]+)", re.MULTILINE)


def room_of(fault):
    return fault.file.split("/")[0]


def chosen(words):
    """Those whose names hold one of the words; all without any."""
    return [fault for fault in FAULTS if not words or any(word in fault.name for word in words)]


def failures_of(workspace, command, limit):
    """What fails when the command is run: names of tests, or how it ended; nothing when it passes."""
    with tempfile.TemporaryFile() as output:
        status = workspace.run(command, limit, output)
        output.seek(0)
        text = output.read().decode(errors="replace")
    if status == 0:
        return []
    failed = list(dict.fromkeys(FAILED.findall(text)))
    if status is None:
        failed.append("(does not end)")
    elif status < 0:
        failed.append(f"(ends by signal {-status})")
    return failed or ["(fails)"]


def catches(workspace, fault, stage):
    """By program of the stage, the tests that fail with the fault; None when it does not compile."""
    with workspace.changed(fault):
        if not workspace.build(stage.targets(fault.file)):
            return None
        found = {}
        for program, command in workspace.commands(stage, fault.file):
            complete = [part for part in command if part not in ("--gtest_fail_fast", "--stop-on-failure")]
            if failed := failures_of(workspace, complete, workspace.limits[stage.name, program]):
                found[program] = failed
        return found


def row(fault, found):
    """A row of a table in Markdown."""
    if found is None:
        return f"| {fault.name} | **does not compile** |"
    if not found:
        return f"| {fault.name} | **nothing** |"
    cells = []
    for program, tests in found.items():
        more = f" and {len(tests) - SHOWN_TESTS} more" if len(tests) > SHOWN_TESTS else ""
        cells.append(f"{program}: {', '.join(tests[:SHOWN_TESTS])}{more}")
    return f"| {fault.name} | {'; '.join(cells)} |"


def stages_by(program):
    """What each fault goes through: the one program, or all stages without one."""
    return (OneProgram(program),) if program else STAGES


def run(workspace, words, program):
    """Tries those that are chosen; 0 when each is caught."""
    waiting = chosen(words)
    if not waiting:
        print("no fault has such a name")
        return 2
    count, caught = len(waiting), 0
    for stage in stages_by(program):
        rooms = sorted({room_of(fault) for fault in waiting})
        workspace.prepare((stage,), rooms)
        workspace.measure((stage,), rooms)
        missed = []  # by this stage
        for fault in waiting:
            found = catches(workspace, fault, stage)
            if found is not None and not found:
                missed.append(fault)
                continue
            caught += bool(found)
            print(row(fault, found), flush=True)
        waiting = missed
        if not waiting:
            break
    for fault in waiting:
        print(row(fault, {}))
    print(f"\n{caught} of {count} are caught.")
    return 0 if caught == count else 1

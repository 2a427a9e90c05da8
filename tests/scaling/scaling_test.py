#!/usr/bin/env python3
"""Doubles a scene and holds the import's work, in instructions, to a little more than twice as much.

    scaling_test.py --tool MAYASCENE [--valgrind PROGRAM] [--list] [WORKLOAD ...]

Each workload is a kind of scene that could make one part of the import slow. Its work is the number of instructions of
`mayascene import --quiet`, less those for the same scene without what is counted. Instructions, unlike seconds, are the
same however busy the machine is; what a function of the C library costs is among them. Ends with 1 when a limit is
missed, with 77 when there is no valgrind.
"""

import argparse
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile

MOST_GROWTH = 2.3
SKIPPED = 77

# Seen by every workload: a camera, so that there is a composition.
HEAD = """//Maya ASCII 2024 scene
currentUnit -l centimeter -a degree -t film;
createNode transform -n "rig";
createNode camera -n "lens" -p "rig";
"""


def curve(name, plug, keys):
    """An animation curve with its keys, connected to the plug."""
    if not keys:
        return ""
    times = " ".join(f"{time} {value:g}" for time, value in keys)
    return (f'createNode animCurveTL -n "{name}";\nsetAttr -s {len(keys)} ".ktv[0:{len(keys) - 1}]" {times};\n'
            f'connectAttr "{name}.o" "{plug}";\n')


def nodes_of_one_name(count):
    return HEAD + 'createNode transform -n "node";\nsetAttr ".t" -type "double3" 1 2 3;\n' * count


def curves_of_one_name(count):
    return HEAD + "".join(f'createNode animCurveTL -n "node";\nsetAttr ".ktv[0]" 1 {number};\n'
                          for number in range(count))


def unnamed_nodes(count):
    return HEAD + 'createNode transform;\nsetAttr ".t" -type "double3" 1 2 3;\n' * count


def nodes_of_many_names(count):
    return HEAD + "".join(f'createNode transform -n "node{number}" -p "node{number // 2}";\n'
                          for number in range(count))


def connections(count):
    return HEAD + "".join(
        f'createNode transform -n "t{number}";\n' + curve(f"c{number}", f"t{number}.tx", [(1, number)])
        for number in range(count))


def keys_of_one_curve(count):
    return HEAD + curve("move", "rig.tx", [(time, 7 * time) for time in range(1, count + 1)])


def keys_backwards(count):
    return HEAD + curve("move", "rig.tx", [(count - time, 7 * time) for time in range(count)])


def spinning_keys(count):
    return HEAD + curve("turn", "rig.rx", [(time, 170 * time) for time in range(1, count + 1)])


def spinning_keys_with_many_turns_between(count):
    return HEAD + curve("turn", "rig.rz", [(time, 360000.5 * time) for time in range(1, count + 1)])


CHAIN = 40


def locators_under_one_chain(count):
    chain = "".join(f'createNode transform -n "up{number}" -p "up{number - 1}";\n' for number in range(CHAIN))
    return HEAD + chain + "".join(f'createNode transform -n "mark{number}" -p "up{CHAIN - 1}";\n'
                                  f'createNode locator -n "null{number}" -p "mark{number}";\n'
                                  for number in range(count))


def constraints(count):
    return HEAD + 'createNode transform -n "target";\n' + "".join(
        f'createNode transform -n "r{number}";\ncreateNode camera -n "l{number}" -p "r{number}";\n'
        f'createNode aimConstraint -n "aim{number}";\n'
        f'connectAttr "r{number}.t" "aim{number}.ct";\n'
        f'connectAttr "target.t" "aim{number}.target[0].targetTranslate";\n'
        f'connectAttr "aim{number}.cr" "r{number}.r";\n'
        for number in range(count))


def deep_chain(count):
    chain = "".join(f'createNode transform -n "n{number}" -p "n{number - 1}";\n' for number in range(count))
    return HEAD + chain + (f'createNode camera -n "deep" -p "n{count - 1}";\n' if count else "")


def deep_chain_from_below(count):
    """Each transform stands before its parent."""
    chain = "".join(f'createNode transform -n "n{number}" -p "n{number - 1}";\n' for number in reversed(range(count)))
    return HEAD + chain + (f'createNode camera -n "deep" -p "n{count - 1}";\n' if count else "")


def long_word(size):
    return HEAD + "x" * size + " ;\n"


def long_string(size):
    return HEAD + 'fileInfo "' + 'a\\"' * (size // 3) + '";\n'


def long_name(size):
    return HEAD + f'createNode transform -n "{"n" * size}";\nselect -ne :{"n" * size};\n'


def long_number(size):
    node = HEAD + 'createNode transform -n "node";\n'
    return node + f'setAttr ".t" -type "double3" {"1" * size} 2 3;\n' if size else node


def long_comment(size):
    return HEAD + "/*" + "* /" * (size // 3) + "*/\n"


def many_comments(count):
    return HEAD + "//\n/**/" * (count // 2)


def comments_inside_a_command(count):
    return HEAD + 'createNode transform -n "node"' + " /**/" * count + ";\n"


def one_long_command(count):
    return HEAD + 'setAttr ".v"' + " -x (1) 2" * count + ";\n"


# What grows, and the smaller of its two sizes.
WORKLOADS = {function.__name__: (function, size) for function, size in (
    (nodes_of_one_name, 8000),
    (curves_of_one_name, 6000),
    (unnamed_nodes, 8000),
    (nodes_of_many_names, 8000),
    (connections, 3000),
    (keys_of_one_curve, 6000),
    (keys_backwards, 6000),
    (spinning_keys, 3000),
    (spinning_keys_with_many_turns_between, 3000),
    (locators_under_one_chain, 100),
    (constraints, 500),
    (deep_chain, 2000),
    (deep_chain_from_below, 2000),
    (long_word, 1 << 20),
    (long_string, 1 << 20),
    (long_name, 1 << 20),
    (long_number, 1 << 20),
    (long_comment, 1 << 20),
    (many_comments, 1000000),
    (comments_inside_a_command, 250000),
    (one_long_command, 60000),
)}

# A number of a million digits is refused; the work until then counts all the same.
REFUSED = (long_number,)


def instructions(arguments, folder, text, status):
    scene = folder / "scene.ma"
    scene.write_text(text)
    command = [arguments.valgrind, "--tool=cachegrind", "--cache-sim=no", "--cachegrind-out-file=/dev/null",
               arguments.tool, "import", "--quiet", "--preferences", folder / "preferences", *arguments.options, scene]
    done = subprocess.run(command, capture_output=True, text=True, check=False)
    counted = re.search(r"I +refs: +([\d,]+)", done.stderr)
    if counted is None or done.returncode != status:
        raise RuntimeError(f"the run ended with {done.returncode}, not {status}: {done.stderr}")
    return int(counted.group(1).replace(",", ""))


def judge(name, arguments, folder):
    make, size = WORKLOADS[name]
    nothing, once, twice = (instructions(arguments, folder, make(count), status=1 if count and make in REFUSED else 0)
                            for count in (0, size, 2 * size))
    growth = (twice - nothing) / (once - nothing)
    each = (once - nothing) / size
    verdict = "ok" if growth <= MOST_GROWTH and once > nothing else "TOO MUCH"
    print(f"{name:<40} {size:>8} {(once - nothing) / 1e6:>9.2f} M {each:>9.1f} each   x2: {growth:.3f}  {verdict}",
          flush=True)
    return verdict == "ok"


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument("workloads", nargs="*", metavar="WORKLOAD")
    parser.add_argument("--tool", type=pathlib.Path)
    parser.add_argument("--valgrind", default="valgrind")
    parser.add_argument("--list", action="store_true", help="print the workloads' names")
    parser.add_argument("--options", nargs="*", default=[], help="further options of the import")
    arguments = parser.parse_args()
    if arguments.list:
        print("\n".join(WORKLOADS))
        return 0
    if unknown := [name for name in arguments.workloads if name not in WORKLOADS]:
        parser.error(f"no such workload: {', '.join(unknown)}")
    if arguments.tool is None:
        parser.error("--tool is missing")
    if shutil.which(arguments.valgrind) is None:
        print("LEFT OUT: how the work grows, because there is no valgrind")
        return SKIPPED
    with tempfile.TemporaryDirectory() as folder:
        judged = [judge(name, arguments, pathlib.Path(folder)) for name in arguments.workloads or WORKLOADS]
    return 0 if all(judged) else 1


if __name__ == "__main__":
    sys.exit(main())

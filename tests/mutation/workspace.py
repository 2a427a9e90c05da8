"""A copy of the sources with a build of its own, in which one change at a time is built and tested."""

import contextlib
import os
import resource
import shutil
import signal
import subprocess
import time
from dataclasses import dataclass

# The programs by what they look at. What is no program of GoogleTest is run by ctest, by a pattern of names.
OWN_TESTS = {
    "plugin": ("plugin_services_test", "plugin_entry_test", "plugin_module_test"),
    "maya": ("maya_test",),
    "comp": ("comp_test",),
    "hostutil": ("hostutil_tests",),
    "refhost": ("refhost_test",),
    "text": ("text_test",),
    "diag": ("diag_test",),
    "tools": ("tool_tests", "tool_command_tests"),
    "scan": ("scan_tests",),
}
WHOLE_IMPORTS = ("golden_trace_test", "conversion_test", "second_reader_test", "plugin_entry_test")
EVERYTHING = ("plugin_services_test", "plugin_module_test", "maya_test", "comp_test", "hostutil_tests", "scan_tests",
              "refhost_test", "example_scenes_test", "tool_command_tests", "docs_peculiarities_test", "comp_failure_test",
              "failure_sweep_test")
OTHER_TARGETS = ("number-campaign", "fuzz_targets", "mayascene", "MayaImport")
OTHER_TESTS = r"^(scan\.number_campaign|fuzz\.|scaling\.)"

# What takes half a minute is run when all else has passed.
SLOW_TESTS = "*TwoGigabytes*:SkipTextTest.RandomHostileTextsAreSeenAlike:*EveryByteReplaced*:*CutAtEveryByte*"

MOST_MEMORY = 8 << 30  # bytes of addresses for one program
TIMES_AS_LONG = 4  # as the unchanged sources take ...
LONGER = 20  # ... and seconds more


class WorkspaceError(RuntimeError):
    pass


@dataclass(frozen=True)
class Stage:
    name: str

    def programs(self, file):
        if self.name == OWN:
            return OWN_TESTS[file.split("/")[0]]
        return WHOLE_IMPORTS if self.name == IMPORTS else EVERYTHING

    def targets(self, file):
        return (*self.programs(file), *(OTHER_TARGETS if self.name == ALL else ()))


@dataclass(frozen=True)
class OneProgram(Stage):
    """A stage of one program, whatever file is changed."""

    def programs(self, file):
        return (self.name,)


PROGRAMS = sorted({*WHOLE_IMPORTS, *EVERYTHING, *(program for own in OWN_TESTS.values() for program in own)})
OWN, IMPORTS, ALL = "own tests", "whole imports", "everything"
FIRST_STAGE = Stage(OWN)
QUICK_STAGES = (FIRST_STAGE, Stage(IMPORTS))
LAST_STAGE = Stage(ALL)
STAGES = (*QUICK_STAGES, LAST_STAGE)


def limit_program():
    resource.setrlimit(resource.RLIMIT_AS, (MOST_MEMORY, MOST_MEMORY))
    resource.setrlimit(resource.RLIMIT_CORE, (0, 0))


class Workspace:
    def __init__(self, root, place):
        self.root, self.place = root, place
        self.tree, self.built, self.scratch = place / "tree", place / "build", place / "scratch"
        self.limits = {}  # seconds, by stage and program

    # --- Sources ---

    def prepare(self, stages, folders):
        """Brings the copy up to date and builds what the stages are going to run."""
        self.copy_sources()
        self.configure()
        targets = {target for stage in stages for folder in folders for target in stage.targets(folder + "/")}
        if not self.build(sorted(targets), quiet=False):
            raise WorkspaceError("the unchanged sources do not build")

    def copy_sources(self):
        """What is the same already stays, so that it is not built again."""
        listed = subprocess.run(["git", "-C", self.root, "ls-files", "-z", "--cached", "--others", "--exclude-standard"],
                                check=True, capture_output=True).stdout
        names = {os.fsdecode(name) for name in listed.split(b"\0") if name and (self.root / os.fsdecode(name)).is_file()}
        for name in names:
            source, target = self.root / name, self.tree / name
            if target.is_file() and target.read_bytes() == source.read_bytes():
                continue
            target.parent.mkdir(parents=True, exist_ok=True)
            shutil.copy(source, target)
        for path in list(self.tree.rglob("*")):
            if path.is_file() and path.relative_to(self.tree).as_posix() not in names:
                path.unlink()

    @contextlib.contextmanager
    def changed(self, mutant):
        path = self.tree / mutant.file
        source = path.read_text(encoding="utf-8")
        path.write_text(mutant.applied(source), encoding="utf-8")
        try:
            yield
        finally:
            path.write_text(source, encoding="utf-8")

    # --- Building ---

    def configure(self):
        if (self.built / "build.ninja").exists():
            return
        # A change may bring warnings with it. A program need not be linked anew because a library that it loads was,
        # nor asked for its tests whenever it was linked.
        subprocess.run(["cmake", "-S", self.tree, "-B", self.built, "-G", "Ninja", "-DCMAKE_BUILD_TYPE=Debug",
                        "-DCMAKE_CXX_FLAGS_DEBUG=-O1", "-DCMAKE_CXX_FLAGS=-w", "-DBUILD_TESTING=ON",
                        "-DCMAKE_LINK_DEPENDS_NO_SHARED=ON",
                        "-DCMAKE_GTEST_DISCOVER_TESTS_DISCOVERY_MODE=PRE_TEST"], check=True, stdout=subprocess.DEVNULL)

    def build(self, targets, quiet=True):
        output = subprocess.DEVNULL if quiet else None
        command = ["ninja", "-C", self.built, *(["-j", "1"] if quiet else []), *targets]
        return subprocess.run(command, stdout=output, stderr=output, check=False).returncode == 0

    # --- Running ---

    def commands(self, stage, file):
        """Names and commands of what a stage runs."""
        chosen = [] if stage.name == ALL else [f"--gtest_filter=-{SLOW_TESTS}"]
        for program in stage.programs(file):
            yield program, [self.built / "bin" / program, "--gtest_brief=1", "--gtest_fail_fast", *chosen]
        if stage.name == ALL:
            yield "other tests", ["ctest", "--test-dir", self.built, "-R", OTHER_TESTS, "--stop-on-failure", "-Q"]

    def measure(self, stages, folders):
        """How long each program takes on the unchanged sources, all of which have to pass."""
        for stage in stages:
            for folder in folders:
                for name, command in self.commands(stage, folder + "/"):
                    if (stage.name, name) in self.limits:
                        continue
                    begin = time.monotonic()
                    if not self.passes(command, None):
                        raise WorkspaceError(f"the unchanged sources fail {name}")
                    taken = time.monotonic() - begin
                    print(f"unchanged: {name} passes, {taken:.1f} s", flush=True)
                    self.limits[stage.name, name] = TIMES_AS_LONG * taken + LONGER

    def first_failure(self, stage, file):
        """The first program of the stage that fails, crashes or takes too long; None when all pass."""
        for name, command in self.commands(stage, file):
            if not self.passes(command, self.limits[stage.name, name]):
                return name
        return None

    def passes(self, command, limit):
        return self.run(command, limit, subprocess.DEVNULL) == 0

    def run(self, command, limit, output):
        """The status of the command, whose text goes to `output`; None when it takes more than `limit` seconds."""
        shutil.rmtree(self.scratch, ignore_errors=True)
        self.scratch.mkdir(parents=True, exist_ok=True)
        with subprocess.Popen(command, cwd=self.scratch, env=dict(os.environ, TMPDIR=str(self.scratch)),
                              stdin=subprocess.DEVNULL, stdout=output, stderr=subprocess.DEVNULL,
                              start_new_session=True, preexec_fn=limit_program) as process:
            try:
                return process.wait(limit)
            except subprocess.TimeoutExpired:
                return None
            finally:
                with contextlib.suppress(ProcessLookupError):
                    os.killpg(process.pid, signal.SIGKILL)

"""The most that the programs may take: bench/compare judges by these."""

from dataclasses import dataclass

MB = 10**6
GROWTH = 4  # times the size, where growth is measured


@dataclass(frozen=True)
class Limits:
    """The most that an import may take; None where there is no limit."""

    counted: float  # the scale of the scene whose instructions are counted
    by_words: float | None = None  # wall time, as a multiple of H
    per_byte: float | None = None  # instructions for a byte of the scene
    growth: float | None = None  # of the time, where the scene grows by GROWTH
    extra: float | None = None  # MB of memory beyond the file ...
    keys: int = 0  # ... and as many keys,
    per_key: float = 0  # with so many bytes each
    status: int = 0  # how the import ends

    def memory(self, size, scale):
        return None if self.extra is None else size + self.extra + self.per_key * self.keys * scale / MB


# Instructions are those of GCC 12 on a processor with AVX2: 5 % above what was counted.
LIMITS = {
    "mesh": Limits(counted=0.05, by_words=1.5, growth=4.4, extra=24),
    "keys": Limits(counted=0.08, per_byte=26.9, growth=4.4, extra=48, keys=27000 * 240, per_key=1.25 * 16),
    "nodes": Limits(counted=0.155, per_byte=41.6, growth=4.8),
    "composition": Limits(counted=0.23, per_byte=83.4),
    "cameras": Limits(counted=1),
    "shot": Limits(counted=0.2, per_byte=16.2, growth=4.4),
    "shot_unquoted": Limits(counted=0.2, status=1),
}


@dataclass(frozen=True)
class VerbLimits:
    """The most processor time and memory that another verb may take; None where there is no limit."""

    verb: str
    workload: str
    output: str | None = None  # the name of the file that it writes
    options: tuple[str, ...] = ()
    by_import: float | None = None  # as a multiple of the plain import
    by_result: float | None = None  # as a multiple of the import of the output
    extra: float | None = None  # MB of memory beyond the file ...
    values: int = 0  # ... and as many values of eight bytes
    compositions: float | None = None  # as a multiple of what the plain import takes beyond the file
    status: int = 0  # how it ends

    def memory(self, size, scale, importing):
        if self.compositions is not None:
            return size + self.compositions * (importing - size)
        return None if self.extra is None else size + self.extra + 8 * self.values * scale / MB


VERBS = [
    VerbLimits("bake", "cameras", "baked.ma", by_result=2.0, extra=48, values=6250 * 1000),
    VerbLimits("bake", "shot", "baked.ma", by_import=2.5, extra=52),
    VerbLimits("check", "mesh", by_import=2.5),
    VerbLimits("check", "keys", by_import=2.5),
    VerbLimits("check", "nodes", by_import=2.5),
    VerbLimits("check", "composition", by_import=2.5),
    VerbLimits("check", "shot", by_import=2.5),
    VerbLimits("export", "composition", "exported.glb", by_import=2.5, compositions=2.0),
    VerbLimits("export", "composition", "exported.gltf", compositions=2.0),
    VerbLimits("export", "composition", "exported.usda", compositions=2.0),
    VerbLimits("export", "composition", "exported.chan", compositions=2.0),
    VerbLimits("export", "composition", "exported.csv", compositions=2.0),
    VerbLimits("export", "composition", "keys.csv", options=("--keys",), compositions=2.0),
]


@dataclass(frozen=True)
class JobsLimits:
    """The most wall time that two scenes at a time may take, as a multiple of one at a time."""

    workload: str = "shot"
    each: float = 0.003  # the scale of each scene: about 300 KB
    scenes: int = 1000
    by_one_job: float = 0.6


JOBS = JobsLimits()

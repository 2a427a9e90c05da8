"""Time and memory of an import, beside its yardstick."""

import subprocess

from limits import GROWTH, LIMITS, MB
from running import instructions, take_turns
from table import Table

BLOCKS = 5  # of runs in a row, of each size that growth is measured from


class Measured:
    """The measurements of one workload."""

    def __init__(self, workload, arguments, folder):
        self.workload, self.arguments, self.folder = workload, arguments, folder
        self.limits = LIMITS[workload]

    def scene(self, scale):
        path = self.folder / f"{self.workload}-{scale:g}.ma"
        subprocess.run([self.arguments.programs / "bench-generate", self.workload, path, str(scale)], check=True,
                       stdout=subprocess.DEVNULL)
        return path

    def importing(self, path):
        tool = self.arguments.programs / "mayascene"
        return [tool, "import", "--quiet", "--preferences", self.folder / "preferences", path]

    def take_times(self):
        """The medians, and the size of the file in MB."""
        base = self.scene(self.arguments.scale)
        files = [base]
        status = self.limits.status
        commands = {"import": (self.importing(base), status),
                    "H": ([self.arguments.programs / "bench-countwords", base],)}
        if self.limits.growth is not None:
            files.append(self.scene(self.arguments.scale / GROWTH))
        try:
            medians = take_turns(commands, self.arguments.runs)
            if len(files) > 1:
                growing = {"small": (self.importing(files[1]), status), "grown": (self.importing(base), status)}
                medians |= take_turns(growing, BLOCKS, self.arguments.runs)
            return medians, base.stat().st_size / MB
        finally:
            for path in files:
                path.unlink()

    def per_byte(self):
        """Instructions of the import for a byte of the scene; None where they are not counted."""
        if not self.arguments.instructions:
            return None
        path = self.scene(min(self.limits.counted, self.arguments.scale))
        try:
            return instructions(self.importing(path), self.limits.status) / path.stat().st_size
        finally:
            path.unlink()


class ImportTable(Table):
    """A row for each workload."""

    HEAD = ["workload", "MB", "import s", "H s", "/H", "limit", "i/byte", "limit", "x4", "limit", "peak MB", "limit"]
    WIDTHS = [-13, 6, 8, 8, 6, 6, 7, 6, 6, 6, 7, 6]


def add_import(table, workload, arguments, folder):
    limits = LIMITS[workload]
    measured = Measured(workload, arguments, folder)
    medians, size = measured.take_times()
    seconds = {name: values[0] for name, values in medians.items()}
    growth = seconds["grown"] / seconds["small"] if "grown" in seconds else None
    table.row([workload], [f"{size:.1f}", f"{seconds['import']:.3f}", f"{seconds['H']:.3f}"], [
        ("import / H", seconds["import"] / seconds["H"], limits.by_words, "{:.2f}"),
        ("instructions a byte", measured.per_byte(), limits.per_byte, "{:.1f}"),
        ("growth", growth, limits.growth, "{:.2f}"),
        ("peak memory", medians["import"][1], limits.memory(size, arguments.scale), "{:.0f}"),
    ])

"""A table of measurements, each value beside its limit."""


class Table:
    """Rows of values, each beside its limit; remembers which were missed."""

    HEAD: list[str]
    WIDTHS: list[int]  # below 0: to the left

    def __init__(self):
        self.missed = []
        self.print(self.HEAD)

    def print(self, cells):
        print(" ".join(f"{cell:<{-width}}" if width < 0 else f"{cell:>{width}}"
                       for cell, width in zip(cells, self.WIDTHS)), flush=True)

    def row(self, name, plain, judged):
        """`name` and `plain` are cells; each of `judged` is a sentence, a value, its limit and its form."""
        cells = [*name, *plain]
        for what, value, limit, form in judged:
            cells += ["-" if value is None else form.format(value)]
            cells += ["-" if limit is None else f"{limit:.4g}"]
            if value is not None and limit is not None and value > limit:
                self.missed.append(f"{' '.join(name)}: {what} is {form.format(value)}, limit {limit:.4g}")
        self.print(cells)

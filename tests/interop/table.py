"""The table of docs/interchange.md."""

_HEAD = ("| scene | through | places | largest | pixels | largest | limit |\n"
         "|---|---|---|---|---|---|---|\n")


class Row:
    def __init__(self, scene, through, result):
        self.scene = scene
        self.through = through
        self.result = result

    def text(self):
        found = self.result
        return (f"| {self.scene} | {self.through} | {found.places:,} "
                f"| {found.worst_place:.1e} | {found.pixels:,} "
                f"| {found.worst_pixel:.1e} px | {found.limit:.2g} px |\n")


def table_of(rows):
    return _HEAD + "".join(row.text() for row in rows)


def summary_of(rows):
    """One row for each way through, over all scenes."""
    lines = ["| through | scenes | places | largest distance | pixels "
             "| largest distance | limit |\n",
             "|---|---|---|---|---|---|---|\n"]
    for through in dict.fromkeys(row.through for row in rows):
        found = [row.result for row in rows if row.through == through]
        lines.append(
            f"| {through} | {len(found)} "
            f"| {sum(item.places for item in found):,} "
            f"| {max(item.worst_place for item in found):.1e} "
            f"| {sum(item.pixels for item in found):,} "
            f"| {max(item.worst_pixel for item in found):.1e} px "
            f"| {max(item.limit for item in found):.2g} px |\n")
    return "".join(lines)

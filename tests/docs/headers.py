"""What the headers of the border declare, read from their text."""

import re
from dataclasses import dataclass

from project import ROOT


@dataclass(frozen=True)
class Operation:
    slot: int
    name: str
    arguments: str
    own_choice: bool  # the slot's number is this interface's own


@dataclass(frozen=True)
class Suite:
    name: str  # "" for the basic suite
    version: int
    operations: tuple


TABLE = re.compile(r"typedef struct (QZGP_\w+?Suite(\d+)|WNBasicSuite) \{\n(.*?)\n\} \w+;", re.DOTALL)
MEMBER = re.compile(
    r"/\*(?P<comment>.*?)\*/|void \(\*reserved\d+\[(?P<gap>\d+)\]\)\(void\);"
    r"|HostError \(\*(?P<name>\w+)\)\((?P<arguments>[^)]*)\);",
    re.DOTALL,
)
PINNED = re.compile(r"static_assert\(offsetof\((\w+), (\w+)\) == (\d+) \* sizeof")


def one_line(text):
    return re.sub(r"\s+", " ", text).strip()


def operations(members):
    slot = 0
    comment = ""
    found = []
    for member in MEMBER.finditer(members):
        if member["comment"] is not None:
            comment = member["comment"]
        elif member["gap"] is not None:
            slot += int(member["gap"])
        else:
            own = "own choice" in one_line(comment)
            found.append(Operation(slot, member["name"], one_line(member["arguments"]), own))
            slot += 1
            comment = ""
    return tuple(found)


def suites():
    """Every suite table of hostapi/, with the slots that the struct gives its operations."""
    found = []
    for path in sorted((ROOT / "hostapi").glob("*Suite.h")):
        text = path.read_text(encoding="utf-8")
        names = re.findall(r'#define QZGP_\w+_SUITE "([^"]+)"', text)
        pinned = {(table, name): int(slot) for table, name, slot in PINNED.findall(text)}
        for table, version, members in TABLE.findall(text):
            suite = Suite(names[0] if version else "", int(version or 0), operations(members))
            for operation in suite.operations:
                assert pinned[table, operation.name] == operation.slot, (table, operation.name)
            found.append(suite)
    return found


def error_codes():
    """(name, number, sentence) of each row of the table of codes."""
    text = (ROOT / "hostapi" / "ErrorCodes.h").read_text(encoding="utf-8")
    return re.findall(r'ENTRY\((\w+),\s*(\d+),\s*"([^"]*)"\)', text)


def utility_functions():
    """Name and declaration of each function that the utility library shows to plug-ins."""
    found = {}
    for path in sorted((ROOT / "hostutil").glob("*.h")):
        if path.name in ("HostSetup.h", "Export.h") or path.name.endswith("Internal.h"):
            continue
        text = path.read_text(encoding="utf-8")
        for declaration in re.findall(r"^HOSTUTIL_API ([^;]+);", text, re.MULTILINE | re.DOTALL):
            found[re.search(r"(\w+)\(", declaration)[1]] = one_line(declaration)
    return found


def setup_functions():
    text = (ROOT / "hostutil" / "HostSetup.h").read_text(encoding="utf-8")
    return re.findall(r"^HOSTUTIL_API [^;(]*?(\w+)\(", text, re.MULTILINE)


def rehearsed_services():
    text = (ROOT / "hostutil" / "HostSetup.h").read_text(encoding="utf-8")
    return re.findall(r"ENTRY\((\w+)\)", text)


def constants():
    """The named numbers of the suites' headers."""
    found = {}
    for path in sorted((ROOT / "hostapi").glob("*Suite.h")):
        text = path.read_text(encoding="utf-8")
        found.update(re.findall(r"^#define (HOST_\w+) \(?([-\w.]+)\)?", text, re.MULTILINE))
    found.pop("HOSTAPI_", None)
    return found

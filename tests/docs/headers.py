"""What the headers of the border declare, read from their text."""

import re
from dataclasses import dataclass

from project import ROOT, read


@dataclass(frozen=True)
class Operation:
    slot: int
    name: str
    arguments: str
    own_choice: bool  # the slot's number is this interface's own
    contract: str
    codes: tuple


@dataclass(frozen=True)
class Suite:
    name: str  # "" for the basic suite
    version: int
    header: str
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


def comment_text(comment):
    """The text of a C comment: its paragraphs, each in one line, apart by an empty line."""
    lines = [re.sub(r"^ ?\* ?", "", line.strip()) for line in comment.strip().splitlines()]
    return "\n\n".join(one_line(paragraph) for paragraph in "\n".join(lines).strip().split("\n\n"))


def introduction(header):
    """The comment at the head of a header."""
    return comment_text(re.match(r"/\*(.*?)\*/", read(header), re.DOTALL)[1])


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
            text, _, codes = one_line(comment_text(comment)).partition(" Codes: ")
            stated, own, contract = re.fullmatch(r"Slot (\d+)( \(this interface's own choice\))?\. (.+)", text).groups()
            assert int(stated) == slot, (member["name"], stated, slot)
            found.append(
                Operation(
                    slot,
                    member["name"],
                    one_line(member["arguments"]),
                    own is not None,
                    contract,
                    tuple(codes.rstrip(".").split(", ")),
                )
            )
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
            header = path.relative_to(ROOT).as_posix()
            suite = Suite(names[0] if version else "", int(version or 0), header, operations(members))
            for operation in suite.operations:
                assert pinned[table, operation.name] == operation.slot, (table, operation.name)
            found.append(suite)
    return found


def suite_headers():
    return list(dict.fromkeys(suite.header for suite in suites_in_order_of_release()))


def suites_in_order_of_release():
    """The suites but the basic one, as the module gives them back."""
    declared = {(suite.name, suite.version): suite for suite in suites()}
    released = re.findall(r"\{QZGP_(\w+)_SUITE, QZGP_\w+_SUITE_(\d+)\}", read("plugin/QZGP_SuiteHandler.cpp"))
    return [declared[f"QZGP {name.replace('_', ' ').title()} Suite", int(version)] for name, version in released]


def streams():
    """(name, number, meaning) of each stream of a layer."""
    return re.findall(r"^\s+(HOST_STREAM_\w+) = (\d+),?\s+/\* (.+?) \*/", read("hostapi/LayerStreams.h"), re.MULTILINE)


def error_codes():
    """(name, number, sentence) of each row of the table of codes."""
    text = (ROOT / "hostapi" / "ErrorCodes.h").read_text(encoding="utf-8")
    return re.findall(r'ENTRY\((\w+),\s*(\d+),\s*"([^"]*)"\)', text)


def utility_headers():
    """The headers of the utility library that plug-ins include."""
    for path in sorted((ROOT / "hostutil").glob("*.h")):
        if path.name not in ("HostSetup.h", "Export.h") and not path.name.endswith("Internal.h"):
            yield path.relative_to(ROOT).as_posix()


def utility_contracts():
    """Header to the (declaration, contract) of each of its functions."""
    found = {}
    for header in utility_headers():
        functions = []
        for comment, declarations in re.findall(r"/\*((?:(?!\*/).)*)\*/\n((?:HOSTUTIL_API [^;]+;\n)+)", read(header), re.DOTALL):
            for declaration in re.findall(r"HOSTUTIL_API ([^;]+);", declarations):
                functions.append((one_line(declaration), one_line(comment_text(comment))))
        if functions:
            found[header] = functions
    return found


def utility_functions():
    """The names of the functions that the utility library shows to plug-ins, from the headers' bare text."""
    return [
        re.search(r"(\w+)\(", declaration)[1]
        for header in utility_headers()
        for declaration in re.findall(r"^HOSTUTIL_API ([^;]+);", read(header), re.MULTILINE | re.DOTALL)
    ]


def types(header):
    """What a header declares besides tables, functions and inline C++: types and named numbers, with their comments."""
    text = read(header)
    text = text[text.index("*/") + 2 :].partition("static_assert")[0]
    text = re.sub(r"^#ifdef __cplusplus\n(?:extern \"C\" \{|\})\n#endif\n", "", text, flags=re.MULTILINE)
    text = re.sub(r"^#ifdef __cplusplus\n.*?^#endif\n", "", text, flags=re.MULTILINE | re.DOTALL)
    text = TABLE.sub("", text)
    text = re.sub(r"/\*(?:(?!\*/).)*\*/\n(?:HOSTUTIL_API [^;]+;\n)+", "", text, flags=re.DOTALL)
    text = re.sub(r"^#(?:include|ifndef|endif|define \w+_H\n|define QZGP_).*\n?", "", text, flags=re.MULTILINE)
    return re.sub(r"\n{3,}", "\n\n", text).strip()


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

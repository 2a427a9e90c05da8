"""Prints docs/host-reference.md from the headers of hostapi/ and hostutil/.

    python3 tests/docs/host_reference.py > docs/host-reference.md
"""

import re

import headers

BEGIN = """# The host reference

Each suite and service that the import module calls, as its header declares it. What a host has to do, and when each of
these is called, is the topic of [host-interface.md](host-interface.md). This page is made by
`tests/docs/host_reference.py` from the headers in [hostapi/](../hostapi) and [hostutil/](../hostutil).

- [The basic suite](#the-basic-suite)
- [The suites](#the-suites)
- [The layer streams](#the-layer-streams)
- [The utility library](#the-utility-library)
- [Types](#types)
- [Error codes](#error-codes)
"""

SUITES = """
Names and versions are passed exactly as they stand here. Two versions of a suite are two tables. Slots count pointers
from 0; those that are not listed are reserved, and may be null. A slot with a star is this interface's own choice of
number. After "Codes" stand those that the embedded host gives; another host may give others.
"""

STREAMS = """
The space is right-handed with Y down and Z away from the viewer. A layer takes scale first, then rotation about X, Y
and Z, then position.
"""

CODES = """
The numbers are fixed. The importer itself returns 3, 13 and 1289985 to 1289987. Codes from 2001 are the utility
library's, codes from 3001 the embedded host's refusals. Another host's codes pass through unchanged.
"""


def cell(text):
    """A comment's text in a table or a paragraph."""
    text = re.sub(r"\bHOST_ERR_(\w+)", r"`\1`", text)
    return text.replace("*", r"\*").replace("|", r"\|").replace("<", r"\<").replace("^^", r"\^\^")


def wrapped(text, width=120):
    """A paragraph in lines of the documents' width."""
    lines = [""]
    for word in text.split():
        if lines[-1] and len(lines[-1]) + 1 + len(word) > width:
            lines.append("")
        lines[-1] += (" " if lines[-1] else "") + word
    return "\n".join(lines)


def paragraphs(text):
    return "".join(f"\n{wrapped(cell(paragraph))}\n" for paragraph in text.split("\n\n"))


def operations(suite):
    yield "\n| slot | operation | contract |\n|---|---|---|\n"
    for operation in suite.operations:
        star = "*" if operation.own_choice else ""
        yield (
            f"| {operation.slot}{star} | `{operation.name}({operation.arguments})` "
            f"| {cell(operation.contract)} Codes: {cell(', '.join(operation.codes))} |\n"
        )


def suites():
    basic = next(suite for suite in headers.suites() if not suite.name)
    yield f"\n## The basic suite\n{paragraphs(headers.introduction(basic.header))}"
    yield from operations(basic)
    yield f"\n## The suites\n{SUITES}"
    for suite in headers.suites_in_order_of_release():
        yield f"\n### {suite.name}, version {suite.version}\n"
        yield paragraphs(re.sub(r'^"[^"]+": (\w)', lambda found: found[1].upper(), headers.introduction(suite.header)))
        yield from operations(suite)


def streams():
    yield f"\n## The layer streams\n{paragraphs(headers.introduction('hostapi/LayerStreams.h'))}{STREAMS}"
    yield "\n| number | name | numbers a value, unit |\n|---|---|---|\n"
    for name, number, meaning in headers.streams():
        yield f"| {number} | `{name}` | {cell(meaning)} |\n"


def library():
    yield "\n## The utility library\n"
    for header, functions in headers.utility_contracts().items():
        yield f"\n### {header}\n{paragraphs(headers.introduction(header))}"
        yield "\n| function | contract |\n|---|---|\n"
        for declaration, contract in functions:
            yield f"| `{declaration}` | {cell(contract)} |\n"


def types():
    yield "\n## Types\n"
    for header in ["hostapi/HostTypes.h", "hostapi/PluginEntry.h"] + headers.suite_headers() + list(
        headers.utility_contracts()
    ):
        code = headers.types(header)
        if code:
            yield f"\n### Types of {header}\n"
            if header == "hostapi/HostTypes.h":
                yield paragraphs(headers.introduction(header))
            yield f"\n```c\n{code}\n```\n"


def codes():
    yield f"\n## Error codes\n{CODES}"
    yield "\n| name | number | meaning |\n|---|---|---|\n"
    for name, number, sentence in headers.error_codes():
        yield f"| `{name}` | {number} | {sentence} |\n"


def page():
    parts = [BEGIN]
    for part in (suites, streams, library, types, codes):
        parts.extend(part())
    return "".join(parts)


if __name__ == "__main__":
    print(page(), end="")

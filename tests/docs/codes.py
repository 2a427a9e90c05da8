"""Which codes the operations give: as the headers of the border say, and as the embedded host's sources do."""

import re
from collections import defaultdict

from project import ROOT, read

CODE = re.compile(r"\bHOST_ERR_(\w+)")
SLOT = re.compile(r"/\*((?:(?!\*/).)*)\*/\n  HostError \(\*(\w+)\)", re.DOTALL)
FUNCTION = re.compile(r"\b(\w+)\([^;{}]*?\)\s*(?:const\s*)?\{")
COMMENT_OR_TEXT = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"', re.DOTALL)
TASK = re.compile(r"\bstruct (\w+) \{\s*static constexpr Operation kOperation = Operation::(\w+);")
KEYWORDS = ("if", "for", "while", "switch", "catch")


def bare(text):
    """C++ without its comments and texts."""
    return COMMENT_OR_TEXT.sub('""', text)


def declared():
    """Operation to the codes that its comment names."""
    found = {}
    for path in sorted((ROOT / "hostapi").glob("*Suite.h")):
        for comment, operation in SLOT.findall(path.read_text(encoding="utf-8")):
            found[operation] = set(CODE.findall(comment.partition("Codes:")[2]))
    return found


def functions(text):
    """The functions of a source by name; of several of one name the bodies together."""
    text = bare(text)
    found = defaultdict(str)
    for head in FUNCTION.finditer(text):
        if head[1] in KEYWORDS:
            continue
        end, depth = head.end(), 1
        while depth:
            depth += {"{": 1, "}": -1}.get(text[end], 0)
            end += 1
        found[head[1]] += text[head.end() : end]
    return found


def tasks(text):
    """The operations that are made for every key: a struct each, with the names of its functions."""
    text = bare(text)
    heads = list(TASK.finditer(text))
    ends = [text.index("\n};", head.end()) for head in heads]
    return {head[2]: functions(text[head.end() : end]) for head, end in zip(heads, ends)}


def reached(body, functions_of, members, is_member, seen=frozenset()):
    """The codes in a body and in what it calls: functions, and members of the Call that it has."""
    found = set(CODE.findall(body))
    called = [(True, name) for name in re.findall(r"\bcall\.(\w+)\(", body)]
    called += [(is_member, name) for name in re.findall(r"(?<![.>:\w])(\w+)\(", body)]
    for step in called:
        of_call, name = step
        within = members if of_call else functions_of
        if step not in seen and name in within:
            found |= reached(within[name], functions_of, members, of_call, seen | {step})
    return found


def given():
    """Operation to the codes that the embedded host's sources give it."""
    members = functions(read("refhost/Call.h") + read("refhost/Call.cpp"))
    shared = functions(read("refhost/Limits.cpp"))
    found = {}
    for path in sorted((ROOT / "refhost").glob("*Suite.cpp")):
        own = functions(path.read_text(encoding="utf-8"))
        for operation in declared():
            if operation in own:
                found[operation] = reached(own[operation], {**shared, **own}, members, False)
        # Their refusals name the operation first; those of all operations stand beside the Call.
        for operation, parts in tasks(path.read_text(encoding="utf-8")).items():
            found[operation] = reached(parts["work"], {**shared, **members, **parts}, members, False)
    return found


def tested():
    """Operation to the codes of the rows in the tests of refusals, each of which is made to happen."""
    names = {number: name for name, number in re.findall(r"ENTRY\((\w+),\s*(\d+)", read("hostapi/ErrorCodes.h"))}
    found = defaultdict(set)
    for path in sorted((ROOT / "tests" / "refhost").glob("*RefusalsTest.cpp")):
        for number, operation in re.findall(r'\{(\d{4}),\s*"(\w+): ', path.read_text(encoding="utf-8")):
            found[operation].add(names[number])
    return found

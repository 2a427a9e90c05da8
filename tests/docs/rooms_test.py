"""The sources against the table of rooms in docs/architecture.md."""

import re
import unittest
from pathlib import PurePosixPath

from project import ROOT, read

# Folders whose sources may include anything.
FREE = ("tests", "fuzz", "bench")
INCLUDE = re.compile(r'^\s*#\s*include\s+"([^"]+)"', re.MULTILINE)


class Room:
    def __init__(self, name, may_include):
        self.places = re.findall(r"`(\w+/[\w/]+)`", name) or re.findall(r"`([\w/]+/)`", name)
        allowed, _, denied = may_include.partition("but not")
        self.allowed = re.findall(r"`([\w/.]+)`( services)?", allowed)
        self.denied = re.findall(r"`([\w/.]+)`", denied)

    def holds(self, path):
        if any(place.endswith("/") and path.startswith(place) for place in self.places):
            return True
        return str(PurePosixPath(path).with_suffix("")) in self.places


def rooms():
    text = read("docs/architecture.md")
    table = re.search(r"^\| room \| holds \| may include \|\n\|[-|]+\|\n(.*?)\n\n", text, re.MULTILINE | re.DOTALL)
    rows = [[cell.strip() for cell in row.strip("|").split("|")] for row in table[1].splitlines()]
    return {name: Room(name, may_include) for name, _, may_include in rows}


def folders():
    """The folders of the project that hold sources of the rooms: neither free ones nor builds."""
    for folder in sorted(ROOT.iterdir()):
        built = folder.name == "build" or (folder / "CMakeCache.txt").exists()
        if folder.is_dir() and folder.name not in FREE and not folder.name.startswith(".") and not built:
            yield folder


def sources():
    for folder in folders():
        for suffix in ("*.h", "*.cpp", "*.h.in"):
            for path in sorted(folder.glob(f"**/{suffix}")):
                yield path.relative_to(ROOT).as_posix(), path.read_text(encoding="utf-8")


class Rooms(unittest.TestCase):
    rooms = rooms()

    def room_of(self, path):
        found = [room for room in self.rooms.values() if room.holds(path)]
        self.assertEqual(len(found), 1, f"{path} belongs to {len(found)} rooms of docs/architecture.md")
        return found[0]

    def services(self):
        return next(room for name, room in self.rooms.items() if "services:" in name)

    def may_include(self, room, header):
        if header in room.denied:
            return False
        for place, services in room.allowed:
            if services:
                if self.services().holds(header):
                    return True
            elif header == place or (place.endswith("/") and header.startswith(place)):
                return True
        return room.holds(header)

    def test_the_table_has_the_rooms(self):
        self.assertEqual(len(self.rooms), 16)
        for room in self.rooms.values():
            self.assertTrue(room.places)
            for place in room.places:
                self.assertTrue(list(ROOT.glob(place.rstrip("/") + ("" if place.endswith("/") else ".*"))), place)

    def test_every_source_includes_what_its_room_may(self):
        looked_at = 0
        for path, text in sources():
            room = self.room_of(path)
            for header in INCLUDE.findall(text):
                looked_at += 1
                self.assertTrue(self.may_include(room, header), f"{path} includes {header}")
        self.assertGreater(looked_at, 100)

    def test_internal_headers_stay_in_their_room(self):
        for path, text in sources():
            for header in INCLUDE.findall(text):
                if header.endswith("Internal.h"):
                    self.assertEqual(PurePosixPath(path).parent, PurePosixPath(header).parent, path)

    def test_every_include_names_its_room(self):
        for path, text in sources():
            for header in INCLUDE.findall(text):
                self.assertIn("/", header, f"{path} includes {header}")

    def test_headers_are_included_once(self):
        for path, text in sources():
            if path.endswith(".h"):
                self.assertRegex(text, r"#pragma once|#ifndef \w+_H\n#define", path)

    def test_a_step_up_is_noticed(self):
        for path, header in (
            ("hostapi/HostTypes.h", "hostutil/Export.h"),
            ("scan/Decimal.h", "hostapi/HostTypes.h"),
            ("scan/Decimal.h", "hostutil/Export.h"),
            ("comp/UnwrapAngle.cpp", "scan/Decimal.h"),
            ("refhost/Host.cpp", "scan/Decimal.h"),
            ("hostutil/HostFile.cpp", "refhost/Host.h"),
            ("plugin/Messages.cpp", "plugin/ImportDriver.h"),
            ("plugin/Messages.cpp", "maya/MAYA_Lex.h"),
            ("maya/MAYA_Lex.cpp", "comp/Conversions.h"),
            ("maya/MAYA_Lex.cpp", "plugin/Entry.h"),
            ("comp/UnwrapAngle.cpp", "hostutil/HostSetup.h"),
            ("comp/UnwrapAngle.cpp", "refhost/Host.h"),
            ("plugin/Entry.cpp", "refhost/Host.h"),
            ("refhost/Host.cpp", "maya/MAYA_Lex.h"),
            ("refhost/Host.cpp", "hostutil/RecordList.h"),
            ("refhost/Host.cpp", "tools/mayascene/ExitStatus.h"),
            ("tools/mayascene/main.cpp", "hostutil/HostFile.h"),
            ("export/CsvWriter.cpp", "refhost/Project.h"),
            ("export/CsvWriter.cpp", "scene/Scene.h"),
            ("tools/mayascene/main.cpp", "plugin/Entry.h"),
        ):
            self.assertFalse(self.may_include(self.room_of(path), header), f"{path} includes {header}")

    def test_every_step_of_the_table_is_allowed(self):
        for path, header in (
            ("plugin/ReportError.cpp", "plugin/Messages.h"),
            ("plugin/ImportDriver.cpp", "plugin/Guarded.h"),
            ("plugin/ImportDriver.cpp", "comp/Conversions.h"),
            ("comp/UnwrapAngle.cpp", "maya/MAYA_Parse.h"),
            ("hostutil/HostNumbers.cpp", "scan/Decimal.h"),
            ("maya/MAYA_Lex.cpp", "scan/SkipText.h"),
            ("refhost/Host.cpp", "hostutil/HostSetup.h"),
            ("tools/mayascene/main.cpp", "refhost/Host.h"),
        ):
            self.assertTrue(self.may_include(self.room_of(path), header), f"{path} includes {header}")


if __name__ == "__main__":
    unittest.main()

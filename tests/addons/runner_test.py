"""How the tool is found and run. A script stands in for it."""

import json
import os
import stat
import tempfile
import unittest
from unittest import mock

import addon
import compositions
from plain import runner


class Runs(unittest.TestCase):
    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.addCleanup(self.folder.cleanup)

    def tool(self, text, name="mayascene"):
        path = os.path.join(self.folder.name, name)
        os.makedirs(os.path.dirname(path), exist_ok=True)
        with open(path, "w", encoding="utf-8") as file:
            file.write("#!/bin/sh\n" + text)
        os.chmod(path, os.stat(path).st_mode | stat.S_IXUSR)
        return path

    def tool_that_says(self, status, said, report="true"):
        given = os.path.join(self.folder.name, "given.json")
        with open(given, "w", encoding="utf-8") as file:
            json.dump(compositions.document(), file)
        return self.tool(f'cat "{given}"\n{report}\n'
                         f"echo '{said}' >&2\nexit {status}\n")

    def test_a_scene_gives_its_document(self):
        done = runner.run(self.tool_that_says(0, ""), "a.ma", False)
        self.assertEqual(done.document, compositions.document())
        self.assertEqual((done.remarks, done.status), ([], 0))

    def test_without_a_bake_its_lines_are_remarks(self):
        tool = self.tool_that_says(
            0, "\nline 4: no keys")
        self.assertEqual(runner.run(tool, "a.ma", False).remarks,
                         [("warning", "line 4: no keys")])

    def test_with_a_bake_the_diagnostics_of_the_report_are(self):
        report = json.dumps({"scenes": [{"diagnostics": [
            {"code": "MA0502", "severity": "warning", "line": 130,
             "sentence": "the film offset is lost"}]}]})
        # The report's path comes as the eighth word.
        tool = self.tool_that_says(
            0, "more lines", f"echo '{report}' > \"$8\"")
        self.assertEqual(
            runner.run(tool, "a.ma", True).remarks,
            [("warning", "line 130: the film offset is lost [MA0502]")])

    def test_a_failure_without_a_report_has_its_lines(self):
        tool = self.tool_that_says(5, "no space is left")
        done = runner.run(tool, "a.ma", True)
        self.assertEqual((done.remarks, done.status),
                         ([("error", "no space is left")], 5))

    def test_a_bake_whose_report_is_cut_short_has_its_lines(self):
        tool = self.tool_that_says(0, "a remark",
                                   "echo '{\"scenes\": [' > \"$8\"")
        self.assertEqual(runner.run(tool, "a.ma", True).remarks,
                         [("warning", "a remark")])

    def test_a_failure_with_a_report_has_each_of_both_once(self):
        report = json.dumps({"scenes": [{"diagnostics": [
            {"code": "MA0502", "severity": "warning", "line": 130,
             "sentence": "the film offset is lost"}]}]})
        tool = self.tool_that_says(
            1, "a.ma:130:2: warning: the film offset is lost [MA0502]\n"
            "help: set it by hand\n"
            "mayascene: a.ma: left behind: a file\n"
            "a.ma:7:1: error: the film is lost [MA0501]\n"
            "help: find it",
            f"echo '{report}' > \"$8\"")
        self.assertEqual(
            runner.run(tool, "a.ma", True).remarks,
            [("error", "mayascene: a.ma: left behind: a file"),
             ("error", "a.ma:7:1: error: the film is lost [MA0501]"),
             ("error", "help: find it"),
             ("warning", "line 130: the film offset is lost [MA0502]")])

    def test_no_document_is_a_failure_with_its_words(self):
        with self.assertRaisesRegex(runner.ToolFailed, "no such module"):
            runner.run(self.tool("echo no such module >&2; exit 4\n"),
                       "a.ma", True)
        with self.assertRaisesRegex(runner.ToolFailed, "status 7"):
            runner.run(self.tool("exit 7\n"), "a.ma", True)

    def test_a_tool_that_is_stopped_is_a_failure_that_says_so(self):
        with self.assertRaisesRegex(runner.ToolFailed, "ended by signal 15"):
            runner.run(self.tool("kill -TERM $$\n"), "a.ma", True)

    def test_a_tool_that_cannot_be_started_is_named(self):
        with self.assertRaisesRegex(runner.ToolFailed, "nowhere/mayascene"):
            runner.run("nowhere/mayascene", "a.ma", True)

    def test_a_scene_whose_name_begins_with_a_dash_is_no_option(self):
        words = runner.command("mayascene", "-f.ma", True, "report.json")
        self.assertTrue(os.path.isabs(words[-1]))

    def test_the_preferences_come_first_then_path_then_the_project(self):
        built = self.tool("", "build/release/bin/mayascene")
        found = self.tool("", "bin/mayascene")
        addon_folder = os.path.join(self.folder.name, "a", "b", "c")
        path = os.path.dirname(found)
        with mock.patch.dict(os.environ, PATH=path):
            self.assertEqual(runner.find_tool("own", addon_folder), "own")
            self.assertEqual(runner.find_tool("", addon_folder), found)
        with mock.patch.dict(os.environ, PATH=""):
            self.assertEqual(runner.find_tool("", addon_folder),
                             os.path.realpath(built))
            os.remove(built)
            self.assertIsNone(runner.find_tool("", addon_folder))

    def test_the_project_is_three_folders_above_the_addon(self):
        self.assertTrue((addon.ADDON.parents[2] / "CMakeLists.txt").is_file())


if __name__ == "__main__":
    unittest.main()

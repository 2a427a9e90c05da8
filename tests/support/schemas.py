"""Validates what the tool writes against a JSON Schema, and tries whether the schema refuses documents that are broken
in one place each."""

import argparse
import copy
import json
import os
import pathlib
import subprocess
import tempfile

import jsonschema


class SchemaTest:
    """A test of one schema: takes the command line, and collects failures."""

    def __init__(self):
        parser = argparse.ArgumentParser()
        parser.add_argument("--tool", required=True)
        parser.add_argument("--schema", required=True)
        parser.add_argument("--scenes", nargs="+", required=True)
        self.arguments = parser.parse_args()
        schema = json.loads(pathlib.Path(self.arguments.schema).read_text(encoding="utf-8"))
        jsonschema.Draft7Validator.check_schema(schema)
        self.validator = jsonschema.Draft7Validator(schema)
        self.folder = tempfile.TemporaryDirectory()
        self.failures = []

    def write(self, name, text):
        pathlib.Path(self.folder.name, name).write_text(text, encoding="utf-8")

    def scenes(self, least):
        """The scenes of the folders of the command line, which are at least so many."""
        paths = sorted(str(path) for place in self.arguments.scenes for path in pathlib.Path(place).glob("*.ma"))
        self.expect(len(paths) >= least, f"no scenes in {self.arguments.scenes}")
        return paths

    def document_of(self, verb, *words):
        run = subprocess.run(
            [self.arguments.tool, verb, "--json", "-", *words],
            stdout=subprocess.PIPE, stderr=subprocess.PIPE, cwd=self.folder.name,
            env=dict(os.environ, XDG_CONFIG_HOME=self.folder.name), check=False)
        return json.loads(run.stdout)

    def expect(self, held, failure):
        if not held:
            self.failures.append(failure)

    def finish(self, documents, good, broken):
        """Judges documents by name, and what each damage makes of the good one. The status of the program."""
        for name, document in documents.items():
            for error in self.validator.iter_errors(document):
                self.failures.append(f"{name}: {error.message} at {list(error.absolute_path)}")
        for name, damage in broken.items():
            damaged = copy.deepcopy(good)
            damage(damaged)
            self.expect(damaged != good, f"{name}: nothing was broken")
            self.expect(not self.validator.is_valid(damaged), f"{name}: the schema takes a broken document")
        for failure in self.failures:
            print(failure)
        print(f"{len(documents)} documents, {len(broken)} broken ones, {len(self.failures)} failures")
        self.folder.cleanup()
        return 1 if self.failures else 0

#!/usr/bin/env python3
"""Runs the tool and validates what it writes against the JSON Schema; then checks that the schema refuses documents
that are broken in one place each."""

import json
import pathlib
import sys

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))
from schemas import SchemaTest  # noqa: E402

HEADER = "//Maya ASCII 2023 scene\n"
CAMERA = HEADER + """currentUnit -l centimeter -a degree -t film;
createNode transform -n "boom";
createNode transform -n "shotcam" -p "boom";
createNode camera -n "shotcamShape\x1b\x07" -p "shotcam";
createNode animCurveTA -n "boom_rotateX";
\tsetAttr -s 3 ".ktv[0:2]" 1 0 2 7.5 3 15;
connectAttr "boom_rotateX.o" "boom.rx";
"""

BROKEN = {
    "another format": lambda d: d.update(format="mayascene"),
    "another version": lambda d: d.update(version=2),
    "no scenes": lambda d: d.update(scenes=[]),
    "no death hook": lambda d: d.pop("deathHook"),
    "an unknown outcome": lambda d: scene(d).update(outcome="done"),
    "a first frame that is a word": lambda d: scene(d).update(firstFrame="1"),
    "a first frame without a last": lambda d: scene(d).pop("lastFrame"),
    "frames without a unit": lambda d: scene(d).pop("linearUnit"),
    "an empty unit": lambda d: scene(d).update(linearUnit=""),
    "an import with an error": lambda d: scene(d).update(error={"code": 5, "name": "", "meaning": "", "line": None}),
    "an error of code 0": lambda d: d["entry"].update(error={"code": 0, "name": "", "meaning": "", "line": None}),
    "an error at line 0": lambda d: d["entry"].update(error={"code": 5, "name": "", "meaning": "", "line": 0}),
    "an error without a line": lambda d: d["entry"].update(error={"code": 5, "name": "", "meaning": ""}),
    "an import without compositions": lambda d: scene(d).update(compositions=[]),
    "a message that is no text": lambda d: scene(d).update(messages=[7]),
    "a duration in seconds": lambda d: composition(d).update(duration=5.0),
    "a rate of three numbers": lambda d: composition(d).update(frameRate=[24, 1, 1]),
    "a negative denominator": lambda d: composition(d).update(pixelAspect=[1, -1]),
    "a layer of number 0": lambda d: layer(d).update(number=0),
    "an unknown kind": lambda d: layer(d).update(kind="light"),
    "a camera of six streams": lambda d: layer(d)["streams"].pop(),
    "streams in another order": lambda d: layer(d)["streams"].reverse(),
    "a null with a film size": lambda d: null(d).update(filmSize={"direction": "vertical", "points": 1}),
    "a null that is aimed": lambda d: null(d).update(aimed=True),
    "a position of two numbers": lambda d: layer(d)["streams"][1].update(value=[1, 2]),
    "a value that is a word": lambda d: layer(d)["streams"][1].update(value=[1, 2, "three"]),
    "another unit": lambda d: layer(d)["streams"][2].update(unit="factor"),
    "keys without values": lambda d: null(d)["streams"][4]["keys"].pop("values"),
    "no keys as an empty list": lambda d: layer(d)["streams"][1].update(keys=[]),
}


def scene(document):
    return document["scenes"][0]


def composition(document):
    return scene(document)["compositions"][0]


def layer(document):
    return composition(document)["layers"][0]


def null(document):
    return composition(document)["layers"][1]


def main():
    test = SchemaTest()
    test.write("camera.ma", CAMERA)
    test.write("wide.ma", CAMERA + "select -ne :defaultResolution;\n\tsetAttr \".pa\" 2;\n")
    test.write("aperture.ma", CAMERA + "createNode camera -n \"c\";\n\tsetAttr \".cap\" 0 0;\n")
    test.write("rig.ma", HEADER + "createNode transform -n \"rig\";\n")
    test.write("notes.txt", "just some notes\n")
    test.write("broken.ma", HEADER + "createNode transform -n \"open;\n")
    good = test.document_of("import", "camera.ma")
    every = test.document_of("import", "camera.ma", "wide.ma", "rig.ma", "notes.txt", "broken.ma", "missing.ma")
    outcomes = {one["outcome"] for one in every["scenes"]}
    test.expect(outcomes == {"imported", "nothing", "refused", "failed", "unreadable"},
                f"not every outcome occurred: {outcomes}")
    infinities = test.document_of("import", "--permissive", "aperture.ma")
    test.expect('"inf"' in json.dumps(infinities), "no infinity occurred")
    documents = {
        "a camera": good,
        "every outcome": every,
        "infinities": infinities,
        "leftovers": test.document_of("import", "--fail", "SetStreamValue:0=9", "camera.ma"),
        "the examples": test.document_of("import", *test.scenes(least=1)),
    }
    return test.finish(documents, good, BROKEN)


if __name__ == "__main__":
    sys.exit(main())

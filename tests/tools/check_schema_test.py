#!/usr/bin/env python3
"""Runs checks and validates what they write against the JSON Schema; then checks that the schema refuses documents that
are broken in one place each."""

import pathlib
import sys

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))
from schemas import SchemaTest  # noqa: E402

HEADER = "//Maya ASCII 2018 scene\n"
UNITS = HEADER + "currentUnit -l centimeter -a degree -t film;\n"
CAMERA = UNITS + """fileInfo "product" "Maya 2018";
createNode transform -n "rig\x1b";
createNode transform -n "shotCam" -p "rig\x1b";
createNode camera -n "shotCamShape" -p "shotCam";
\tsetAttr ".fl" 50;
createNode animCurveTL -n "moveX";
\tsetAttr ".ktv[0:1]" 1 0 24 9;
connectAttr "moveX.o" "shotCam.tx";
createNode animCurveTU -n "zoom";
\tsetAttr ".ktv[0]" 1 35;
connectAttr "zoom.o" "shotCamShape.fl";
createNode locator -n "nullShape" -p "rig\x1b";
createNode lookAt -n "look";
createNode script -n "sceneConfigurationScriptNode";
\tsetAttr ".b" -type "string" "playbackOptions -min 1 -max 24 -ast 1 -aet 48 ";
"""

BROKEN = {
    "another format": lambda d: d.update(format="mayascene"),
    "another version": lambda d: d.update(version=2),
    "no scenes": lambda d: d.pop("scenes"),
    "a scene without a status": lambda d: scene(d).pop("status"),
    "a status of 6": lambda d: scene(d).update(status=6),
    "a scene that is a word": lambda d: d.update(scenes=["shot.ma"]),
    "errors in words": lambda d: scene(d).update(errors="none"),
    "an unknown field": lambda d: scene(d).update(more=1),
    "a head without units": lambda d: scene(d)["head"].pop("linearUnit"),
    "a width without a value": lambda d: scene(d)["head"]["width"].pop("value"),
    "a width without a place": lambda d: scene(d)["head"]["width"].pop("where"),
    "another range": lambda d: scene(d)["head"]["ranges"][0].update(what="selection"),
    "a camera without a path": lambda d: camera(d).pop("path"),
    "a layer without keys": lambda d: camera(d)["layer"].pop("keys"),
    "a driver without a type": lambda d: camera(d)["drivenBy"][0].pop("type"),
    "a link without a name": lambda d: camera(d)["chain"][0].pop("name"),
    "a span without an end": lambda d: camera(d)["overFrames"]["focalLength"].pop("largest"),
    "frames without a first one": lambda d: camera(d)["overFrames"].pop("first"),
    "a locator without a layer": lambda d: scene(d)["head"]["locators"][0].pop("layer"),
    "a look-at without a target": lambda d: scene(d)["head"]["lookAts"][0].pop("target"),
    "line 0": lambda d: camera(d)["where"].update(line=0),
    "another severity": lambda d: diagnostic(d).update(severity="fatal"),
    "another code": lambda d: diagnostic(d).update(code="E12"),
    "a diagnostic without a range": lambda d: diagnostic(d).pop("range"),
    "a range without an end": lambda d: diagnostic(d)["range"].pop("end"),
    "an argument that is a number": lambda d: diagnostic(d).update(arguments=[1]),
    "a count of 0 of a code": lambda d: scene(d)["notInFull"].update(MA0209=0),
    "a count of no code": lambda d: scene(d)["notInFull"].update(units=3),
}


def scene(document):
    return document["scenes"][0]


def camera(document):
    return scene(document)["head"]["cameras"][0]


def diagnostic(document):
    return next(one for one in scene(document)["diagnostics"] if one["range"] is not None)


def main():
    test = SchemaTest()
    test.write("camera.ma", CAMERA)
    test.write("many.ma", UNITS + "currentUnit -t parsec;\n" * 30)
    test.write("notes.txt", "just some notes\n")
    test.write("broken.ma", HEADER + "createNode transform -n \"open;\n")
    test.write("infinite.ma", CAMERA + "createNode camera -n \"c\";\n\tsetAttr \".fl\" 0;\n")
    test.write("flat.ma", CAMERA + "createNode camera -n \"flat\";\n\tsetAttr \".o\" yes;\n")
    good = test.document_of("check", "camera.ma")
    every = test.document_of("check", "many.ma", "notes.txt", "broken.ma", "missing.ma", "infinite.ma")
    test.expect(every["scenes"][0]["notInFull"], "nothing was counted alone")
    test.expect(every["scenes"][3]["failure"] is not None, "no file could not be read")
    documents = {
        "a camera": good,
        "an orthographic camera": test.document_of("check", "flat.ma"),
        "every kind of file": every,
        "own scenes": test.document_of("check", "--all", *test.scenes(least=8)),
    }
    return test.finish(documents, good, BROKEN)


if __name__ == "__main__":
    sys.exit(main())

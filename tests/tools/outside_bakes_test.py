#!/usr/bin/env python3
"""Bakes scenes from outside the project, where folders beside the source folder hold them.

usage: outside_bakes_test.py TOOL ROOT

Each row was checked against the scene's text: its cameras, without the startup and the orthographic ones; the frames of
its playback range and of the keys of those cameras; and, for a camera in world space, why it cannot come with its
parents.
"""

import json
import pathlib
import sys
import tempfile

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))
from compositions import Tool  # noqa: E402

# File, first and last frame, and its cameras: each by its path's last name, with how it comes, and what of it moves: its
# "place", its "lens", or "still" where nothing does.
TABLE = """
scenes/animated_camera           1    120  cameraShape1 hierarchy place+lens
scenes/attribute_alias           1    120
scenes/camera_export_pal       101   2402  shotCAMShape hierarchy place
scenes/camera_rig_aim            1   1000  render_camShape hierarchy place
# The last key is at 97.
scenes/five_cameras              1     97  PerspCamStaticShape hierarchy still, PerspCamAnimTransformShape hierarchy place,
                                           PerspCamAnimShapeShape hierarchy lens, PerspCamNoDOFShape hierarchy still,
                                           PerspectiveCameraShape hierarchy still
scenes/inch_40fps                0     50
# No playback range. The camera itself is scaled by 71.98.
scenes/lookat_full_names         1      1  cameraShape1 world still
scenes/lookat_short_names        1    800  cameraShape1 hierarchy place
scenes/no_final_newline          1      1
scenes/stereo_rigs               1    200  perspShape2 hierarchy still, DomeStereoCameraECenterCamShape hierarchy still,
                                           DomeStereoCameraELeftShape hierarchy still,
                                           DomeStereoCameraERightShape hierarchy still,
                                           DomeStereoCameraOCenterCamShape hierarchy still,
                                           DomeStereoCameraOLeftShape hierarchy still,
                                           DomeStereoCameraORightShape hierarchy still
scenes/tracked_camera            0     94  cameraShape hierarchy place+lens
scenes/unequal_keys              1    720  cameraShape1 hierarchy place, cameraShape2 hierarchy place,
                                           cameraShape3 hierarchy place
# One camera has curves of one key, the other follows what is in another file.
scenes/unquoted_path             0     84  cameraShape1 hierarchy still, cameraShape2 hierarchy still

shots/alias_list                 1    120
# Plays from 97 on; the first key is at 1. One camera's curves are level, and one has no curves.
shots/blend_weighted             1    241  cameraShape1 hierarchy place, cameraShape2 hierarchy still,
                                           perspShape2 hierarchy still, cameraShape3 hierarchy place
# The curves drive the film offset and the shake, and an orthographic camera.
shots/camera_spline_2026         0     33  perspCamera hierarchy still
shots/conflict_marks             1    120
shots/cube_a                     1    101  cameraShape1 hierarchy place
shots/fight_camera               1    117  Rendering_CameraShape hierarchy place
shots/focal_from_transform     101   2402  shotCAMShape hierarchy place
shots/focal_from_transform_static 1     1  shotCAMShape hierarchy still
# Plays to 667; the last key is at 783.33.
shots/look_at_80fps              0    784  SH010_cameraShape hierarchy place, SH020_cameraShape hierarchy place
shots/look_at_with_curves        1    800  cameraShape1 hierarchy place
shots/parent_constraint          0     84  cameraShape1 hierarchy still, cameraShape2 hierarchy still
shots/point_constraint           1      1  cameraShape2 hierarchy still
# Plays from 3 on; the camera's curves have one key, at 1.
shots/reference_edits            1    280  cameraShape1 hierarchy still
shots/reference_edits_small      1     24
shots/rig_point_orient           1   5400  render_camShape hierarchy place
shots/short_film_shot_12         0     30  Render_CameraShape hierarchy still
shots/short_film_shot_14         0     76  Render_CameraShape hierarchy place
shots/short_film_shot_3          0     80  Render_CamShape hierarchy place
# The camera is scaled by 0.1185, by keys.
shots/shot_350                   1    375  FinalCameraShape world place
shots/solve_before               0     94  stA_1_1Shape1 hierarchy place
shots/solve_zxy                  0     94  stA_1_1Shape1 hierarchy place
shots/stereo_rig_shot            1     24  cameraShape1 hierarchy still, stereoCameraCenterCamShape hierarchy still,
                                           stereoCameraLeftShape hierarchy still, stereoCameraRightShape hierarchy still
shots/stereo_rig_vr              1     24  z360StereoCameraCenterCamShape hierarchy still,
                                           stereoCameraLeftShape hierarchy still, stereoCameraRightShape hierarchy still
shots/turntable                  0    180  turnTableCamera1Shape hierarchy place
shots/two_cameras_weighted     -50    100  cameraShape1 hierarchy place, cameraShape2 hierarchy place,
                                           cameraShape3 hierarchy place, cameraShape4 hierarchy place
shots/walk_render_cam            0     33  RenderCamWalkingShape hierarchy place, RenderCamStillShape hierarchy still
shots/weighted_three_keys        1    120  perspShape2 hierarchy place
shots/weighted_two_keys          1    120  cameraShape1 hierarchy place+lens
shots/curves/example_curves   1001   1101
"""


def rows():
    """By file: first and last frame, and the cameras in the order of the file."""
    found, last = {}, None
    for line in TABLE.splitlines():
        if not line or line.startswith("#"):
            continue
        if line.startswith(" "):
            found[last][2] += " " + line.strip()
        else:
            last, first, end, *cameras = line.split(None, 3)
            found[last] = [int(first), int(end), cameras[0] if cameras else ""]
    return {
        name: (first, end, [camera.strip() for camera in cameras.split(",") if camera.strip()])
        for name, (first, end, cameras) in found.items()
    }


def shown(camera):
    """A camera of the report, in the words of the table."""
    moving = [word for word, moves in (("place", camera["moves"]), ("lens", camera["lensMoves"])) if moves]
    name = camera["path"].rpartition("|")[2]
    return f'{name} {camera["method"]} {"+".join(moving) or "still"}'


def baked(report):
    frames = report["frames"]
    return frames["first"], frames["last"], [shown(camera) for camera in report["cameras"] if camera["written"]]


def imported(scene):
    """The names of the cameras that came, and whether all of it came without a word."""
    layers = [layer for composition in scene["compositions"] for layer in composition["layers"]]
    names = [layer["name"] for layer in layers if layer["kind"] == "camera"]
    return names, scene["status"] == 0 and not scene["messages"] and not scene["refusals"]


def main():
    tool_path, root = sys.argv[1], pathlib.Path(sys.argv[2])
    shared = root.parent / "shared"
    table = rows()
    missing = [name for name in table if not (shared / f"{name}.ma").exists()]
    there = [name for name in table if name not in missing]
    if missing:
        print(f"LEFT OUT: bakes of {len(missing)} of {len(table)} scenes of others: they are not there")
    complaints = []
    for folder in ("scenes", "shots", "shots/curves"):
        for path in sorted((shared / folder).glob("*.ma")):
            name = path.relative_to(shared).with_suffix("").as_posix()
            if name not in table:
                complaints.append(f"{name} has no row")
    if there:
        with tempfile.TemporaryDirectory() as folder:
            tool = Tool(tool_path, folder)
            paths = [shared / f"{name}.ma" for name in there]
            tool.run("bake", "--quiet", *paths, "-o", "bakes", "--report", "report.json")
            reports = json.loads((pathlib.Path(folder) / "report.json").read_text(encoding="ascii"))["scenes"]
            scenes = tool.all_imported([f"bakes/{path.name}" for path in paths])
        for name, report, scene in zip(there, reports, scenes, strict=True):
            got, (names, well) = baked(report), imported(scene)
            if got != table[name]:
                complaints.append(f"{name}: {got}, expected {table[name]}")
            if not well or len(names) != len(table[name][2]):
                complaints.append(f"{name}: its bake imports with status {scene['status']}, cameras {names}")
    for complaint in complaints:
        print(complaint)
    cameras = sum(len(table[name][2]) for name in there)
    print(f"{len(there)} scenes, {cameras} cameras, {len(complaints)} complaints")
    return 1 if complaints or len(table) != 42 else 0


if __name__ == "__main__":
    sys.exit(main())

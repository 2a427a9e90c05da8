"""Runs inside Blender: what it shows of the objects at each frame."""

import json

import bpy


def _rows(matrix):
    return [list(row) for row in matrix]


def _projection(item, depsgraph, render):
    return _rows(item.calc_matrix_camera(
        depsgraph, x=render.resolution_x, y=render.resolution_y,
        scale_x=render.pixel_aspect_x, scale_y=render.pixel_aspect_y))


def measure(frames, named):
    """`frames` are (label, Blender's frame); `named` maps names to objects.
    """
    scene = bpy.context.scene
    measured = {}
    for label, frame in frames:
        scene.frame_set(int(frame), subframe=frame - int(frame))
        depsgraph = bpy.context.evaluated_depsgraph_get()
        layers = {}
        for name, item in named.items():
            shown = item.evaluated_get(depsgraph)
            layers[name] = {"world": _rows(shown.matrix_world)}
            if item.type == 'CAMERA':
                layers[name]["projection"] = _projection(shown, depsgraph,
                                                         scene.render)
        measured[label] = layers
    return measured


def write(path, document):
    with open(path, "w", encoding="utf-8") as file:
        json.dump(document, file)

"""Runs inside Blender: draws the picture of docs/blender.md.

The crane shot as the add-on imports it: rods along its chain of nulls, the
camera's way over all frames, and what it sees at one of them.
"""

import math
import sys

import bpy
from mathutils import Vector

sys.path.insert(0, sys.argv[sys.argv.index("--") + 1])

from blender_session import begin, read_job  # noqa: E402

_FRAMES_SHOWN = (0.0, 0.25, 0.5, 0.75, 1.0)
_SIZE = (720, 405)


def _material(name, colour):
    made = bpy.data.materials.new(name)
    made.use_nodes = True
    node = made.node_tree.nodes["Principled BSDF"]
    node.inputs["Base Color"].default_value = (*colour, 1.0)
    node.inputs["Roughness"].default_value = 1.0
    node.inputs["Specular"].default_value = 0.0
    return made


def _tube(name, lines, thickness, material):
    curve = bpy.data.curves.new(name, 'CURVE')
    curve.dimensions = '3D'
    curve.bevel_depth = thickness
    curve.materials.append(material)
    for line in lines:
        spline = curve.splines.new('POLY')
        spline.points.add(len(line) - 1)
        for point, place in zip(spline.points, line):
            point.co = (*place, 1.0)
    made = bpy.data.objects.new(name, curve)
    bpy.context.scene.collection.objects.link(made)


def _chain(camera):
    places = []
    item = camera
    while item.parent is not None:
        places.append(item.matrix_world.translation.copy())
        item = item.parent
    return places


def _frustum(camera, scene, length):
    corners = [camera.matrix_world @ (corner * (length / -corner.z))
               for corner in camera.data.view_frame(scene=scene)]
    apex = camera.matrix_world.translation.copy()
    return ([[apex, corner] for corner in corners]
            + [corners + corners[:1]])


def _overview(scene, middle, size):
    data = bpy.data.cameras.new("overview")
    data.clip_end = 1000.0 * size
    item = bpy.data.objects.new("overview", data)
    item.location = middle + Vector((-1.25, -1.35, 0.85)) * size
    item.rotation_euler = (middle - item.location).to_track_quat(
        '-Z', 'Y').to_euler()
    scene.collection.objects.link(item)
    scene.camera = item


def _sun(scene, energy, turn, shadow):
    """Suns without an angle, and no light from the sky: no noise, and so a
    small file."""
    data = bpy.data.lights.new("sun", 'SUN')
    data.energy = energy
    data.angle = 0.0
    data.cycles.cast_shadow = shadow
    item = bpy.data.objects.new("sun", data)
    item.rotation_euler = turn
    scene.collection.objects.link(item)


def _light(scene):
    _sun(scene, 2.5, (math.radians(40), math.radians(15), 0.6), True)
    _sun(scene, 1.5, (math.radians(10), 0.0, 0.0), False)


def _render(scene, path):
    scene.render.engine = 'CYCLES'
    scene.cycles.samples = 24
    scene.cycles.max_bounces = 0
    scene.render.dither_intensity = 0.0
    scene.cycles.use_denoising = False
    scene.view_settings.view_transform = 'Standard'
    scene.render.resolution_x, scene.render.resolution_y = _SIZE
    scene.render.pixel_aspect_x = scene.render.pixel_aspect_y = 1.0
    scene.render.image_settings.file_format = 'PNG'
    scene.render.image_settings.color_mode = 'RGB'
    scene.render.image_settings.compression = 100
    scene.render.filepath = path
    bpy.ops.render.render(write_still=True)


def main():
    job = read_job()
    begin(job["addons"], job["tool"])
    bpy.ops.import_scene.mayascene(filepath=job["scene"])
    scene = bpy.context.scene
    camera = scene.camera
    way, arms = [], []
    first, last = scene.frame_start, scene.frame_end
    shown = {round(first + part * (last - first)) for part in _FRAMES_SHOWN}
    for frame in range(first, last + 1):
        scene.frame_set(frame)
        way.append(camera.matrix_world.translation.copy())
        if frame in shown:
            arms.append(_chain(camera))
    points = way + [place for chain in arms for place in chain]
    low = Vector(map(min, zip(*points)))
    high = Vector(map(max, zip(*points)))
    size = (high - low).length
    for frame in sorted(shown):
        scene.frame_set(frame)
        _tube("sight", _frustum(camera, scene, size * 0.16), size * 0.003,
              _material("sight", (0.05, 0.2, 0.6)))
    _tube("way", [way], size * 0.007, _material("way", (0.9, 0.25, 0.02)))
    _tube("arms", arms, size * 0.005, _material("arms", (0.1, 0.1, 0.1)))
    bpy.ops.mesh.primitive_plane_add(size=size * 40.0)
    bpy.context.object.data.materials.append(
        _material("ground", (0.45, 0.47, 0.45)))
    _overview(scene, (low + high) / 2, size)
    _light(scene)
    _render(scene, job["output"])


main()

"""Makes the objects of a picture, or finds and updates them.

Maya's Y is up, Blender's Z. One root empty turns by a right angle about X;
all layers stand under it with the channels that they have in the scene. The
root's place belongs to the user: it is set only when the root is made.
"""

import math

import bpy
from mathutils import Matrix

from . import animation
from .plain import channels, lens, names

# The scene's file and the layer's key, on each object that an import made.
SCENE = "mayascene_scene"
LAYER = "mayascene_layer"

_ROOT = "root"
_LEAST_CLIP_END = 1000.0


class Builder:
    """Builds one picture. `factor` is Blender's units in one of the scene's,
    `metre` what a metre is in Blender's."""

    def __init__(self, blender_scene, source, picture, factor, metre):
        self.scene = blender_scene
        self.source = source
        self.picture = picture
        self.factor = factor
        self.metre = metre
        self.made = 0
        self.updated = 0
        self.remarks = []
        self.cameras = []
        self.first_time = False
        self._known = {item[LAYER]: item
                       for item in reversed(bpy.data.objects)
                       if item.get(SCENE) == source and LAYER in item}
        self._collection = None

    def build(self):
        root = self._root()
        keys = names.keys_of(self.picture.layers)
        objects = {layer: self._object(layer, key)
                   for layer, key in zip(self.picture.layers, keys)}
        for layer, item in objects.items():
            if layer.is_camera and channels.is_slanted(layer):
                self._place(item, root,
                            channels.world_tracks(layer, self.factor))
                self.remarks.append(
                    ("note", f'"{layer.name}" stands in the world: scales '
                             "above it slant its axes"))
            else:
                self._place(item, objects.get(layer.parent, root),
                            channels.tracks(layer, self.factor))
            if layer.is_camera:
                self.cameras.append(item)
                self._set_lens(item.data, layer)
        self._say_what_is_gone(set(keys))
        return root

    def _root(self):
        root = self._known.get(_ROOT)
        if root is None:
            self.first_time = True
            root = self._new(self.picture.name, None, _ROOT)
            root.rotation_euler = (math.radians(90.0), 0.0, 0.0)
        self._show(root)
        return root

    def _object(self, layer, key):
        item = self._known.get(key)
        if item is not None:
            self.updated += 1
        else:
            self.made += 1
            data = None
            if layer.is_camera:
                data = bpy.data.cameras.new(layer.name)
                data.display_size = 0.5 * self.metre
                data.clip_end = max(_LEAST_CLIP_END, 10.0 * self._reach())
            item = self._new(layer.name, data, key)
        self._show(item)
        return item

    def _new(self, name, data, key):
        item = bpy.data.objects.new(name, data)
        item[SCENE] = self.source
        item[LAYER] = key
        if data is None:
            item.empty_display_size = 0.25 * self.metre
        return item

    def _reach(self):
        """The largest distance from layer to parent, in Blender's units."""
        return self.factor * max(
            math.hypot(*value) for layer in self.picture.layers
            for value in layer.streams["position"].values)

    def _show(self, item):
        if item.name not in self.scene.objects:
            self._own_collection().objects.link(item)

    def _own_collection(self):
        if self._collection is None:
            found = [item for item in self.scene.collection.children_recursive
                     if item.get(SCENE) == self.source]
            self._collection = found[0] if found else self._new_collection()
        return self._collection

    def _new_collection(self):
        collection = bpy.data.collections.new(self.picture.name)
        collection[SCENE] = self.source
        self.scene.collection.children.link(collection)
        return collection

    def _place(self, item, parent, tracks):
        item.parent = parent
        item.matrix_parent_inverse = Matrix.Identity(4)
        item.rotation_mode = 'XYZ'
        animation.apply(item, tracks)

    def _set_lens(self, camera, layer):
        wanted = lens.lens_of(layer, self.picture)
        camera.type = 'PERSP'
        camera.sensor_fit = wanted.fit
        camera.sensor_width = wanted.sensor_width
        camera.sensor_height = wanted.sensor_height
        animation.apply(camera, [wanted.track])
        if min(wanted.track.values) <= 0.0:
            self.remarks.append(
                ("warning", f'"{layer.name}" has no zoom at some frame: '
                            "Blender shows its shortest lens there"))

    def _say_what_is_gone(self, keys):
        gone = sorted(item.name for key, item in self._known.items()
                      if key not in keys and key != _ROOT)
        if gone:
            self.remarks.append(
                ("warning", "of an earlier import, and no longer in the "
                            f"scene: {', '.join(gone)}"))

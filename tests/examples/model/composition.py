"""Builds a composition out of scene records and writes down the suite calls: the model's other half."""

import math
import os

from matrices import Affine
from scene_text import CUSTOM_RATE, FOLLOWS, TARGET, TURNS, SceneText
from tokens import ImportFailure, truncated

UTILITY, MEMORY = ("QZGP Utility Suite", 7), ("QZGP Memory Suite", 1)
STORE, REGISTER = ("QZGP Persistent Data Suite", 3), ("QZGP Register Suite", 6)
MANAGER, LAYER = ("QZGP File Import Manager Suite", 3), ("QZGP Layer Suite", 10)
COMP21, COMP9 = ("QZGP Comp Suite", 21), ("QZGP Comp Suite", 9)
CAMERA, STREAM7, STREAM8 = ("QZGP Camera Suite", 2), ("QZGP Stream Suite", 7), ("QZGP Stream Suite", 8)
KEYS3, KEYS4 = ("QZGP Keyframe Suite", 3), ("QZGP Keyframe Suite", 4)
RELEASE_ORDER = (UTILITY, MEMORY, STORE, REGISTER, MANAGER, COMP21, COMP9, LAYER, CAMERA, STREAM7, STREAM8,
                 KEYS3, KEYS4)

PLUGIN = 1
ANCHOR, POSITION, SCALE, Z_TURN, X_TURN, Y_TURN, ZOOM = 0, 1, 2, 3, 8, 9, 11
FLAG_3D, FLAG_AIMED = 0x800, 8192
CENTRE = -2147483648.0
KEY_COUNTS = (1289987, "Inconsistant number of keyframes for Maya camera.")
# Code: the keys' units per second, whether the unit counts frames, the duration's scale, the frame rate.
TIMES = {1: (3600.0, False, 3600000, 30), 2: (60.0, False, 60000, 30), 3: (1.0, False, 1000, 30),
         4: (0.001, False, 1, 30), 5: (15.0, False, 15000, 15), 6: (24.0, True, 24000, 24),
         7: (25.0, True, 25000, 25), 8: (30.0, True, 30000, 30), 9: (48.0, True, 48000, 48),
         10: (50.0, True, 50000, 50), 11: (60.0, True, 60000, 60)}
TO_POINTS = {1: lambda d: d / 25.4 * 72.0, 2: lambda d: d / 2.54 * 72.0, 3: lambda d: d * 100.0 / 0.0254 * 72.0,
             4: lambda d: d * 1000.0 * 100.0 * 72.0, 5: lambda d: d * 72.0, 6: lambda d: d * 12.0 * 72.0,
             7: lambda d: d * 36.0 * 72.0, 8: lambda d: d * 5280.0 * 12.0 * 72.0}


class Suites:
    """What one suite handler acquired, and the lines of its calls."""

    def __init__(self, lines):
        self.lines = lines
        self.held = set()

    def call(self, operation, suite, /, **arguments):
        if suite not in self.held:
            self.held.add(suite)
            self.lines.append({"call": "AcquireSuite", "suite": suite[0], "version": suite[1], "error": 0})
        self.lines.append({"call": operation, "suite": suite[0], "version": suite[1], **arguments, "error": 0})

    def release(self):
        for name, version in (suite for suite in RELEASE_ORDER if suite in self.held):
            self.lines.append({"call": "ReleaseSuiteByName", "suite": name, "version": version, "error": 0})


class Builder:
    """Turns one scene into calls."""

    def __init__(self, scene, suites, linear_units):
        self.scene, self.suites, self.linear_units = scene, suites, linear_units
        self.transforms = scene.lists["transform"]
        self.counts = {}
        self.offset = 0.0

    def new(self, kind):
        self.counts[kind] = self.counts.get(kind, 0) + 1
        return "%s:%d" % (kind, self.counts[kind])

    def find(self, name):
        index = self.scene.first("transform", name)
        return self.transforms[index] if index >= 0 else None

    def points(self, distance):
        if not self.linear_units:
            return distance
        return TO_POINTS.get(self.scene.linear_unit, TO_POINTS[2])(distance)

    def flipped(self, vector):
        x, y, z = map(self.points, vector)
        return [x, -y, -z]

    def degrees(self, angle):
        return angle * 0.017453292519943295 if self.scene.angle_unit == 2 else angle

    def rate(self):
        if self.scene.time_unit == CUSTOM_RATE:
            return self.scene.frame_rate if self.scene.frame_rate > 0.0 else 29.97, True
        return TIMES[self.scene.time_unit][:2]

    def time(self, time, first):
        factor, counts_frames = self.rate()
        if first and counts_frames:
            self.offset = time
        return [truncated((time - self.offset) * 1000.0 + 0.5), truncated(factor * 1000.0, 0, 2**32 - 1)]

    def duration(self):
        curves = self.scene.lists["curve"]
        if not curves:
            return [29970, 2997]
        longest = max([0.0] + [curve.keys[-1][0] for curve in curves if curve.keys])
        if self.scene.time_unit == CUSTOM_RATE:
            scale = truncated(self.rate()[0] * 1000.0, 0, 2**32 - 1)
        else:
            scale = TIMES[self.scene.time_unit][2]
        return [truncated(((longest or 10.0) - self.offset) * 1000.0 + 0.5), scale]

    # Streams and keys.

    def acquire(self, layer, stream_id):
        stream = self.new("stream")
        self.suites.call("AcquireLayerStream", STREAM7, pluginId=PLUGIN, layer=layer, streamId=stream_id,
                         stream=stream)
        return stream

    def release(self, stream):
        self.suites.call("ReleaseStream", STREAM7, stream=stream)

    def set_stream(self, layer, stream_id, *value):
        stream = self.acquire(layer, stream_id)
        self.suites.call("SetStreamValue", STREAM8, pluginId=PLUGIN, stream=stream,
                         value=list(value) + [0.0] * (4 - len(value)))
        self.release(stream)

    def begin(self, stream):
        batch = self.new("batch")
        self.suites.call("BeginKeyframeBatch", KEYS3, stream=stream, batch=batch)
        return batch

    def start(self, layer, stream_id):
        stream = self.acquire(layer, stream_id)
        batch = self.begin(stream)
        self.release(stream)
        return batch

    def add(self, batch, stream, index, time, value):
        self.suites.call("AddBatchKeyframe", KEYS3, batch=batch, timeMode=0, time=time, index=index)
        self.suites.call("SetBatchKeyframeValue", KEYS4, batch=batch, index=index, stream=stream,
                         value=list(value) + [0.0] * (4 - len(value)))

    def insert(self, batch, layer, stream_id, index, time, *value):
        stream = self.acquire(layer, stream_id)
        self.add(batch, stream, index, time, value)
        self.release(stream)

    def end(self, batch):
        self.suites.call("EndKeyframeBatch", KEYS3, commit=1, batch=batch)

    # Sampling.

    def curves_of(self, node):
        curves = [self.scene.lists["curve"][index] for index in node.curve[:9] if index >= 0]
        return [curve for curve in curves if curve.keys]

    def key_count(self, node):
        counts = [len(curve.keys) for curve in self.curves_of(node) if len(curve.keys) >= 2]
        if len(set(counts)) > 1:
            raise ImportFailure(*KEY_COUNTS)
        return counts[0] if counts else 0

    def key_time(self, node, index):
        source = next(curve for curve in self.curves_of(node) if len(curve.keys) > index)
        return self.time(source.keys[index][0], index == 0)

    def sample(self, node, group, index, values):
        result = list(values)
        for axis in range(3):
            curve = node.curve[3 * group + axis]
            keys = self.scene.lists["curve"][curve].keys if curve >= 0 else None
            if keys:
                result[axis] = keys[0 if len(keys) == 1 else index][1]
        return result

    # Transforms.

    def parts(self, node, translate, rotate, scale):
        to_radians = math.pi / 180.0
        matrix, turn = Affine(), [self.degrees(angle) for angle in rotate]
        spin, stretch = self.flipped(node.rotate_pivot), self.flipped(node.scale_pivot)
        matrix.translate(*(-part for part in stretch))
        matrix.scale(*scale)
        matrix.translate(*stretch)
        matrix.translate(*(-part for part in spin))
        for axis, sign in enumerate((1.0, -1.0, -1.0)):
            matrix.rotate(axis, turn[axis] * sign * to_radians)
        matrix.translate(*spin)
        matrix.translate(*self.flipped(translate))
        return matrix.decompose()

    def set_transform(self, layer, node):
        position, scale, angles = self.parts(node, node.translate, node.rotate, node.scale)
        self.set_stream(layer, ANCHOR, 0.0, 0.0, 0.0)
        self.set_stream(layer, SCALE, *(factor * 100.0 for factor in scale))
        for stream_id, angle in zip((X_TURN, Y_TURN, Z_TURN), angles):
            self.set_stream(layer, stream_id, math.degrees(angle))
        self.set_stream(layer, POSITION, *position)

    def animate_transform(self, layer, node):
        count = self.key_count(node)
        if count < 1:
            return
        order = (SCALE, X_TURN, Y_TURN, Z_TURN, POSITION)
        batches = [self.start(layer, stream_id) for stream_id in order]
        previous = None
        for index in range(count):
            time = self.key_time(node, index)
            scale = self.sample(node, 2, index, node.scale)
            rotate = self.sample(node, 1, index, node.rotate)
            translate = self.sample(node, 0, index, node.translate)
            position, scale, angles = self.parts(node, translate, rotate, scale)
            if previous is not None:
                angles = [self.unwrapped(angle, before) for angle, before in zip(angles, previous)]
            previous = angles
            values = [[factor * 100.0 for factor in scale]] + [[math.degrees(a)] for a in angles] + [position]
            for batch, stream_id, value in zip(batches, order, values):
                self.insert(batch, layer, stream_id, index, time, *value)
        for batch in batches:
            self.end(batch)

    @staticmethod
    def unwrapped(angle, before):
        while angle - before >= math.pi:
            angle -= 2.0 * math.pi
        while angle - before <= -math.pi:
            angle += 2.0 * math.pi
        return angle

    # Cameras.

    def zoom(self, camera, focal_length):
        scene = self.scene
        size = float(scene.height) if camera.vertical_fit else scene.width * scene.pixel_aspect
        return size * (focal_length * 72.0 / 25.4) / (camera.aperture[int(camera.vertical_fit)] * 72.0)

    def set_camera(self, layer, camera):
        self.suites.call("SetLayerFlag", LAYER, layer=layer, flag=FLAG_AIMED, value=0)
        self.set_stream(layer, POSITION, 0.0, 0.0, 0.0)
        self.suites.call("SetCameraFilmSize", CAMERA, layer=layer, direction=2 if camera.vertical_fit else 1,
                         filmSize=camera.aperture[int(camera.vertical_fit)] * 72.0)
        self.set_stream(layer, ZOOM, self.zoom(camera, camera.focal_length))
        node = self.find(camera.parent)
        if node:
            self.set_transform(layer, node)

    def animate_camera(self, layer, camera):
        keys = self.scene.lists["curve"][camera.focal_curve].keys if camera.focal_curve >= 0 else None
        if keys:
            stream = self.acquire(layer, ZOOM)
            self.suites.call("GetStreamKeyframeCount", KEYS3, stream=stream, count=0)
            batch = self.begin(stream)
            for index, (time, value) in enumerate(keys):
                self.add(batch, stream, index, self.time(time, index == 0), [self.zoom(camera, value)])
            self.end(batch)
            self.release(stream)
        node = self.find(camera.parent)
        if node:
            self.animate_transform(layer, node)

    def aim(self, layer, camera):
        for constraint in self.transforms:
            links = constraint.curve
            if min(links[FOLLOWS], links[TARGET], links[TURNS]) < 0:
                continue
            if self.transforms[links[TURNS]].name.lower() != camera.parent.lower():
                continue
            target = self.transforms[links[TARGET]]
            self.suites.call("SetLayerFlag", LAYER, layer=layer, flag=FLAG_AIMED, value=1)
            self.set_stream(layer, ANCHOR, *self.flipped(target.translate))
            count = self.key_count(target)
            if count:
                batch = self.start(layer, ANCHOR)
                for index in range(count):
                    time = self.key_time(target, index)
                    point = self.flipped(self.sample(target, 0, index, target.translate))
                    self.insert(batch, layer, ANCHOR, index, time, *point)
                self.end(batch)
            return

    # Layers and compositions.

    def null_layer(self, name, comp):
        layer = self.new("layer")
        self.suites.call("NewNullLayer", COMP9, name=shown(name), comp=comp, time=[0, 0], layer=layer)
        self.suites.call("SetLayerFlag", LAYER, layer=layer, flag=FLAG_3D, value=1)
        return layer

    def place(self, layer, node):
        self.set_transform(layer, node)
        self.animate_transform(layer, node)

    def chain(self, child, node, comp):
        used = []
        while node is not None:
            used.append(node)
            name = node.parent
            node = self.find(name) if name else None
            if not name or any(node is known for known in used):
                return
            layer = self.null_layer(name, comp)
            self.suites.call("SetLayerParent", LAYER, layer=child, parent=layer)
            if node:
                self.place(layer, node)
            child = layer

    def camera_layer(self, comp, camera):
        layer = self.new("layer")
        self.suites.call("NewCameraLayer", COMP9, name=shown(camera.name), comp=comp, center=[CENTRE, CENTRE],
                         layer=layer)
        self.set_camera(layer, camera)
        self.animate_camera(layer, camera)
        self.chain(layer, self.find(camera.parent), comp)
        self.aim(layer, camera)

    def locator_layer(self, comp, locator):
        if not any(mark in locator.name for mark in (b"null", b"NULL", b"Null")):
            return
        layer, node = self.null_layer(locator.name, comp), self.find(locator.parent)
        if node:
            self.place(layer, node)
        self.chain(layer, node, comp)

    def create_comp(self, name, width, aspect, duration, rate):
        comp = self.new("comp")
        self.suites.call("CreateComp", COMP21, folder="item:1", name=name, width=width,
                         height=self.scene.height, pixelAspect=aspect, duration=duration, frameRate=rate,
                         comp=comp)
        return comp

    def build(self, name):
        scene = self.scene
        if not scene.lists["camera"]:
            return
        duration = self.duration()
        aspect = [1000, 1000]
        if abs(scene.pixel_aspect - 1.0) >= 0.01:
            aspect = [truncated(scene.pixel_aspect * 1000.0), 1000]
        rate = [truncated(scene.frame_rate * 1000.0), 1000]
        if scene.time_unit != CUSTOM_RATE:
            rate = [TIMES[scene.time_unit][3], 1]
        if aspect[0] == aspect[1]:
            comp = self.create_comp(name, scene.width, aspect, duration, rate)
        else:
            width = truncated(float(scene.width) * aspect[0] / aspect[1] + 0.5)
            comp = self.create_comp("Square " + name, width, [1, 1], duration, rate)
            display = self.create_comp(name, scene.width, aspect, duration, rate)
            self.suites.call("GetItemFromComp", COMP9, comp=comp, item="item:2")
            self.suites.call("AddLayerFromItem", LAYER, item="item:2", comp=display, layer=self.new("layer"))
        for camera in scene.lists["camera"]:
            if not camera.orthographic and camera.name.lower() != b"perspshape":
                self.camera_layer(comp, camera)
        for locator in scene.lists["locator"]:
            self.locator_layer(comp, locator)


def shown(name):
    """UTF-8 text in which each byte that is none stands as U+FFFD."""
    text = name.decode("utf-8", "surrogateescape")
    return "".join("\ufffd" if "\udc80" <= letter <= "\udcff" else letter for letter in text)


def load_lines(linear_units):
    """What the entry calls."""
    lines = [{"call": "enter", "callback": "GPMain_MayaImport"}]
    suites = Suites(lines)
    suites.call("GetAppPrefsBlob", STORE, store="store:1")
    suites.call("GetPrefLong", STORE, store="store:1", section="Maya Camera", key="Use Linear Units",
                default=0, value=int(linear_units))
    suites.call("RegisterDeathHook", REGISTER, pluginId=PLUGIN, refcon=0)
    suites.call("RegisterImporterName", MANAGER, name="Maya Scene", importer="importer:1")
    suites.call("RegisterImporterTypes", MANAGER, importer="importer:1",
                types=[{"type": "MAYA", "creator": "MaYa"}], extensions=[".ma"])
    suites.call("RegisterImporterCallbacks", MANAGER, importer="importer:1", count=2)
    suites.release()
    return lines + [{"call": "leave", "callback": "GPMain_MayaImport", "error": 0}]


def import_lines(path, text, linear_units):
    """What the import of a scene that passes the header test calls."""
    lines = [{"call": "enter", "callback": "ImportFileCallback", "path": path, "folder": "item:1"}]
    driver, parser = Suites(lines), Suites(lines)
    driver.call("NewMemHandle", MEMORY, pluginId=PLUGIN, name="file buffer", size=len(text) + 2, flags=0,
                handle="mem:1")
    driver.call("LockMemHandle", MEMORY, handle="mem:1")
    code = 0
    try:
        scene = SceneText(text)
        scene.read()
        Builder(scene, parser, linear_units).build(os.path.splitext(os.path.basename(path))[0])
    except ImportFailure as failure:
        code = failure.code
        if failure.message:
            parser.call("ShowMessage", UTILITY, pluginId=PLUGIN, text=failure.message)
    parser.release()
    driver.call("UnlockMemHandle", MEMORY, handle="mem:1")
    driver.call("FreeMemHandle", MEMORY, handle="mem:1")
    driver.release()
    return lines + [{"call": "leave", "callback": "ImportFileCallback", "error": code}]


def whole_trace(path, text, linear_units=False):
    """The trace of a run of the tool that imports one scene."""
    unload = [{"call": "enter", "callback": "DeathHook"}, {"call": "leave", "callback": "DeathHook", "error": 0}]
    return load_lines(linear_units) + import_lines(path, text, linear_units) + unload

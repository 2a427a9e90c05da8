"""The JSON of `mayascene import`, as plain objects.

A frame is one of the scene's own frame numbers, as a float. Positions and
rotations stay as the composition has them; channels.py turns them.
"""

import bisect
from fractions import Fraction

FORMAT = "mayascene-composition"
VERSION = 1

MILLIMETRES_PER_POINT = 25.4 / 72.0


class NotAComposition(ValueError):
    """The text is not a composition, or one of another version."""


class Stream:
    """A property of a layer: a value, or keys with straight lines between."""

    def __init__(self, value, frames=None, values=None):
        self.frames = frames
        self.values = [value] if frames is None else values

    @property
    def moves(self):
        return any(value != self.values[0] for value in self.values)

    def at(self, frame):
        if self.frames is None:
            return self.values[0]
        after = bisect.bisect_right(self.frames, frame)
        if after == 0:
            return self.values[0]
        if after == len(self.frames):
            return self.values[-1]
        start = self.frames[after - 1]
        part = (frame - start) / (self.frames[after] - start)
        pairs = zip(self.values[after - 1], self.values[after])
        return [before + part * (then - before) for before, then in pairs]


class Layer:
    """A camera or a null. `parent` is a Layer or None."""

    def __init__(self, name, is_camera, aimed, film, streams):
        self.name = name
        self.is_camera = is_camera
        self.aimed = aimed
        self.film = film  # (is vertical, millimetres), or None
        self.streams = streams
        self.parent = None

    def chain(self):
        """The layer and those above it. A circle of parents ends."""
        found = []
        layer = self
        while layer is not None and layer not in found:
            found.append(layer)
            layer = layer.parent
        return found


class Picture:
    """A composition that holds cameras and nulls, with its picture size.

    Of two nested compositions the layers are those of the inner one, which
    has square pixels; size and pixel aspect are those of the outer one.
    """

    def __init__(self, name, size, pixel_aspect, rate):
        self.name = name
        self.width, self.height = size
        self.pixel_aspect = pixel_aspect  # a Fraction, width to height
        self.rate = rate  # a Fraction, frames per second
        self.layers = []
        self.first_frame = 0.0
        self.last_frame = 0.0

    @property
    def square_width(self):
        """How many square pixels are as wide as the picture."""
        return self.width * float(self.pixel_aspect)


class Scene:
    def __init__(self, path, outcome, complaints, linear_unit, pictures):
        self.path = path
        self.outcome = outcome
        self.complaints = complaints
        self.linear_unit = linear_unit  # "cm" and so on, or None
        self.pictures = pictures


def frame_at(time, rate, first_frame):
    """The frame of a time. A tick next to a whole frame is that frame."""
    ticks, scale = time
    frame = Fraction(ticks, scale) * rate
    if abs(frame - round(frame)) <= rate / scale:
        frame = Fraction(round(frame))
    return first_frame + float(frame)


def _stream(item, rate, first_frame):
    value = [float(number) for number in item["value"]]
    keys = item["keys"]
    if keys is None:
        return Stream(value)
    frames = [frame_at(time, rate, first_frame) for time in keys["times"]]
    values = [[float(number) for number in row] for row in keys["values"]]
    return Stream(value, frames, values)


def _film(item):
    film = item["filmSize"]
    if film is None:
        return None
    millimetres = film["points"] * MILLIMETRES_PER_POINT
    return film["direction"] == "vertical", millimetres


def _layers(items, rate, first_frame):
    made = {}
    for item in items:
        if item["kind"] == "composition":
            continue
        streams = {stream["name"]: _stream(stream, rate, first_frame)
                   for stream in item["streams"]}
        made[item["number"]] = Layer(item["name"], item["kind"] == "camera",
                                     item["aimed"], _film(item), streams)
    for item in items:
        if item["number"] in made:
            made[item["number"]].parent = made.get(item["parent"])
    return list(made.values())


def _span(picture, duration, first_frame):
    """From the first to the last key; without keys the duration."""
    keyed = [frame for layer in picture.layers
             for stream in layer.streams.values() if stream.frames
             for frame in (stream.frames[0], stream.frames[-1])]
    if keyed:
        return min(keyed), max(keyed)
    return first_frame, frame_at(duration, picture.rate, first_frame)


def _picture(inner, outer, scene):
    rate = Fraction(*inner["frameRate"])
    first = float(scene.get("firstFrame") or 0.0)
    picture = Picture(outer["name"], (outer["width"], outer["height"]),
                      Fraction(*outer["pixelAspect"]), rate)
    picture.layers = _layers(inner["layers"], rate, first)
    span = _span(picture, inner["duration"], first)
    picture.first_frame, picture.last_frame = span
    if scene.get("lastFrame") is not None:
        picture.last_frame = float(scene["lastFrame"])
    return picture


def _scene(scene):
    compositions = scene["compositions"]
    outer_of = {layer["source"]: composition
                for composition in compositions
                for layer in composition["layers"]
                if layer["kind"] == "composition"}
    pictures = [
        _picture(item, outer_of.get(item["number"], item), scene)
        for item in compositions
        if any(layer["kind"] != "composition" for layer in item["layers"])]
    complaints = list(scene["messages"]) + list(scene["refusals"])
    error = scene["error"]
    if error is not None:
        where = "" if error["line"] is None else f", line {error['line']}"
        meaning = error["meaning"] or f"error {error['code']}"
        complaints.append(f"{meaning}{where}")
    outcome = scene["outcome"]
    if outcome == "imported" and not pictures:
        outcome = "nothing"  # a composition of a default camera has no layers
    return Scene(scene["path"], outcome, complaints,
                 scene.get("linearUnit"), pictures)


def reasons(complaints, remarks):
    """Why a scene does not come over: the complaints of the document, and
    errors that are not among them."""
    said = [text for kind, text in remarks if kind == "error"
            and not any(complaint in text for complaint in complaints)]
    return complaints + said


def read(document):
    """The scenes of a document that json.loads() gave."""
    if not isinstance(document, dict) or document.get("format") != FORMAT:
        raise NotAComposition(f"this is not a {FORMAT}")
    if document.get("version") != VERSION:
        raise NotAComposition(
            f"this is {FORMAT} of version {document.get('version')}; "
            f"the add-on reads version {VERSION}")
    return [_scene(scene) for scene in document["scenes"]]

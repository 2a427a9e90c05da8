"""Documents for the tests, in the form of docs/composition-json.md."""

_UNITS = {"scale": "percent", "zoom": "pixels", "xRotation": "degrees",
          "yRotation": "degrees", "zRotation": "degrees"}

_DEFAULTS = {"position": [0, 0, 0], "scale": [100, 100, 100],
             "zRotation": [0], "xRotation": [0], "yRotation": [0]}


def stream(name, value, keys=None):
    """`keys` is {frame: value} at 24 frames a second."""
    columns = None
    if keys is not None:
        columns = {"times": [[1000 * frame, 24000] for frame in keys],
                   "values": list(keys.values())}
    return {"id": 0, "name": name, "unit": _UNITS.get(name, "points"),
            "value": value, "keys": columns}


def layer(number, kind, name, parent=None, aimed=False, film=None,
          source=None, **streams):
    """A stream is a value, or {frame: value}."""
    values = dict(_DEFAULTS)
    if kind == "camera":
        values.update(pointOfInterest=[0, 0, 0], zoom=[1920])
    values.update(streams)
    made = []
    for stream_name, value in values.items():
        if isinstance(value, dict):
            made.append(stream(stream_name, [0] * 3, value))
        else:
            made.append(stream(stream_name, value))
    return {"number": number, "kind": kind, "name": name, "parent": parent,
            "source": source, "threeDimensional": True, "aimed": aimed,
            "filmSize": film, "streams": made}


def composition(number, layers, size=(1920, 1080), aspect=(1, 1),
                rate=(24, 1), name="shot"):
    return {"number": number, "name": name, "width": size[0],
            "height": size[1], "pixelAspect": list(aspect),
            "frameRate": list(rate), "duration": [48000, 24000],
            "layers": layers}


def document(*compositions, **scene):
    callback = {"error": None, "messages": [], "refusals": [],
                "leftovers": []}
    return {"format": "mayascene-composition", "version": 1, "linearUnits": 0,
            "scenes": [dict(callback, path="shot.ma", outcome="imported",
                            status=0, compositions=list(compositions),
                            **scene)],
            "entry": callback, "deathHook": callback}

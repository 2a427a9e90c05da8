"""What Blender's render settings are for a picture."""

import math
from collections import namedtuple

Settings = namedtuple("Settings", "fps fps_base aspect_x aspect_y start end")

_MOST_FPS = 32767

# The names that a scene may write.
METRES = {"mm": 0.001, "millimeter": 0.001, "cm": 0.01, "centimeter": 0.01,
          "m": 1.0, "meter": 1.0, "km": 1000.0, "kilometer": 1000.0,
          "in": 0.0254, "inch": 0.0254, "ft": 0.3048, "foot": 0.3048,
          "yd": 0.9144, "yard": 0.9144, "mi": 1609.344, "mile": 1609.344}


def metres_per_unit(linear_unit):
    """None for an unknown unit."""
    return METRES.get(linear_unit)


def settings_of(picture):
    """Blender holds a rate as a whole number over a base, and no side of a
    pixel below 1."""
    rate = float(picture.rate)
    fps = min(max(math.ceil(rate - 1e-9), 1), _MOST_FPS)
    aspect = float(picture.pixel_aspect)
    return Settings(fps, fps / rate, max(aspect, 1.0), max(1.0 / aspect, 1.0),
                    math.floor(picture.first_frame),
                    math.ceil(picture.last_frame))

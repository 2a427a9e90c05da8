"""Sensor and focal length of a camera, from its zoom and its film."""

from collections import namedtuple

from .channels import track

# `fit` is Blender's word for the side of the picture that the sensor fits.
Lens = namedtuple("Lens", "fit sensor_width sensor_height track")

# Millimetres, where the scene says nothing.
_USUAL_FILM = (False, 36.0)

# Blender takes neither a sensor nor a focal length below this.
_SMALLEST = 1.0


def lens_of(layer, picture):
    """The lens that shows what the zoom shows.

    Sensor and focal length together are made larger where one of them is
    smaller than Blender takes; the picture stays.
    """
    vertical, film = layer.film or _USUAL_FILM
    shape = picture.square_width / picture.height
    width = film * shape if vertical else film
    zooms = [value[0] for value in layer.streams["zoom"].values]
    focals = [zoom * width / picture.square_width for zoom in zooms]
    smallest = min([width, width / shape]
                   + [focal for focal in focals if focal > 0.0])
    larger = max(1.0, _SMALLEST / smallest)
    return Lens("VERTICAL" if vertical else "HORIZONTAL", width * larger,
                width / shape * larger,
                track("lens", 0, layer.streams["zoom"].frames,
                      [focal * larger for focal in focals]))

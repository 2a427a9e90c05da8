"""Sensor and focal length show what the zoom shows."""

import math
import unittest

import addon  # noqa: F401
import compositions
from plain import document, lens


def lens_of(size=(1920, 1080), aspect=(1, 1), **camera):
    read = document.read(compositions.document(compositions.composition(
        1, [compositions.layer(1, "camera", "eye", **camera)], size=size,
        aspect=aspect)))
    picture = read[0].pictures[0]
    return lens.lens_of(picture.layers[0], picture)


class Lenses(unittest.TestCase):
    def test_a_horizontal_film_fits_the_width(self):
        made = lens_of(zoom=[3840],
                       film={"direction": "horizontal", "points": 72})
        self.assertEqual(made.fit, "HORIZONTAL")
        self.assertAlmostEqual(made.sensor_width, 25.4)
        self.assertAlmostEqual(made.sensor_height, 25.4 * 9 / 16)
        self.assertAlmostEqual(made.track.values[0], 50.8)

    def test_a_vertical_film_fits_the_height(self):
        made = lens_of(zoom=[1080],
                       film={"direction": "vertical", "points": 72})
        self.assertEqual(made.fit, "VERTICAL")
        self.assertAlmostEqual(made.sensor_height, 25.4)
        self.assertAlmostEqual(made.track.values[0], 25.4)

    def test_wide_pixels_make_the_picture_wider(self):
        made = lens_of(size=(960, 1080), aspect=(2, 1), zoom=[1920],
                       film={"direction": "horizontal", "points": 72})
        self.assertAlmostEqual(made.track.values[0], 25.4)
        self.assertAlmostEqual(made.sensor_height, 25.4 * 9 / 16)

    def test_an_animated_zoom_is_an_animated_lens(self):
        made = lens_of(zoom={0: [1920], 10: [960]})
        self.assertEqual(made.track.frames, [0.0, 10.0])
        self.assertEqual([round(value, 9) for value in made.track.values],
                         [36.0, 18.0])

    def test_what_is_too_small_grows_and_shows_the_same(self):
        made = lens_of(zoom={0: [1920], 1: [19.2]},
                       film={"direction": "horizontal", "points": 10})
        self.assertGreaterEqual(min(made.track.values), 1.0)
        self.assertGreaterEqual(made.sensor_height, 1.0)
        half = math.atan(made.sensor_width / 2 / made.track.values[1])
        self.assertAlmostEqual(half, math.atan(960 / 19.2))


if __name__ == "__main__":
    unittest.main()

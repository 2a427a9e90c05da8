"""A composition's JSON, read."""

import unittest
from fractions import Fraction

import addon  # noqa: F401
import compositions
from plain import document, names, scene_settings


def picture_of(*items, **scene):
    read = document.read(compositions.document(*items, **scene))
    return read[0].pictures[0]


class Documents(unittest.TestCase):
    def test_another_form_is_refused(self):
        for wrong in ([], {}, {"format": "mayascene-check"}):
            with self.assertRaises(document.NotAComposition):
                document.read(wrong)

    def test_another_version_is_refused_by_its_number(self):
        later = compositions.document()
        later["version"] = 2
        with self.assertRaisesRegex(document.NotAComposition, "version 2"):
            document.read(later)

    def test_unknown_members_are_passed_over(self):
        later = compositions.document(unheard="of")
        self.assertEqual(document.read(later)[0].pictures, [])

    def test_a_composition_without_layers_is_nothing(self):
        for made in ([], [compositions.composition(1, [])]):
            read = document.read(compositions.document(*made))[0]
            self.assertEqual((read.outcome, read.pictures), ("nothing", []))
        full = document.read(compositions.document(compositions.composition(
            1, [compositions.layer(1, "null", "head")])))[0]
        self.assertEqual(full.outcome, "imported")

    def test_an_error_is_a_complaint_with_its_line(self):
        failed = compositions.document()
        failed["scenes"][0]["error"] = {"code": 7, "name": "", "meaning": "",
                                        "line": 12}
        failed["scenes"][0]["messages"] = ["Error reading Maya file."]
        self.assertEqual(document.read(failed)[0].complaints,
                         ["Error reading Maya file.", "error 7, line 12"])

    def test_a_reason_that_is_said_twice_is_given_once(self):
        remarks = [("error", "mayascene: a.ma: message: no keys"),
                   ("error", "mayascene: a.ma: left behind: a file"),
                   ("warning", "the film offset is lost")]
        self.assertEqual(
            document.reasons(["no keys"], remarks),
            ["no keys", "mayascene: a.ma: left behind: a file"])

    def test_a_parent_may_stand_after_its_child(self):
        camera, null = picture_of(compositions.composition(1, [
            compositions.layer(5, "camera", "eye", parent=7),
            compositions.layer(7, "null", "head")])).layers
        self.assertIs(camera.parent, null)
        self.assertIsNone(null.parent)

    def test_a_circle_of_parents_ends(self):
        one, other = picture_of(compositions.composition(1, [
            compositions.layer(1, "null", "a", parent=2),
            compositions.layer(2, "null", "b", parent=1)])).layers
        self.assertEqual(one.chain(), [one, other])

    def test_the_inner_of_two_compositions_has_the_outer_ones_picture(self):
        picture = picture_of(
            compositions.composition(
                1, [compositions.layer(1, "camera", "eye")],
                size=(1440, 576), name="Square shot"),
            compositions.composition(
                2, [compositions.layer(2, "composition", "in", source=1)],
                size=(720, 576), aspect=(2000, 1000)))
        self.assertEqual((picture.name, picture.width, picture.height,
                          picture.pixel_aspect, picture.square_width),
                         ("shot", 720, 576, Fraction(2), 1440.0))
        self.assertEqual([layer.name for layer in picture.layers], ["eye"])


class Frames(unittest.TestCase):
    def test_they_are_the_scenes_own(self):
        picture = picture_of(compositions.composition(1, [
            compositions.layer(1, "null", "n", xRotation={0: [1], 3: [2]}),
        ]), firstFrame=101, lastFrame=107)
        self.assertEqual(picture.layers[0].streams["xRotation"].frames,
                         [101.0, 104.0])
        self.assertEqual((picture.first_frame, picture.last_frame),
                         (101.0, 107.0))

    def test_without_them_they_count_from_0_to_the_last_key(self):
        picture = picture_of(compositions.composition(1, [
            compositions.layer(1, "null", "n", xRotation={2: [1], 9: [2]}),
        ]))
        self.assertEqual((picture.first_frame, picture.last_frame),
                         (2.0, 9.0))

    def test_a_tick_beside_a_frame_is_the_frame(self):
        rate = Fraction(2997, 100)
        self.assertEqual(document.frame_at([334, 10000], rate, 0.0), 1.0)
        self.assertEqual(document.frame_at([500, 10000], Fraction(30), 10.0),
                         11.5)

    def test_values_lie_straight_between_keys_and_level_outside(self):
        stream = document.Stream([9.0], [10.0, 14.0], [[1.0], [3.0]])
        self.assertEqual([stream.at(frame)[0] for frame in (0, 11, 13, 99)],
                         [1.0, 1.5, 2.5, 3.0])


class Settings(unittest.TestCase):
    def settings(self, rate, aspect):
        return scene_settings.settings_of(document.Picture(
            "p", (10, 10), Fraction(*aspect), Fraction(*rate)))

    def test_a_rate_is_a_whole_number_over_a_base(self):
        for rate in ((24, 1), (2997, 100), (24000, 1001), (1, 2), (80000, 1)):
            made = self.settings(rate, (1, 1))
            self.assertEqual(made.fps, int(made.fps))
            self.assertAlmostEqual(made.fps / made.fps_base,
                                   rate[0] / rate[1], places=9)
            self.assertTrue(1 <= made.fps <= 32767, rate)

    def test_a_pixel_has_no_side_below_1(self):
        wide = self.settings((24, 1), (2, 1))
        high = self.settings((24, 1), (1, 2))
        self.assertEqual((wide.aspect_x, wide.aspect_y), (2.0, 1.0))
        self.assertEqual((high.aspect_x, high.aspect_y), (1.0, 2.0))

    def test_a_unit_of_unknown_length_has_no_metres(self):
        self.assertEqual(scene_settings.metres_per_unit("cm"), 0.01)
        self.assertEqual(scene_settings.metres_per_unit("ft"), 0.3048)
        for unknown in (None, "", "parsec"):
            self.assertIsNone(scene_settings.metres_per_unit(unknown))


class Keys(unittest.TestCase):
    def test_each_layer_has_its_own_and_keeps_it(self):
        twice = picture_of(compositions.composition(1, [
            compositions.layer(1, "camera", "eye", parent=2),
            compositions.layer(2, "null", "rig"),
            compositions.layer(3, "camera", "eye", parent=4),
            compositions.layer(4, "null", "rig"),
            compositions.layer(5, "null", "eye"),
            compositions.layer(6, "camera", "rig/eye")]))
        keys = names.keys_of(twice.layers)
        self.assertEqual(keys[0], "camera:rig/eye#1")
        self.assertEqual(keys[2], "camera:rig/eye#2")
        self.assertEqual(len(set(keys)), len(keys))
        self.assertEqual(names.keys_of(twice.layers[:3]), keys[:3])


if __name__ == "__main__":
    unittest.main()

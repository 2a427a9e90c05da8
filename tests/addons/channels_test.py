"""Layers of a composition as tracks in the scene's axes."""

import math
import random
import unittest

import addon  # noqa: F401
import compositions
from plain import channels, document, matrices


def layers_of(*items):
    read = document.read(compositions.document(
        compositions.composition(1, list(items))))
    return read[0].pictures[0].layers


def layer_of(**streams):
    return layers_of(compositions.layer(1, "camera", "eye", **streams))[0]


def values_of(layer, path, factor=1.0):
    return [track.values for track in channels.tracks(layer, factor)
            if track.path == path]


class Matrices(unittest.TestCase):
    def assert_same(self, one, other):
        for left, right in zip(one, other):
            for a, b in zip(left, right):
                self.assertAlmostEqual(a, b, places=9)

    def test_each_axis_turns_the_next_into_the_one_after(self):
        right = math.pi / 2
        for axis, (start, end) in enumerate(
                [((0, 1, 0), (0, 0, 1)), ((0, 0, 1), (1, 0, 0)),
                 ((1, 0, 0), (0, 1, 0))]):
            angles = [0.0, 0.0, 0.0]
            angles[axis] = right
            turned = matrices.applied(matrices.rotation(*angles), start)
            self.assertLess(math.dist(turned, end), 1e-12)

    def test_x_turns_first_and_z_last(self):
        right = math.pi / 2
        turned = matrices.applied(matrices.rotation(right, 0.0, right),
                                  (0.0, 1.0, 0.0))
        self.assertLess(math.dist(turned, (0.0, 0.0, 1.0)), 1e-12)

    def test_angles_give_their_rotation_back(self):
        source = random.Random(1)
        for _ in range(500):
            wanted = matrices.rotation(*(source.uniform(-9, 9)
                                         for _ in range(3)))
            self.assert_same(matrices.rotation(*matrices.angles(wanted)),
                             wanted)

    def test_angles_at_the_pole_give_their_rotation_back(self):
        for y in (math.pi / 2, -math.pi / 2):
            wanted = matrices.rotation(0.3, y, 1.1)
            found = matrices.angles(wanted, (5.0, 5.0, 5.0))
            self.assert_same(matrices.rotation(*found), wanted)

    def test_angles_follow_those_before(self):
        before = (0.0, 0.0, 0.0)
        for step in range(200):
            wanted = (0.11 * step, 0.07 * step, -0.05 * step)
            before = matrices.angles(matrices.rotation(*wanted), before)
            self.assertLess(math.dist(before, wanted), 1e-9)

    def test_a_camera_looks_along_the_direction_and_stays_level(self):
        looks = matrices.towards((3.0, 4.0, -12.0))
        ahead = matrices.applied(looks, (0.0, 0.0, -1.0))
        self.assertLess(math.dist(ahead, (3 / 13, 4 / 13, -12 / 13)), 1e-12)
        self.assertEqual(looks[1][0], 0.0)
        self.assertGreater(looks[1][1], 0.0)

    def test_straight_up_and_nowhere_have_an_answer(self):
        up = matrices.towards((0.0, 2.0, 0.0))
        self.assertEqual(matrices.applied(up, (0.0, 0.0, -1.0)),
                         (0.0, 1.0, 0.0))
        self.assertEqual(matrices.towards((0.0, 0.0, 0.0)),
                         matrices.IDENTITY)


class Tracks(unittest.TestCase):
    def test_y_and_z_change_their_signs(self):
        layer = layer_of(position=[1, 2, 3], xRotation=[10], yRotation=[20],
                         zRotation=[30], scale=[100, 200, 50])
        self.assertEqual(values_of(layer, "location"), [[1], [-2], [-3]])
        self.assertEqual([round(math.degrees(value[0]), 9) for value in
                          values_of(layer, "rotation_euler")],
                         [10.0, -20.0, -30.0])
        self.assertEqual(values_of(layer, "scale"), [[1.0], [2.0], [0.5]])

    def test_the_factor_is_for_lengths_alone(self):
        layer = layer_of(position=[100, 0, 0], xRotation=[90])
        self.assertEqual(values_of(layer, "location", 0.01)[0], [1.0])
        self.assertEqual(values_of(layer, "scale", 0.01)[0], [1.0])

    def test_what_stays_has_no_frames(self):
        layer = layer_of(position={0: [1, 7, 0], 5: [2, 7, 0]})
        tracks = channels.tracks(layer, 1.0)
        self.assertEqual(tracks[0].frames, [0.0, 5.0])
        self.assertEqual(tracks[0].values, [1.0, 2.0])
        self.assertEqual([track.frames for track in tracks[1:]], [None] * 8)
        self.assertEqual(tracks[1].values, [-7.0])

    def test_keys_stand_over_the_value(self):
        layer = layer_of(zRotation={0: [90], 5: [90]})
        self.assertEqual(values_of(layer, "rotation_euler")[2],
                         [-math.pi / 2])

    def test_an_aimed_camera_has_a_rotation_at_each_frame(self):
        layer = layer_of(aimed=True, zRotation=[15],
                         position={0: [0, 0, 0], 4: [40, 0, 0]},
                         pointOfInterest=[0, 10, 100])
        tracks = [track for track in channels.tracks(layer, 1.0)
                  if track.path == "rotation_euler"]
        self.assertEqual(tracks[1].frames, [0.0, 1.0, 2.0, 3.0, 4.0])
        for step in range(5):
            turn = matrices.rotation(
                *(track.values[step] for track in tracks))
            ahead = matrices.applied(turn, (0.0, 0.0, -1.0))
            wanted = matrices.unit((-10.0 * step, -10.0, -100.0))
            self.assertLess(math.dist(ahead, wanted), 1e-12)

    def test_keys_between_frames_are_kept(self):
        streams = [document.Stream([0], [1.0, 2.5, 3.25], [[0], [1], [2]])]
        self.assertEqual(channels.sampled_frames(streams),
                         [1.0, 2.0, 2.5, 3.0, 3.25])


class SlantedCameras(unittest.TestCase):
    def rig(self, scale, turn):
        return layers_of(
            compositions.layer(1, "camera", "eye", parent=2,
                               yRotation={0: [turn], 2: [2 * turn]},
                               position=[1, 2, 3]),
            compositions.layer(2, "null", "rig", scale=scale))[0]

    def test_an_even_scale_slants_nothing(self):
        self.assertFalse(channels.is_slanted(self.rig([200, 200, 200], 30)))

    def test_a_turn_under_an_uneven_scale_does(self):
        self.assertTrue(channels.is_slanted(self.rig([200, 100, 100], 30)))

    def test_an_uneven_scale_without_a_turn_does_not(self):
        self.assertFalse(channels.is_slanted(self.rig([200, 100, 100], 0)))

    def test_a_mirror_does(self):
        self.assertTrue(channels.is_slanted(self.rig([-100, 100, 100], 0)))

    def test_its_place_in_the_world_is_a_rotation_without_a_scale(self):
        tracks = channels.world_tracks(self.rig([200, 100, 50], 30), 0.5)
        self.assertEqual([track.values for track in tracks[:3]],
                         [[1.0], [-1.0], [-0.75]])
        self.assertEqual([track.values for track in tracks[6:]], [[1.0]] * 3)
        self.assertEqual(tracks[4].frames, [0.0, 1.0, 2.0])


if __name__ == "__main__":
    unittest.main()

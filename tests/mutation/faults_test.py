"""The faults with names still apply to the sources."""

import unittest
from collections import Counter

from campaign import ROOT
from faults import FAULTS
from named import FAILED, STAGES, chosen, row, stages_by
from workspace import OWN_TESTS, PROGRAMS


class Faults(unittest.TestCase):
    def test_the_text_that_each_replaces_stands_once_in_its_file(self):
        for fault in FAULTS:
            with self.subTest(fault.name):
                source = (ROOT / fault.file).read_text(encoding="utf-8")
                self.assertEqual(source.count(fault.old), 1)
                self.assertNotIn(fault.applied(source), ("", source))

    def test_no_two_are_the_same(self):
        self.assertGreaterEqual(len(FAULTS), 60)
        for of in (lambda fault: fault.name, lambda fault: (fault.file, fault.old, fault.new)):
            self.assertEqual([what for what, count in Counter(map(of, FAULTS)).items() if count > 1], [])

    def test_every_room_has_some_and_tests_of_its_own(self):
        self.assertEqual({fault.file.split("/")[0] for fault in FAULTS}, set(OWN_TESTS))


class Words(unittest.TestCase):
    def test_faults_are_chosen_by_words_of_their_names(self):
        self.assertEqual(chosen([]), list(FAULTS))
        self.assertEqual([fault.name for fault in chosen(["second NUL", "growth step is"])],
                         ["the growth step is ignored", "the second NUL is missing"])
        self.assertEqual(chosen(["no such words"]), [])

    def test_one_program_can_be_left_to_catch_all(self):
        self.assertIn("second_reader_test", PROGRAMS)
        (alone,) = stages_by("second_reader_test")
        for fault in FAULTS:
            self.assertEqual((alone.programs(fault.file), alone.targets(fault.file)), (("second_reader_test",),) * 2)
        self.assertEqual(stages_by(None), STAGES)

    def test_failing_tests_are_found_in_what_a_program_prints(self):
        text = ("[  FAILED  ] A.B (3 ms)\n[  FAILED  ] Shares/C.D/2, where GetParam() = 2 (0 ms)\n"
                "[  FAILED  ] 2 tests, listed below:\n[  FAILED  ] A.B\n x [  FAILED  ] E.F\n")
        self.assertEqual(FAILED.findall(text), ["A.B", "Shares/C.D/2", "A.B"])

    def test_a_row_names_the_first_tests_and_counts_the_others(self):
        fault = FAULTS[0]
        begin = f"| {fault.name} | "
        self.assertEqual(row(fault, {"p": ["A.B", "C.D"], "q": ["E", "F", "G", "H"]}),
                         begin + "p: A.B, C.D; q: E, F and 2 more |")
        self.assertEqual(row(fault, {}), begin + "**nothing** |")
        self.assertEqual(row(fault, None), begin + "**does not compile** |")


if __name__ == "__main__":
    unittest.main()

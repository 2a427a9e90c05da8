"""What counts as a difference between two traces."""

import unittest

from traces import compare


def trace(stream_id, value):
    return (
        b'{"call":"AcquireLayerStream","suite":"QZGP Stream Suite","version":7,"pluginId":1,"layer":"layer:1",'
        b'"streamId":%d,"stream":"stream:1","error":0}\n'
        b'{"call":"SetStreamValue","suite":"QZGP Stream Suite","version":8,"pluginId":1,"stream":"stream:1",'
        b'"value":%s,"error":0}\n' % (stream_id, value))


class Traces(unittest.TestCase):
    def assert_agree(self, ours, theirs):
        self.assertIsNone(compare(ours, theirs)[1])

    def assert_differ(self, ours, theirs, line=2):
        difference = compare(ours, theirs)[1]
        self.assertIsNotNone(difference)
        self.assertEqual(difference[0], line)

    def test_the_same_bytes_agree(self):
        tally, difference = compare(trace(1, b"[1.5,0,0,0]"), trace(1, b"[1.5,0,0,0]"))
        self.assertIsNone(difference)
        self.assertEqual((tally.traces, tally.same_bytes, tally.lines, tally.differing), (1, 1, 2, 0))

    def test_what_was_read_off_a_matrix_agrees_to_a_billionth_of_a_thousandth(self):
        for stream in (1, 2, 3, 8, 9):
            self.assert_agree(trace(stream, b"[600.0000000000001,2,0,0]"), trace(stream, b"[600,2,0,0]"))
            self.assert_differ(trace(stream, b"[600.000000001,2,0,0]"), trace(stream, b"[600,2,0,0]"))

    def test_differing_numbers_are_counted_and_the_worst_is_kept(self):
        tally, _ = compare(trace(1, b"[200.0000000000001,3,0,0]"), trace(1, b"[200,3,0,0]"))
        self.assertEqual((tally.same_bytes, tally.differing), (0, 1))
        self.assertAlmostEqual(tally.worst, 5e-16, delta=1e-16)

    def test_other_streams_agree_in_every_byte_or_not_at_all(self):
        for stream in (0, 11):
            self.assert_differ(trace(stream, b"[600.0000000000001,0,0,0]"), trace(stream, b"[600,0,0,0]"))
            self.assert_agree(trace(stream, b"[600,0,0,0]"), trace(stream, b"[600,0,0,0]"))

    def test_a_remainder_beside_a_large_number_is_measured_by_the_large_one(self):
        self.assert_agree(trace(1, b"[6000,1e-10,0,0]"), trace(1, b"[6000,-1e-10,0,0]"))
        self.assert_differ(trace(1, b"[6,1e-10,0,0]"), trace(1, b"[6,-1e-10,0,0]"))

    def test_nothing_is_measured_by_less_than_one(self):
        self.assert_agree(trace(3, b"[1e-15,0,0,0]"), trace(3, b"[0,0,0,0]"))
        self.assert_differ(trace(3, b"[2e-12,0,0,0]"), trace(3, b"[0,0,0,0]"))

    def test_a_number_that_json_does_not_have_agrees_with_itself_only(self):
        self.assert_agree(trace(1, b'["inf",1,0,0]'), trace(1, b'["inf",1,0,0]'))
        self.assert_differ(trace(1, b'["inf",1,0,0]'), trace(1, b'["nan",1,0,0]'))
        self.assert_differ(trace(1, b'["inf",1,0,0]'), trace(1, b"[1e308,1,0,0]"))
        self.assert_agree(trace(1, b'["-inf",199.99999999999997,0,0]'), trace(1, b'["-inf",200,0,0]'))

    def test_half_a_turn_and_minus_half_a_turn_differ(self):
        self.assert_differ(trace(8, b"[180,0,0,0]"), trace(8, b"[-180,0,0,0]"))

    def test_all_but_the_value_agrees_in_every_byte(self):
        ours = trace(1, b"[600,0,0,0]")
        self.assert_differ(ours, ours.replace(b'"error":0}\n{"call":"Set', b'"error":1}\n{"call":"Set'), line=1)
        self.assert_differ(ours, ours.replace(b"SetStreamValue", b"SetBatchValue"))
        self.assert_differ(ours, trace(1, b"[600,0,0]"))

    def test_a_line_too_many_is_a_difference(self):
        ours = trace(1, b"[600,0,0,0]")
        self.assert_differ(ours, ours + b"{}\n", line=3)
        self.assert_differ(ours + b"{}\n", ours, line=3)
        self.assert_differ(ours, b"", line=1)


if __name__ == "__main__":
    unittest.main()

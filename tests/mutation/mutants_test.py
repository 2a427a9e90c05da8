"""Which changes the mutation check makes to a source."""

import unittest

from campaign import ROOT, equivalents
from mutants import mutants_of


def changed(source):
    """Every mutated source, by kind."""
    return [(mutant.kind, mutant.applied(source)) for mutant in mutants_of("a.cpp", source)]


class Mutants(unittest.TestCase):
    def assert_changes(self, source, *expected):
        self.assertEqual(changed(source), list(expected))

    def test_a_comparison_takes_in_its_limit_or_loses_it(self):
        self.assert_changes("a < b", ("comparison", "a <= b"))
        self.assert_changes("a <= b", ("comparison", "a < b"))
        self.assert_changes("a >= b", ("comparison", "a > b"))
        self.assert_changes("a == b", ("comparison", "a != b"))

    def test_brackets_of_templates_are_no_comparison(self):
        self.assert_changes("static_cast<int>(a)")
        self.assert_changes("template <typename T> T Take(std::vector<T> from);")

    def test_pointers_and_references_are_no_arithmetic(self):
        self.assert_changes("const char* Take(const Text& from, Text&& other, char** at);")

    def test_arithmetic_is_turned_round(self):
        self.assert_changes("a + b", ("arithmetic", "a - b"))
        self.assert_changes("a * b", ("arithmetic", "a / b"))
        self.assert_changes("a -= b", ("arithmetic", "a += b"))
        self.assert_changes("f(-a)", ("arithmetic", "f(a)"))

    def test_logic_is_turned_round(self):
        self.assert_changes("a && !b", ("logic", "a || !b"), ("logic", "a && b"))

    def test_constants_become_their_neighbours(self):
        self.assert_changes("f(0)", ("constant", "f(1)"))
        self.assert_changes("f(0x1Fu)", ("constant", "f(32u)"))
        self.assert_changes("f(1'000)", ("constant", "f(1001)"))
        self.assert_changes("f(0.0)", ("constant", "f(1.0)"))
        self.assert_changes("f(0.25)", ("constant", "f(0.5)"))
        self.assert_changes("f(1e200)", ("constant", "f(2e+200)"))
        self.assert_changes("f(true)", ("constant", "f(false)"))

    def test_a_condition_is_negated_after_what_it_declares(self):
        self.assert_changes("if (f(a)) g();", ("condition", "if (!(f(a))) g();"))
        self.assert_changes("if (int b; f(b)) g();", ("condition", "if (int b;!(f(b))) g();"))
        self.assert_changes("while (a)", ("condition", "while (!(a))"))

    def test_a_condition_of_one_operator_is_not_turned_round_twice(self):
        self.assert_changes("if (a == b) f();", ("comparison", "if (a != b) f();"))
        self.assert_changes("if (!a) f();", ("logic", "if (a) f();"))

    def test_what_is_no_code_is_left_alone(self):
        self.assert_changes("// a < b\n/* a\n < 1 */ \"a < 1\" 'a' '\\'' R\"(a < 1)\"")
        self.assert_changes("#define LIMIT \\\n  1 + 2\n#include <array>\n")
        self.assert_changes("static_assert(sizeof(a) == 8);")
        self.assert_changes("[[gnu::target(1 < 2)]] void F();")
        self.assert_changes("if constexpr (N < 2) f();")

    def test_what_only_other_machines_compile_is_left_alone(self):
        self.assert_changes("#if A\nf(0);\n#else\ng(0);\n#endif\nh(0);",
                            ("constant", "#if A\nf(1);\n#else\ng(0);\n#endif\nh(0);"),
                            ("constant", "#if A\nf(0);\n#else\ng(0);\n#endif\nh(1);"))

    def test_a_mutant_knows_its_line(self):
        source = "int a;\n  int b = 2;\n"
        mutant, = mutants_of("a.cpp", source)
        self.assertEqual(mutant.line(source), 2)
        self.assertEqual(mutant.before_and_after(source), ("int b = 2;", "int b = 3;"))


class Equivalents(unittest.TestCase):
    def test_each_that_is_listed_is_a_change_of_the_sources(self):
        listed = equivalents()
        made = set()
        for file in {file for file, _ in listed}:
            source = (ROOT / file).read_text(encoding="utf-8")
            made |= {(file, mutant.before_and_after(source)[1]) for mutant in mutants_of(file, source)}
        self.assertEqual(listed - made, set())
        self.assertGreater(len(listed), 0)


if __name__ == "__main__":
    unittest.main()

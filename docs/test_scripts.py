#!/usr/bin/env python3
"""Tests of the scripts that make the manual: what they are there to notice, they notice."""

import unittest
import xml.etree.ElementTree as ElementTree
from pathlib import Path

import check_docstrings
import prepare_page
import repeat_docstrings

# What Doxygen makes of a complete docstring.
FUNCTION = """
<memberdef kind="function" id="f" prot="public" const="no">
  <type>bool</type><name>FindCusps</name><argsstring>(...)</argsstring>
  <param><type>const point2d &amp;</type><declname>q</declname></param>
  <param><type>double</type><declname>distance</declname></param>
  <param><type>std::vector&lt; double &gt; &amp;</type><declname>parameters</declname></param>
  <briefdescription><para>Finds them in (0, 1); of q no more is asked.</para></briefdescription>
  <detaileddescription><para>
    <parameterlist kind="param">
      <parameteritem><parameternamelist><parametername>distance</parametername></parameternamelist>
        <parameterdescription>in drawing units</parameterdescription></parameteritem>
      <parameteritem><parameternamelist><parametername direction="out">parameters</parametername></parameternamelist>
        <parameterdescription>cleared, then filled in ascending order, at most 12</parameterdescription></parameteritem>
    </parameterlist>
    <simplesect kind="return">false, with nothing found, for a straight curve</simplesect>
  </para></detaileddescription>
  <location file="A.h" line="1"/>
</memberdef>"""


def findings(old="", new=""):
    """Of the docstring above with something replaced, which has to stand in it."""
    assert old in FUNCTION
    member = ElementTree.fromstring(FUNCTION.replace(old, new) if old else FUNCTION)
    return "; ".join(check_docstrings.Function(member, "ZarnMath", "").findings())


class Docstrings(unittest.TestCase):
    def test_complete(self):
        self.assertEqual(findings(), "")

    def test_each_thing_left_out(self):
        for old, new, complaint in (
                ("; of q no more is asked", "", "what q is"),
                ('direction="out"', "", "@param[out]"),
                ("cleared, then filled", "filled", "cleared or appended"),
                ("in ascending order", "", "order?"),
                ("at most 12", "", "largest count"),
                ("in drawing units", "any number", "unit of distance"),
                ("in (0, 1)", "", "range of the curve's parameter"),
                ('kind="return"', 'kind="note"', "no @return"),
                ("false, with nothing found, for a straight curve", "it stays as it was", "degenerate"),
        ):
            with self.subTest(complaint):
                self.assertIn(complaint, findings(old, new))

    def test_what_false_leaves_behind(self):
        silent = FUNCTION.replace("cleared, then filled", "appended").replace(
            "false, with nothing found, for a straight curve", "whether a straight curve has any")
        function = check_docstrings.Function(ElementTree.fromstring(silent), "", "")
        self.assertEqual(list(function.findings()), ["what is written if it returns false?"])

    def test_no_docstring(self):
        member = ElementTree.fromstring(FUNCTION)
        for part in ("briefdescription", "detaileddescription"):
            member.find(part).clear()
        self.assertEqual(list(check_docstrings.Function(member, "", "").findings()), ["no docstring"])

    def test_article_names_no_argument(self):
        member = ElementTree.fromstring(FUNCTION)
        function = check_docstrings.Function(member, "", "")
        function.text = "Takes a curve."
        self.assertFalse(function.names("a"))
        function.text = "The turn from a to b."
        self.assertTrue(function.names("a"))

    def test_names_in_the_list(self):
        for line, name in (
                ("ZarnMath::CubicBezier::Split", "ZarnMath::CubicBezier::Split"),
                ("MATRIX::operator()(ZarnMath::vector2dT<double, true> const&) const", "MATRIX::operator()"),
                ("double ZarnMath::Length<ZarnMath::vector2dT<double, true> >(double)", "ZarnMath::Length"),
                ("MATRIX::", "MATRIX::"),
        ):
            self.assertEqual(check_docstrings.name_of(line), name)


class Overloads(unittest.TestCase):
    def test_share_the_docstring_above_the_first(self):
        lines = ["/// Text.\n", "ZARNMATH_API void F(int,\n", "                  int);\n", "ZARNMATH_API void F();\n", "\n",
                 "ZARNMATH_API void G();\n"]
        self.assertEqual(list(repeat_docstrings.repeat(lines)),
                         lines[:3] + ["/// Text.\n"] + lines[3:])


    def test_leave_out_what_the_compiler_makes(self):
        self.assertEqual(list(repeat_docstrings.repeat(["A(const A&) = default;\n"])), ["\n"])
        documented = ["/// Text.\n", "A(A&&) = default;\n"]
        self.assertEqual(list(repeat_docstrings.repeat(documented)), documented)


class Pages(unittest.TestCase):
    page = Path(__file__).resolve().parent / "what-is-lost.md"

    def prepared(self, *lines):
        return list(prepare_page.prepared(lines, self.page))

    def test_title_gets_a_label(self):
        self.assertEqual(self.prepared("# What"), ["# What {#what_is_lost}"])
        self.assertEqual(self.prepared("# What {#own}"), ["# What {#own}"])

    def test_code_is_left_alone(self):
        lines = ["```sh", "# [a](b)", "```"]
        self.assertEqual(self.prepared(*lines), lines)

    def test_links_stay_inside_the_manual(self):
        self.assertEqual(self.prepared("see [this](../README.md)"), ["see this"])
        self.assertEqual(self.prepared("see [this](what-is-lost.md)"), ['see @ref what_is_lost "this"'])

    def test_findings_are_listed(self):
        self.assertIn("- @subpage what_is_lost", self.prepared("{findings}"))

    def test_example_is_cut_out_and_moved_to_the_margin(self):
        code = self.prepared("{example OneCurve.cpp split}")
        self.assertEqual((code[0], code[-1]), ("```{.cpp}", "```"))
        self.assertEqual(code[1], "Cubic left{};")

    def test_example_without_mark(self):
        with self.assertRaises(SystemExit):
            self.prepared("{example OneCurve.cpp nothing-of-the-kind}")


if __name__ == "__main__":
    unittest.main()

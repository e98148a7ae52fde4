#!/usr/bin/env python3
"""Checks that the docstring of every exported function states its whole contract.

    check_docstrings.py XML NAMES

XML is the folder that Doxygen wrote, NAMES the list of what the shared library exports. What each docstring has to say
depends on the declaration:

- what every argument is: by @param, or by its name in the text;
- what comes back: by @return, or by the first sentence where nothing else can change;
- of every argument that is written: @param[out] or @param[in,out]; of a vector whether it is cleared or appended to, the
  order of what is put in, and how many at most; of an array how many elements;
- where a bool comes back, what becomes of the written arguments if it is false;
- of a parameter of a curve, the range and what lies beyond it;
- of a measure - a distance, an angle, a curvature - its unit;
- what the degenerate input is, and its answer.

The last two may stand in the text of the named group of the function.
Overloads that share a docstring in the header share it here. Each finding is printed; the exit status is 1 if there is
any, and if an exported name has no docstring at all.
"""

import re
import sys
import xml.etree.ElementTree as ElementTree
from pathlib import Path

# What counts as saying something. The words are those of the headers; a docstring that says it otherwise is reworded.
CLEARED = re.compile(r"\b(cleared|append|appended|resized|replace|replaced|left alone|never cleared)\b")
ORDER = re.compile(r"\b(order|ascending|sorted|each point|each of|element for element)\b")
MOST = re.compile(r"\b(at most|no more than|resized to|c0, c1 and c2)\b")
ELEMENTS = re.compile(
    r"\b(one|two|three|four|five|seven|ten|11|N|n \+ 1|lines \+ 1|each|number|count|the points)\b")
ON_FALSE = re.compile(
    r"\b(untouched|nothing|cleared|unchanged|stays?|left alone|mean nothing|as it was|all six fields|written|"
    r"always|not empty|empty|changed?|fitted)\b|\(0, 0\) if")
RANGE = re.compile(
    r"[\[(]0(\.0)?, 1(\.0)?[\])]|\b(0(\.0)? to 1(\.0)?|outside|beyond|extrapolat\w+|extended|t <= 0|at least 1)\b")
UNIT = re.compile(
    r"\b(units?|radians?|degrees?|millionths?|ratios?|squared?|fraction|number of segments)\b|2\*pi|\b360|\b180")
DEGENERATE = re.compile(
    r"\b(NaN|null|infinite|infinity|infinities|not finite|zero|zeros|vanish\w*|empty|coincide\w*|singular|parallel|cusp|"
    r"degenerate|collapsed|inside out|straight|a point|two points|without|none|nothing|untouched|unchanged|whatever|any|"
    r"wraps?|saturates?|determinant|extended polynomial|too close|DBL_EPSILON)\b|"
    r"\b(below|of|at|with|is|from|at most|exactly|for|where) \(?[012]\b|\b0 (where|gives|comes out)\b", re.IGNORECASE)

MEASURES = re.compile(
    r"^(distance|distanceSquared|squaredDistances|tolerance|threshold|width|halfWidth|radius|offset|curvature|angle|"
    r"angle[XY]|major|minor|length|rx|ry|r)$")
MEASURING = re.compile(
    r"^(Get\w*Angle|VectorToAngle|NormalizeAngle|NormalizeFineAngle|Get\w*Radians|Length\w*|SafeBezierCurvature|"
    r"Distance\w*|GetAreaUnderBezier|GetRectArea|LeastSquares|Constrain)$")
# The tangents of a fit are t1 and t2, so that t1 is a parameter beside t0 alone.
PARAMETERS = re.compile(r"^(t|t0|ts|parameters|\w+Parameters?|fraction|validityChanges)$")


def text_of(element):
    return " ".join("".join(element.itertext()).split()) if element is not None else ""


class Function:
    """One declaration with its docstring, as Doxygen read them."""

    def __init__(self, member, scope, group):
        self.name = f"{scope}::{member.findtext('name')}" if scope else member.findtext("name")
        self.short = member.findtext("name")
        self.arguments = [(p.findtext("declname"), text_of(p.find("type"))) for p in member.findall("param")
                          if p.findtext("declname")]
        self.declaration = f"{self.name}{member.findtext('argsstring')}"
        self.result = text_of(member.find("type")).replace("static", "").strip()
        self.brief = text_of(member.find("briefdescription"))
        detailed = member.find("detaileddescription")
        self.text = f"{self.brief} {text_of(detailed)}"
        self.with_group = f"{self.text} {group}"
        self.documented = {}
        for item in detailed.iter("parameteritem"):
            for name in item.iter("parametername"):
                for one in re.split(r",\s*", text_of(name)):
                    self.documented[one] = name.get("direction", "")
        self.returns = any(s.get("kind") == "return" for s in detailed.iter("simplesect"))
        where = member.find("location")
        self.place = f"{where.get('file')}:{where.get('line')}"

    def written(self):
        return [(name, kind) for name, kind in self.arguments
                if ("*" in kind or "&" in kind) and "const" not in kind and "&&" not in kind]

    def names(self, argument):
        """Whether the text names an argument. The article "a" does not count, and so takes an operator beside it."""
        if argument == "a":
            return re.search(r"\ba[.,*()|+-]|[|*(+-]a\b|\bfrom a\b|\b(of|and) a\b[ ,]and", self.text) is not None
        return re.search(rf"\b{re.escape(argument)}\b", self.text) is not None

    def findings(self):
        if not self.text.strip():
            yield "no docstring"
            return
        for name, _ in self.arguments:
            if name not in self.documented and not self.names(name):
                yield f"does not say what {name} is"
        written = self.written()
        if self.result not in ("", "void") and not self.returns and (written or not self.brief):
            yield "no @return"
        for name, kind in written:
            if name in self.documented and "out" not in self.documented[name]:
                yield f"{name} is written: @param[out] or @param[in,out]"
            if "vector<" in kind or "vector <" in kind:
                for words, what in ((CLEARED, "cleared or appended to"), (ORDER, "order"), (MOST, "largest count")):
                    if not words.search(self.text):
                        yield f"vector {name}: {what}?"
            elif re.search(r"(POINT(3D)?|point2d|double) \*", kind) and not ELEMENTS.search(self.text):
                yield f"array {name}: how many elements?"
        if self.result == "bool" and written and not ON_FALSE.search(self.text):
            yield "what is written if it returns false?"
        parameters = [name for name, kind in self.arguments if PARAMETERS.match(name) and "MATRIX" not in kind]
        if parameters and not RANGE.search(self.text):
            yield "the range of the curve's parameter?"
        measures = [name for name, kind in self.arguments
                    if MEASURES.match(name) and not re.search("POINT|point2d|vector2d", kind)]
        if (measures or MEASURING.match(self.short)) and not UNIT.search(self.with_group):
            yield f"unit of {', '.join(measures) or 'the result'}?"
        if not DEGENERATE.search(self.with_group):
            yield "degenerate input?"


def is_to_be_checked(member, section):
    """Not what the compiler makes by itself, and not what a type has for itself."""
    return (member.get("kind") == "function" and member.get("prot") == "public"
            and not member.findtext("argsstring").endswith("=default")
            and text_of(section.find("header")) != "Internal")


def functions(folder):
    seen = set()
    for path in sorted(Path(folder).glob("*.xml")):
        if path.name == "index.xml":
            continue
        for compound in ElementTree.parse(path).getroot().iter("compounddef"):
            scope = compound.findtext("compoundname") if compound.get("kind") != "file" else ""
            for section in compound.iter("sectiondef"):
                group = f"{text_of(section.find('header'))} {text_of(section.find('description'))}"
                for member in section.iter("memberdef"):
                    if is_to_be_checked(member, section) and member.get("id") not in seen:
                        seen.add(member.get("id"))
                        yield Function(member, scope, group)


def name_of(line):
    """The qualified name in a line of the list, which may be a whole signature, with the result of a template."""
    call = "operator()"
    rest = line.strip().replace(call, "\0")
    return re.sub(r"[<(].*", "", rest).split()[-1].replace("\0", call)


def main(folder, list_of_names):
    names = {name_of(line) for line in Path(list_of_names).read_text(encoding="utf-8").splitlines()
             if line.strip() and not line.startswith("#")}
    unseen = set(names)
    count = 0
    troubles = []
    for function in functions(folder):
        entries = [n for n in names if function.name == n or n.endswith("::") and function.name.startswith(n)]
        if not entries:
            continue
        unseen.difference_update(entries)
        count += 1
        troubles += [f"{function.place}: {function.declaration}: {what}" for what in function.findings()]
    troubles += [f"{name}: exported, and not in the manual" for name in sorted(unseen)]
    print("\n".join(troubles) if troubles else f"{count} exported functions state their contract")
    return 1 if troubles else 0


if __name__ == "__main__":
    if len(sys.argv) != 3:
        sys.exit(__doc__)
    sys.exit(main(sys.argv[1], sys.argv[2]))

#!/usr/bin/env python3
"""Prints a page of docs/ as Doxygen is to read it.

- The title gets a label made of the file's name, what-is-lost.md the label what_is_lost, unless it has one.
- A line "{findings}" becomes the list of the pages that stand in docs/ itself.
- A line "{example FILE MARK}" becomes the code between two lines "//! [MARK]" of a source in docs/figures.
- A link to a file that is no page of the manual becomes the text of the link: from the manual it would lead nowhere.
"""

import re
import sys
import textwrap
from pathlib import Path

DOCS = Path(__file__).resolve().parent
LINK = re.compile(r"(?<!!)\[([^]]+)\]\(([^)#:\s]+)(#[^)]*)?\)")
EXAMPLE = re.compile(r"\{example (\S+) (\S+)\}$")


def label_of(page):
    return page.stem.replace("-", "_")


def with_label(line, page):
    return line if "{#" in line else f"{line} {{#{label_of(page)}}}"


def without_dead_links(line, page):
    def keep_or_not(link):
        target = (page.parent / link[2]).resolve()
        is_page = target.suffix == ".md" and target.parent in (DOCS, DOCS / "manual") and target.exists()
        return f"@ref {label_of(target)} \"{link[1]}\"" if is_page else link[1]
    return LINK.sub(keep_or_not, line)


def findings():
    return [f"- @subpage {label_of(page)}" for page in sorted(DOCS.glob("*.md"))]


def example(file, mark):
    parts = (DOCS / "figures" / file).read_text(encoding="utf-8").split(f"//! [{mark}]\n")
    if len(parts) != 3:
        sys.exit(f"{file}: the mark {mark} has to stand there twice")
    code = textwrap.dedent(parts[1].rstrip(" "))
    return ["```{.cpp}", *code.splitlines(), "```"]


def prepared(lines, page):
    inside_code = False
    has_title = False
    for line in lines:
        inside_code ^= line.startswith("```")
        if inside_code:
            yield line
        elif line == "{findings}":
            yield from findings()
        elif found := EXAMPLE.match(line):
            yield from example(found[1], found[2])
        elif line.startswith("# ") and not has_title:
            has_title = True
            yield with_label(line, page)
        else:
            yield without_dead_links(line, page)


if __name__ == "__main__":
    source = Path(sys.argv[1]).resolve()
    print("\n".join(prepared(source.read_text(encoding="utf-8").splitlines(), source)))

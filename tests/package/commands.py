#!/usr/bin/env python3
"""Does what a page of the documentation tells its reader to do, in the order of the page.

    commands.py PAGE... [--use HOME] [--expect PATTERN] [--except PATTERN]

A fenced block whose first line is a comment with nothing but a file name is a file of the reader's own project; a block of
`sh` is run, with every command counting: in the folder of that project if it names one of its files or their stems, and
otherwise in a copy of this folder with a home of its own.

--use HOME        takes HOME, where the library is installed in .local, and runs the blocks of the project alone
--expect PATTERN  what each block of the project has to print
--except PATTERN  commands of one line that are left out, since they are tried elsewhere
"""

import argparse
import os
import re
import shutil
import subprocess
import sys
import tempfile

ROOT = os.path.abspath(os.path.join(os.path.dirname(__file__), "..", ".."))


def blocks(page):
    """The fenced blocks of a page: language and content."""
    with open(page, encoding="utf-8") as file:
        return re.findall(r"^```(\w+)\n(.*?)^```$", file.read(), re.MULTILINE | re.DOTALL)


def file_name(content):
    """The name of the file that a block is, if it is one."""
    match = re.match(r"(?://|#) ([\w.]+\.\w+)\n", content)
    return match and match[1]


def copy_sources(to):
    listed = subprocess.run(["git", "-C", ROOT, "ls-files", "-z", "--cached", "--others", "--exclude-standard"],
                            check=True, capture_output=True, text=True).stdout
    for name in filter(None, listed.split("\0")):
        source = os.path.join(ROOT, name)
        if os.path.exists(source):
            os.makedirs(os.path.dirname(os.path.join(to, name)), exist_ok=True)
            shutil.copy2(source, os.path.join(to, name))
    # The verbs that look for sources ask for those that are under version control.
    for arguments in (["init", "-q"], ["add", "-A"]):
        subprocess.run(["git", *arguments], cwd=to, check=True)


def run(script, folder, home):
    print(f"\n$ {script.strip()}", flush=True)
    environment = {**os.environ, "HOME": home}
    process = subprocess.Popen(["bash", "-euo", "pipefail", "-c", script], cwd=folder, env=environment, text=True,
                               stdout=subprocess.PIPE, stderr=subprocess.STDOUT)
    output = ""
    for line in process.stdout:
        print(line, end="", flush=True)
        output += line
    if process.wait() != 0:
        sys.exit(f"commands: failed: {script.strip()}")
    return output


def follow(page, scratch, arguments):
    """Does what one page says; gives the number of blocks that were run."""
    project, copy = os.path.join(scratch, "project"), os.path.join(scratch, "copy")
    home = arguments.use or os.path.join(scratch, "home")
    stems = []
    for folder in (project, copy, home):
        os.makedirs(folder, exist_ok=True)
    if not arguments.use:
        copy_sources(copy)
    for _, content in blocks(page):
        if name := file_name(content):
            with open(os.path.join(project, name), "w", encoding="utf-8") as file:
                file.write(content)
            stems.append(os.path.splitext(name)[0])
    count = 0
    for language, content in blocks(page):
        if language != "sh":
            continue
        lines = [line for line in content.splitlines() if not (arguments.leave_out and re.search(arguments.leave_out, line))]
        of_project = any(re.search(rf"\b{re.escape(stem)}\b", content) for stem in stems)
        if not any(lines) or arguments.use and not of_project:
            continue
        output = run("\n".join(lines), project if of_project else copy, home)
        if of_project and arguments.expect and not re.search(arguments.expect, output):
            sys.exit(f"commands: there is no {arguments.expect!r} in what was printed")
        count += 1
    return count


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("pages", metavar="PAGE", nargs="+")
    parser.add_argument("--use", metavar="HOME")
    parser.add_argument("--expect", metavar="PATTERN")
    parser.add_argument("--except", metavar="PATTERN", dest="leave_out")
    arguments = parser.parse_args()
    count = 0
    for page in arguments.pages:
        with tempfile.TemporaryDirectory() as scratch:
            count += follow(os.path.abspath(page), scratch, arguments)
    print(f"\ncommands: {count} blocks of {len(arguments.pages)} pages did what they say")
    if count == 0:
        sys.exit("commands: nothing was run")


if __name__ == "__main__":
    main()

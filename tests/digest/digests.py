"""One SHA-256 a function, of the bytes of its results over many inputs.

    digests.py check FILE CALLS PROGRAM...    compares with FILE; ends with 1 where an arithmetic function differs
    digests.py write FILE PROGRAM...          makes FILE anew
    digests.py compare FILE CALLS PROGRAM...  says in one line how many of each class agree, and then which do not

PROGRAM is zarnmath_digest, behind an emulator if need be. FILE holds a line a function: its name, its class, and a digest
for each number of calls that its first line names. A function of the class `platform` goes through the mathematical
functions of the C library, and has other digests where these round otherwise.
"""

import hashlib
import subprocess
import sys
import tempfile

HEADER = "# function\tclass"


class Result:
    """What a run says about a function."""

    def __init__(self, digest, counted_calls):
        self.digest = digest
        self.counted_calls = counted_calls


def output_of(program, task):
    """A file with what the program writes: under Node it can write to a file, and to no pipe."""
    output = tempfile.TemporaryFile()
    subprocess.run([*program, str(task)], check=True, stdout=output)
    output.seek(0)
    return output


def list_classes(program):
    """The class of each function, as the program lists them."""
    with output_of(program, "list") as output:
        rows = (line.decode().rstrip("\n").split("\t") for line in output)
        return {name: number_class for name, _, number_class in rows}


def read_function(stream):
    """The name and the result of the next function in the stream, or None at its end."""
    name = stream.readline().decode().rstrip("\n")
    if not name:
        return None
    digest = hashlib.sha256()
    while (size := int(stream.readline())) > 0:
        block = stream.read(size)
        if len(block) != size:
            raise EOFError(f"the results of {name} end early")
        digest.update(block)
    return name, Result(digest.hexdigest(), int(stream.readline()))


def run(program, calls):
    """The results of all functions."""
    results = {}
    with output_of(program, calls) as output:
        while (found := read_function(output)) is not None:
            name, result = found
            results[name] = result
    return results


def read_file(path):
    """The numbers of calls, and by function its class and its digests."""
    with open(path, encoding="utf-8") as file:
        header, *lines = file.read().splitlines()
    calls = [int(word) for word in header.removeprefix(HEADER).split()]
    rows = (line.split("\t") for line in lines)
    return calls, {name: (number_class, digests) for name, number_class, *digests in rows}


def write_file(path, calls, classes, runs):
    with open(path, "w", encoding="utf-8") as file:
        print(HEADER, *calls, sep="\t", file=file)
        for name, number_class in classes.items():
            print(name, number_class, *(run[name].digest for run in runs), sep="\t", file=file)


def misnamed(classes, results):
    """Functions of which the class is not what their calls say: platform is what calls the C library's mathematics."""
    return [name for name, number_class in classes.items()
            if (number_class == "platform") != (results[name].counted_calls > 0)]


def differing(path, calls, results):
    """The functions whose digests are not those of the file, by class."""
    columns, recorded = read_file(path)
    column = columns.index(calls)
    found = {"arithmetic": [], "platform": []}
    for name, (number_class, digests) in recorded.items():
        if name not in results or results[name].digest != digests[column]:
            found[number_class].append(name)
    return found


def check(path, calls, *program):
    results = run(program, calls := int(calls))
    classes = list_classes(program)
    _, recorded = read_file(path)
    trouble = [f"another class than its calls say: {name}" for name in misnamed(classes, results)]
    trouble += [f"not in the file, or of another class there: {name}" for name, number_class in classes.items()
                if recorded.get(name, ("", []))[0] != number_class]
    differences = differing(path, calls, results)
    trouble += [f"other results than recorded: {name}" for name in differences["arithmetic"]]
    for name in differences["platform"]:
        print(f"other results than recorded, by this machine's mathematical library: {name}")
    print(*trouble, sep="\n", end="\n" if trouble else "")
    print(f"{len(results)} functions, {calls} calls of each: {len(trouble)} in trouble")
    return 1 if trouble else 0


def compare(path, calls, *program):
    results = run(program, calls := int(calls))
    _, recorded = read_file(path)
    differences = differing(path, calls, results)
    words = []
    for number_class, names in differences.items():
        total = sum(1 for recorded_class, _ in recorded.values() if recorded_class == number_class)
        words.append(f"{total - len(names)} of {total} {number_class}")
    print(", ".join(words))
    for names in differences.values():
        print(*names, sep="\n", end="\n" if names else "")
    return 1 if differences["arithmetic"] else 0


# The few are for the tests, which are run often; the many for `./dev digest`.
CALLS = (2000, 100000)


def write(path, *program):
    classes = list_classes(program)
    runs = [run(program, calls) for calls in CALLS]
    wrong = misnamed(classes, runs[-1])
    print(*(f"another class than its calls say: {name}" for name in wrong), sep="\n", end="\n" if wrong else "")
    write_file(path, CALLS, classes, runs)
    return 1 if wrong else 0


def main(arguments):
    tasks = {"check": check, "write": write, "compare": compare}
    if len(arguments) < 2 or arguments[0] not in tasks:
        print(__doc__, file=sys.stderr)
        return 2
    return tasks[arguments[0]](*arguments[1:])


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))

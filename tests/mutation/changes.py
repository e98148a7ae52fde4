"""The small changes of a source file.

A sign, a comparison, a constant, a pair of arguments, a dropped statement: a mutant is one such change at one place. It is
known by its unit, the text of the line, the number of that line among equal ones, and what the line becomes.
"""
import collections
import hashlib
import pathlib
import re

ROOT = pathlib.Path(__file__).resolve().parents[2]
COMMUTATIVE = {"Dot", "swap", "std::swap", "IsNearEqual", "WrappingAdd", "Sum"}
NO_CODE = r"\s*(#|template|static_assert|using|namespace|friend|(const |constexpr )*[\w:<>]+ \w+\[.*\];$)"
Mutant = collections.namedtuple("Mutant", "unit line occurrence mutation kind text")


def replaced(pattern, table):
    """A change of each match of the pattern into each of table(match)."""
    def changes(code):
        for match in re.finditer(pattern, code):
            for text in table(match):
                yield match.start(), match.end(), text
    return changes


def exchanged(*pairs):
    table = {a: b for pair in pairs for a, b in (pair, pair[::-1])}
    return lambda match: [table[match.group()]]


def other_integers(match):
    if re.search(r"(?<!return) \w+\[$", match.string[:match.start()]):
        return []  # a larger array does no harm, a smaller one need not
    number = int(match.group())
    return [str(number + 1)] + ([str(number - 1)] if number > 1 else [])


def other_reals(match):
    return ["1.0"] if float(match.group()) == 0.0 else [f"({match.group()} * 2.0)", f"({match.group()} * 0.5)"]


def swapped_arguments(code):
    """The neighbours in each list of arguments that is written in one line."""
    for start in (i for i, character in enumerate(code) if character in "({"):
        name = re.search(r"[\w:]*$", code[:start]).group()
        depth, commas, end = 0, [start], None
        for i in range(start, len(code)):
            depth += (code[i] in "({[") - (code[i] in ")}]")
            if depth == 0:
                end = i
                break
            if depth == 1 and code[i] == ",":
                commas.append(i)
        if end is None or len(commas) == 1 or name in COMMUTATIVE:
            continue
        bounds = commas + [end]
        parts = [code[a + 1:b].strip() for a, b in zip(bounds, bounds[1:])]
        if any(re.match(r"(const )?[\w:<>]+[&*]* [&*]?\w+", part) for part in parts):
            continue  # parameters
        for i in range(len(parts) - 1):
            if parts[i] != parts[i + 1]:
                swapped = parts[:i] + [parts[i + 1], parts[i]] + parts[i + 2:]
                yield start + 1, end, ", ".join(swapped)


def dropped_statement(code):
    statement = re.match(r"\s+(([\w.()\[\]]|->|::)+ ([-+*/&|]|<<|>>)?= .*|[\w:.]+(<[^;]*>)?\(.*\)|(\+\+|--)\S+"
                         r"|\S+(\+\+|--)|break|continue|return);$", code)
    if statement and not re.match(r"\s+(static_assert|return \S)", code):
        yield len(code) - len(code.lstrip()), len(code), ";"


CHANGES = {
    "comparison": replaced(r"(?<= )(<=|>=|<|>|==|!=)(?= )",
                           exchanged(("<", "<="), (">", ">="), ("==", "!="))),
    "direction": replaced(r"(?<= )(<=|>=|<|>)(?= )", exchanged(("<", ">"), ("<=", ">="))),
    "logic": replaced(r"(?<= )(&&|\|\|)(?= )", exchanged(("&&", "||"))),
    "negation": replaced(r"!(?=[\w(])", lambda match: [""]),
    "condition": replaced(r"(?<=\bif \()(.*)(?=\)( \{)?$)", lambda match: [f"!({match.group(1)})"]),
    "sign": replaced(r"(?<= )[-+](?==? )", exchanged(("+", "-"))),
    "unary sign": replaced(r"(?<=[(,=?:{ ])-(?=[A-Za-z_(\d])|(?<=return )-(?=[\w(])", lambda match: [""]),
    "operator": replaced(r"(?<= )[*/](?==? )", exchanged(("*", "/"))),
    "integer": replaced(r"(?<![\w.])\d+(?![\w.])", other_integers),
    "real": replaced(r"(?<![\w.])\d+\.?\d*e[-+]?\d+|(?<![\w.])\d+\.\d+", other_reals),
    "limit": replaced(r"\bDBL_EPSILON\b", lambda match: ["(DBL_EPSILON * 2.0)", "(DBL_EPSILON * 0.5)"]),
    "name": replaced(r"\b(true|false|min|max|floor|ceil|sin|cos)\b(?=[(;,)])|(?<=\.)[xy]\b",
                     exchanged(("true", "false"), ("min", "max"), ("floor", "ceil"), ("sin", "cos"), ("x", "y"))),
    "arguments": swapped_arguments,
    "statement": dropped_statement,
}


def without_comments(text):
    """The same lines and columns, with blanks for the comments."""
    def blank(match):
        return re.sub(r"[^\n]", " ", match.group()) if match.group().startswith("/") else match.group()
    return re.sub(r"//[^\n]*|/\*.*?\*/|\"(\\.|[^\"\\])*\"", blank, text, flags=re.S)


def mutants_of(unit):
    """All changes of a file, given by its name under Engines."""
    text = (ROOT / "Engines" / unit).read_text()
    lines = text.split("\n")
    seen = collections.Counter()
    keys = set()
    for row, code in enumerate(without_comments(text).split("\n")):
        code = code.rstrip()
        line = code.strip()
        seen[line] += 1
        if re.match(NO_CODE, code):
            continue
        for kind, changes in CHANGES.items():
            for start, end, new in changes(code):
                mutation = (code[:start] + new + code[end:]).strip()
                key = (unit, line, str(seen[line]), mutation)
                if key not in keys:
                    keys.add(key)
                    mutated = lines[:row] + [code[:start] + new + code[end:]] + lines[row + 1:]
                    yield Mutant(*key, kind, "\n".join(mutated))


def chosen(units, count, seed):
    """The mutants of each unit in a fixed order in which all kinds take turns, and how many of them are wanted."""
    order = {}
    for unit in units:
        kinds = collections.defaultdict(list)
        for mutant in mutants_of(unit):
            digest = hashlib.sha256("\t".join((seed,) + mutant[:4]).encode()).hexdigest()
            kinds[mutant.kind].append((digest, mutant))
        turns = [(rank, *pair) for kind in kinds.values() for rank, pair in enumerate(sorted(kind))]
        order[unit] = [mutant for _, _, mutant in sorted(turns)]
    weights = {unit: len(mutants) ** 0.6 for unit, mutants in order.items()}
    total = sum(weights.values())
    return [(mutants, round(count * weights[unit] / total)) for unit, mutants in order.items()]

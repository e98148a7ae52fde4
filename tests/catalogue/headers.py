"""The exported functions as the headers declare them, each with its docstring.

This reads what clang-format leaves of the library's own headers, no C++ in general.
"""

import re
from pathlib import Path


class Declaration:
    """An exported function: its name as the catalogue writes it, where it stands, and its docstring's lines."""

    def __init__(self, name, place, docstring):
        self.name = name
        self.place = place
        self.docstring = docstring


def _without_namespaces(text):
    return re.sub(r"\b(?:std|ZarnMath|Framework|common_types|CubicBezier)::", "", text)


def _type_of(parameter):
    """`const point2d& a = {}` as `const point2d&`."""
    parameter = parameter.split("=")[0].strip()
    match = re.match(r"(.*[\w>&*])\s*?(?<=[\s&*>])(\w+)$", parameter)
    if match and match.group(1).strip() not in ("", "const", "unsigned"):
        return match.group(1).strip()
    return parameter


def _split(parameters):
    return [part.strip() for part in re.split(r",(?![^<]*>)", parameters) if part.strip()]


def _name_of(scopes, statement):
    """The catalogue's name of a function's declaration."""
    text = re.sub(r"\[\[\w+\]\]|ZARNMATH_API|\b(?:static|noexcept|extern)\b|\btemplate(?=\s+[^<\s])", " ", statement)
    text = " ".join(text.split())
    match = re.match(r"(?:.*?[\s&*])?((?:operator\s?(?:\(\)|[^\s(]+)|\w+(?:<\w+>)?))\s*\(([^()]*)\)\s*(const)?$", text)
    if not match:
        return None
    name, parameters, const = match.groups()
    qualified = "::".join([scope for scope in scopes if scope and scope != "ZarnMath"] + [name])
    types = ", ".join(_type_of(_without_namespaces(one)) for one in _split(parameters))
    return f"{qualified}({types}){' const' if const else ''}"


def _scope_of(statement):
    """The scope that a brace opens: its name, '' where it gives none, or None for a function's body."""
    if statement.startswith('extern "C"'):
        return ""
    match = re.match(r"namespace ([\w:]+)$", statement)
    if match:
        return match.group(1)
    match = re.match(r"(?:template <[^>]*> )?(?:struct|class|enum(?: class)?) (?:ZARNMATH_API )?(\w+)", statement)
    return match.group(1) if match else None


def _flatten(scopes):
    return [part for scope in scopes for part in scope.split("::")]


def declarations(path):
    """Those of one header. A declaration without a docstring of its own shares the one before it."""
    found = []
    scopes = []
    exported_scopes = []
    bodies = 0
    docstring = []
    is_docstring_open = False
    statement = ""
    for number, line in enumerate(Path(path).read_text(encoding="utf-8").splitlines(), 1):
        stripped = line.strip()
        if stripped.startswith("///"):
            if not is_docstring_open:
                docstring = []
            docstring.append(number)
            is_docstring_open = True
            continue
        is_docstring_open = False
        code = re.sub(r"//.*", "", stripped)
        if not code or code.startswith("#"):
            continue
        for token in re.findall(r"[{};]|[^{};]+", code):
            if token == "{":
                opened = _scope_of(" ".join(statement.split()))
                if bodies or opened is None:
                    bodies += 1
                else:
                    scopes.append(opened)
                    exported_scopes.append("ZARNMATH_API" in statement)
                    statement = ""
            elif token == "}":
                if bodies:
                    bodies -= 1
                    if not bodies:
                        statement = ""
                elif scopes:
                    scopes.pop()
                    exported_scopes.pop()
                    statement = ""
            elif token == ";":
                if not bodies:
                    is_exported = "ZARNMATH_API" in statement or any(exported_scopes)
                    name = _name_of(_flatten(scopes), statement) if is_exported and "(" in statement else None
                    if name and "= default" not in statement and "friend" not in statement:
                        found.append(Declaration(name, f"{Path(path).name}:{number}", list(docstring)))
                    statement = ""
            elif not bodies:
                statement += " " + token
    return found

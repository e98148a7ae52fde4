"""Names of functions, from the forms in which tools print them, to the one that the catalogue uses."""

import re
import subprocess

# What tools spell out, and how a reader writes it. In this order.
_SPELLINGS = [
    (r"std::(?:__[A-Za-z0-9_]+::)?vector<([^<>]*(?:<[^<>]*(?:<[^<>]*> ?)?>)?) ?, std::(?:__[A-Za-z0-9_]+::)?allocator<\1 ?> ?>",
     r"vector<\1>"),
    (r"ZarnMath::vector2dT<double, true>", "point2d"),
    (r"ZarnMath::vector2dT<double, false>", "vector2d"),
    (r"Framework::common_types::", ""),
    (r"ZarnMath::", ""),
    (r"CubicBezier::bezier2dT", "bezier2dT"),
    (r" +>", ">"),
]


def _const_first(parameter):
    """`point2d const*` as `const point2d*`."""
    return re.sub(r"^(.*?) const([*&]+)$", r"const \1\2", parameter)


def _split(parameters):
    """At the commas that are in no angle brackets."""
    return [part.strip() for part in re.split(r",(?![^<]*>)", parameters) if part.strip()]


def from_demangled(symbol):
    """The name of a demangled symbol; one with C linkage has no parameters."""
    for spelled, written in _SPELLINGS:
        symbol = re.sub(spelled, written, symbol)
    match = re.match(r"(?:[^(]* )?([^ (]*(?:operator\(\)|operator[^ (]+)|[^ (]+)(?:\((.*)\)( const)?)?$", symbol)
    name, parameters, const = match.groups()
    if parameters is None:
        return name
    return f"{name}({', '.join(map(_const_first, _split(parameters)))}){const or ''}"


def exported(nm, library):
    """What a shared library shows, each name once."""
    lines = subprocess.run([nm, "-D", "-C", "--defined-only", library], check=True, capture_output=True,
                           text=True).stdout.splitlines()
    return {from_demangled(line.split(" ", 2)[2]) for line in lines}


def without_parameters(name):
    return re.sub(r"(?<!operator)\(.*$", "", name)

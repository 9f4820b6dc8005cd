#!/usr/bin/env python3
"""checksymbols.py NM LIBRARY HEADER...

Compares what a library exports with the members that its public headers declare. Fails for a symbol that is in no header,
and for a declared function that is not exported (unless the header defines it).
"""
import pathlib
import re
import subprocess
import sys

# What the toolkit's macros declare, and what a class with virtual functions needs.
GENERATED = {"qt_metacall", "qt_metacast", "metaObject", "staticMetaObject", "qt_static_metacall"}
OTHERS = re.compile(r"qml_register_types_Favrin_ColorPicker\(\)|FAVRIN_COLOR_PICKER_\d+"
                    r"|(typeinfo|typeinfo name|vtable) for FVColorPickerViewController")


def exported(nm, library):
    lines = subprocess.run([nm, "-DC", "--extern-only", "--defined-only", library], check=True, capture_output=True,
                           text=True).stdout.splitlines()
    return [re.sub(r"@@.*", "", re.sub(r"^\s*[0-9a-f]*\s+\w\s+", "", line)) for line in lines]


def declared(header):
    """The names of the class's functions: those that the header leaves to the library, and all."""
    text = re.sub(r"/\*.*?\*/|//[^\n]*", "", header.read_text(), flags=re.S)
    text = re.sub(r"\bQ_[A-Z]+\(\w+\)", "", text)
    name = re.search(r"class (?:FAVRIN_HOST_EXPORT )(\w+)", text)[1]
    body = text[text.index("public:"):]
    body = body[:re.search(r"^private:", body, re.M).start()]
    everything, left = set(), set()
    for match in re.finditer(r"(operator==?|~?\b\w+)\((?:[^()]|\([^()]*\))*\)([^;{]*)([;{])", body):
        member, tail, end = match[1], match[2], match[3]
        everything.add(f"{name}::{member}")
        if end == ";" and "default" not in tail and "delete" not in tail:
            left.add(f"{name}::{member}")
    return everything, left


def main():
    symbols = exported(sys.argv[1], sys.argv[2])
    everything, left = set(), set()
    for header in map(pathlib.Path, sys.argv[3:]):
        more, more_left = declared(header)
        everything |= more
        left |= more_left
    names = set()
    faults = []
    for symbol in symbols:
        member = re.match(r"(\w+::[~\w=]+)(\(|$)", symbol)
        if member and (member[1] in everything or member[1].split("::")[1] in GENERATED):
            names.add(member[1])
        elif not OTHERS.fullmatch(symbol):
            faults.append(f"exported, but in no public header: {symbol}")
    faults += [f"in a public header, but not exported: {name}" for name in sorted(left - names)]
    print("\n".join(faults) or f"{len(symbols)} symbols, all documented")
    return 1 if faults or len(names) < len(left) or not left else 0


sys.exit(main())

#!/usr/bin/env python3
"""extractcode.py FOLDER DOCUMENT...

Writes each block of C++ and QML of the documents to a file of its own in FOLDER, so that it can be compiled and loaded. A
block whose first line names a file ("// test.cpp") gets that name behind the document's.
"""
import pathlib
import re
import shutil
import sys

folder = pathlib.Path(sys.argv[1])
shutil.rmtree(folder, ignore_errors=True)
folder.mkdir(parents=True)
for document in map(pathlib.Path, sys.argv[2:]):
    for number, match in enumerate(re.finditer(r"^```(cpp|qml)\n(.*?)^```", document.read_text(), re.M | re.S)):
        language, code = match.groups()
        named = re.match(r"// (\w+)\.cpp\n", code)
        name = f"{document.stem}_{named[1] if named else number}.{language}"
        line = document.read_text()[:match.start()].count("\n") + 2
        origin = f'#line {line} "{document.name}"\n' if language == "cpp" else ""
        (folder / name).write_text(origin + code)

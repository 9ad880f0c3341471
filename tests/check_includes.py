#!/usr/bin/env python3
"""Checks the architecture of the source tree: check_includes.py ROOT

 - A folder includes only from itself and from folders before it in sourcetree.LAYERS.
 - Project headers are included from the root, as "folder/X.h", and exist.
 - No two headers include each other, directly or through others.
 - No source file is longer than MAX_LINES.
Prints every violation and ends 1 if there is one. With --self-test it checks that it finds violations in a small tree.
"""
import os
import re
import sys

import sourcetree
from sourcetree import FOLDERS, LAYERS

UPPER = [folder for folder in FOLDERS if folder not in LAYERS]
MAX_LINES = 800
SUFFIXES = (".h", ".cpp", ".cc", ".c", ".hpp")
# Scripts are held to the length only.
OTHER_SUFFIXES = (".py", ".sh")
INCLUDE = re.compile(r'^\s*#\s*include\s*([<"])([^>"]+)[>"]', re.MULTILINE)


def is_generated(target):
    """Files that the build makes: moc output and forms."""
    name = os.path.basename(target)
    return name.endswith(".moc") or name.startswith(("moc_", "ui_", "qrc_"))


def check_include(root, path, quote, target):
    top = path.split(os.sep)[0]
    target_top = target.split("/")[0]
    if quote == "<":
        if target_top in FOLDERS and os.path.exists(os.path.join(root, target)):
            return f"{path}: <{target}> is a header of this project and takes quotes"
        return None
    if is_generated(target):
        return None
    if not os.path.exists(os.path.join(root, target)):
        beside = os.path.join(os.path.dirname(path), target)
        if os.path.exists(os.path.join(root, beside)):
            if top in UPPER:
                return None
            return f'{path}: "{target}" is to be included from the root, as "{beside}"'
        return None  # a header of a library
    if target_top not in FOLDERS:
        return None
    if top in LAYERS:
        if target_top in UPPER or LAYERS.index(target_top) > LAYERS.index(top):
            return f'{path}: {top}/ may not include "{target}"'
    return None


def circles(graph):
    found, state, stack = [], {}, []

    def visit(node):
        state[node] = "open"
        stack.append(node)
        for following in graph.get(node, ()):
            if state.get(following) == "open":
                found.append(" -> ".join(stack[stack.index(following):] + [following]))
            elif following not in state:
                visit(following)
        stack.pop()
        state[node] = "done"

    sys.setrecursionlimit(10000)
    for node in sorted(graph):
        if node not in state:
            visit(node)
    return found


def check(root):
    errors, graph = [], {}
    for path in sourcetree.files(root, FOLDERS, SUFFIXES + OTHER_SUFFIXES):
        text = sourcetree.read(os.path.join(root, path))
        lines = text.count("\n")
        if lines > MAX_LINES:
            errors.append(f"{path}: {lines} lines, more than {MAX_LINES}")
        if not path.endswith(SUFFIXES):
            continue
        graph[path] = []
        for quote, target in INCLUDE.findall(text):
            error = check_include(root, path, quote, target)
            if error:
                errors.append(error)
            if quote == '"' and os.path.exists(os.path.join(root, target)):
                graph[path].append(target)
    errors += ["headers in a circle: " + circle for circle in circles(graph)]
    return errors


def self_test(tree):
    tree.write("support/A.h", "#pragma once\n")
    tree.write("canvas/B.h", '#include "support/A.h"\n#include <QWidget>\n')
    tree.write("tests/t.cpp", '#include "canvas/B.h"\n#include "t.moc"\n')
    assert check(tree.root) == [], check(tree.root)
    tree.write("support/A.h", '#include "canvas/B.h"\n')
    errors = check(tree.root)
    assert len(errors) == 2 and "may not include" in errors[0] and "circle" in errors[1], errors
    tree.write("support/A.h", "\n" * 801)
    tree.write("canvas/B.h", '#include "C.h"\n#include <support/A.h>\n')
    tree.write("canvas/C.h", "")
    errors = check(tree.root)
    assert len(errors) == 3, errors


if __name__ == "__main__":
    sys.exit(sourcetree.main(__doc__, check, self_test))

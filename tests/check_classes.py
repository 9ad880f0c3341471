#!/usr/bin/env python3
"""Checks that each class is one source: check_classes.py ROOT

Prints every class whose members are defined in more than one source file, and ends 1 if there is one that may
not be. With --self-test it checks that it finds such classes in a small tree.
"""
import os
import re
import sys

import sourcetree

# A second source that stays: the tables of connections between the objects that the window owns.
EXCEPTIONS = {"TitlerWindow": {"app/TitlerWindow.cpp", "app/TitlerWindowWiring.cpp"}}

COMMENT_OR_STRING = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"', re.DOTALL)
CLASS = re.compile(r"^\s*(?:class|struct)\s+(?:[A-Z_]+\s+)?(\w+)\b[^;()]*\{", re.MULTILINE)
# Definitions begin in the first column, where no statement does.
MEMBER = re.compile(r"^(?:[A-Za-z_][\w:<>,&*\s\[\]]*?[\s&*])?((?:\w+::)+)(?:~?\w+|operator[^(\n]+)\s*[({=;]", re.MULTILINE)


def sources(root):
    for path in sourcetree.files(root, sourcetree.LAYERS + sourcetree.PROGRAMS, (".h", ".cpp")):
        yield path, COMMENT_OR_STRING.sub("", sourcetree.read(os.path.join(root, path)))


def classes_in_sources(root):
    """Names of classes, each with the sources that define members of it."""
    texts = dict(sources(root))
    classes = {name for text in texts.values() for name in CLASS.findall(text)}
    found = {}
    for path, text in texts.items():
        if not path.endswith(".cpp"):
            continue
        for qualifier in MEMBER.findall(text):
            parts = qualifier.split("::")[:-1]
            while parts and parts[0] not in classes:
                parts.pop(0)  # a namespace
            if parts and all(part in classes for part in parts):
                found.setdefault("::".join(parts), set()).add(path)
    return found


def check(root):
    errors = []
    split = {name: paths for name, paths in classes_in_sources(root).items() if len(paths) > 1}
    for name, paths in sorted(split.items()):
        if paths != EXCEPTIONS.get(name):
            errors.append(f"{name}: {', '.join(sorted(paths))}")
    return errors


def self_test(tree):
    tree.write("canvas/A.h", "class A : public B\n{\n    struct Part { int x; };\n};\nnamespace N { void f(); }\n")
    tree.write("canvas/A.cpp", "const int A::SIZE(3);\nA::A() = default;\nvoid N::f()\n{\n    A::g();\n}\n")
    tree.write("canvas/Other.cpp", "// void A::f()\nvoid N::g()\n{\n}\nint other(A::Part);\n")
    assert check(tree.root) == [], check(tree.root)
    tree.write("canvas/APart.cpp", "const std::vector<A::Part>&\nA::parts(int)\n{\n}\n")
    errors = check(tree.root)
    assert errors == ["A: canvas/A.cpp, canvas/APart.cpp"], errors


if __name__ == "__main__":
    sys.exit(sourcetree.main(__doc__, check, self_test))

#!/usr/bin/env python3
"""Checks that each class is one source: check_classes.py ROOT

Prints every class whose members are defined in more than one source file, and ends 1 if there is one that may
not be. With --self-test it checks that it finds such classes in a small tree.
"""
import os
import re
import sys
import tempfile

FOLDERS = ["support", "messaging", "document", "touchui", "canvas", "panel", "library", "app", "appliance", "gallery",
           "bench"]
# A second source that stays: the tables of connections between the objects that the window owns.
EXCEPTIONS = {"TitlerWindow": {"app/TitlerWindow.cpp", "app/TitlerWindowWiring.cpp"}}

COMMENT_OR_STRING = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"', re.DOTALL)
CLASS = re.compile(r"^\s*(?:class|struct)\s+(?:[A-Z_]+\s+)?(\w+)\b[^;()]*\{", re.MULTILINE)
# Definitions begin in the first column, where no statement does.
MEMBER = re.compile(r"^(?:[A-Za-z_][\w:<>,&*\s\[\]]*?[\s&*])?((?:\w+::)+)(?:~?\w+|operator[^(\n]+)\s*[({=;]", re.MULTILINE)


def sources(root):
    for top in FOLDERS:
        for folder, _, names in sorted(os.walk(os.path.join(root, top))):
            for name in sorted(names):
                if name.endswith((".h", ".cpp")):
                    path = os.path.join(folder, name)
                    with open(path, encoding="utf-8") as stream:
                        yield os.path.relpath(path, root), COMMENT_OR_STRING.sub("", stream.read())


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


def self_test():
    with tempfile.TemporaryDirectory() as root:
        def write(path, text):
            os.makedirs(os.path.join(root, os.path.dirname(path)), exist_ok=True)
            with open(os.path.join(root, path), "w", encoding="utf-8") as stream:
                stream.write(text)

        write("canvas/A.h", "class A : public B\n{\n    struct Part { int x; };\n};\nnamespace N { void f(); }\n")
        write("canvas/A.cpp", "const int A::SIZE(3);\nA::A() = default;\nvoid N::f()\n{\n    A::g();\n}\n")
        write("canvas/Other.cpp", "// void A::f()\nvoid N::g()\n{\n}\nint other(A::Part);\n")
        assert check(root) == [], check(root)
        write("canvas/APart.cpp", "const std::vector<A::Part>&\nA::parts(int)\n{\n}\n")
        errors = check(root)
        assert errors == ["A: canvas/A.cpp, canvas/APart.cpp"], errors


def main(arguments):
    if arguments == ["--self-test"]:
        self_test()
        return 0
    if len(arguments) != 1:
        print(__doc__, file=sys.stderr)
        return 2
    errors = check(arguments[0])
    for error in errors:
        print(error)
    return 1 if errors else 0


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))

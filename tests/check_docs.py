#!/usr/bin/env python3
"""Checks that the documents name what exists: check_docs.py ROOT

In README.md, CONTRIBUTING.md and docs/*.md, what stands in backticks must be found in the sources:
 - `Class::member`: a class or namespace of the sources, and a member that it or a base class declares. A class
   that the sources do not have is passed over when its name says that it is Qt's or the standard library's.
 - `ClassName` alone: a word of the sources.
 - `tst_name`, `e2e_name`, `fuzz_replay_name`: a test, also in a block of commands.
 - `folder/file` below a folder of the sources: a file, a header without its ".h", or a folder. A part in capitals
   such as NAME/ stands for any name.
Prints every name that is not there and ends 1 if there is one. With --self-test it checks that it finds such names
in a small tree.
"""
import glob
import os
import re
import sys

import sourcetree

OTHER_FOLDERS = ["cmake", "docs", "resources", "scripts"]

COMMENT_OR_STRING = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"', re.DOTALL)
SCOPE = re.compile(r"\b(?:class|struct|namespace)\s+(?:[A-Z_]+\s+)?([\w:]+)(?:\s+final)?\s*(?::(?!:)([^;{}()]*))?\{")
ENUM = re.compile(r"\benum\s+(?:class\s+)?(\w*)[^;{}]*\{([^}]*)\}")
ENUMERATOR = re.compile(r"(\w+)\s*(?:=[^,]*)?(?:,|$)")
BASE = re.compile(r"(\w+)\s*(?:<[^{}]*>)?\s*(?:,|$)")
# The rows of a service's table, of which macros make the classes.
SERVICE_ROWS = re.compile(r"#define (\w+)_(CALLS|ANSWERS|EVENTS)\((\w+)\)((?:[^\n]*\\\n)*[^\n]*)")
MADE_OF_ROWS = {"CALLS": ["I{}", "{}RemoteProxy"],
                "ANSWERS": ["I{}CallBack", "{}CallBackAdapter", "{}CallBackRemoteProxy"],
                "EVENTS": ["I{}Notify", "{}NotifyAdapter", "{}NotifyRemoteProxy"]}

BLOCK = re.compile(r"^```.*?^```", re.MULTILINE | re.DOTALL)
IN_BACKTICKS = re.compile(r"`([^`\n]+)`")
QUALIFIED = re.compile(r"~?\b[A-Za-z_]\w*(?:::~?\w+)+")
CLASS_NAME = re.compile(r"^[A-Z]+[a-z]\w*[A-Z]\w*$")
TEST_NAME = re.compile(r"\b(tst|e2e|fuzz_replay)_(\w+)(?!\w|\*)")
PATH = re.compile(rf"(?:{'|'.join(sourcetree.FOLDERS + OTHER_FOLDERS)})/(?:(?![A-Z]+/)[\w.-]+/?)*$")
FOREIGN = re.compile(r"^(?:Q[A-Z]\w*|Qt|std|boost)$")


def end_of_braces(text, begin):
    """Where the block that begins before begin ends."""
    depth = 1
    for place in re.finditer(r"[{}]", text[begin:]):
        depth += 1 if place.group() == "{" else -1
        if depth == 0:
            return begin + place.start()
    return len(text)


def without_blocks(text):
    """The text without what stands in braces."""
    kept, depth = [], 0
    for part in re.split(r"([{}])", text):
        if part == "{":
            depth += 1
            kept.append(";")
        elif part == "}":
            depth = max(depth - 1, 0)
        elif depth == 0:
            kept.append(part)
    return "".join(kept)


def declared(body):
    """What the body of a class or namespace declares: functions, types, enumerators and data."""
    names = {name for _, enumerators in ENUM.findall(body) for name in ENUMERATOR.findall(enumerators)}
    names |= set(re.findall(r"\b(?:class|struct|enum class|enum|using|namespace)\s+(\w+)", body))
    names |= set(re.findall(r"#define (\w+)_FIELDS\(", body))  # a record
    flat, nested = without_blocks(body), None
    while flat != nested:
        flat, nested = re.sub(r"\((?:[^()]|\(\))+\)", "()", flat), flat
    flat = re.sub(r"=[^;]*;", ";", flat)
    names |= set(re.findall(r"(~?\w+)\s*(?:\(\)|(?:\[[^\]]*\])?\s*;)", flat))
    return names


class Sources:
    def __init__(self, root):
        self.members = {}  # by class or namespace
        self.bases = {}
        self.words = set()
        for path in sourcetree.files(root, sourcetree.FOLDERS, (".h", ".cpp", ".py", ".txt")):
            text = sourcetree.read(os.path.join(root, path))
            self.words.update(re.findall(r"\w+", text))
            if path.endswith((".h", ".cpp")):
                self.add_rows(text)
                self.add_scopes(COMMENT_OR_STRING.sub("", text))

    def add_scopes(self, text):
        for scope in SCOPE.finditer(text):
            name = scope.group(1).split("::")[-1]
            body = text[scope.end():end_of_braces(text, scope.end())]
            self.members.setdefault(name, set()).update(declared(body))
            self.bases.setdefault(name, set()).update(BASE.findall(scope.group(2) or ""))

        for name, enumerators in ENUM.findall(text):
            self.members.setdefault(name, set()).update(ENUMERATOR.findall(enumerators))

    def add_rows(self, text):
        for service, kind, row, rows in SERVICE_ROWS.findall(text):
            for made in MADE_OF_ROWS[kind]:
                name = made.format(service)
                self.members.setdefault(name, set()).update(re.findall(rf"\b{row}\(\d+,\s*(\w+)", rows))

    def has_member(self, name, member, seen=()):
        if name in seen:
            return False
        return member in self.members.get(name, ()) or any(
            self.has_member(base, member, (*seen, name)) for base in self.bases.get(name, ()))

    def has(self, qualified):
        scope, member = qualified.split("::")[-2:]
        if scope not in self.members:
            return bool(FOREIGN.match(qualified.split("::")[0]))
        return self.has_member(scope, member)


def has_test(root, kind, name):
    if kind == "e2e":
        return os.path.exists(os.path.join(root, "tests", "e2e", f"test_{name}.py"))
    if kind == "fuzz_replay":
        return os.path.exists(os.path.join(root, "fuzz", f"fuzz_{name}.cpp"))
    return bool(glob.glob(os.path.join(root, "tests", "*", f"tst_{name}.cpp")))


def missing_names(root, sources, text):
    blocks = BLOCK.findall(text)
    spans = IN_BACKTICKS.findall(BLOCK.sub("", text))
    for span in spans:
        yield from (name for name in QUALIFIED.findall(span) if not sources.has(name))
        if CLASS_NAME.match(span) and span not in sources.words:
            yield span
        if PATH.match(span) and not any(os.path.exists(os.path.join(root, span + end)) for end in ("", ".h")):
            yield span
    for part in spans + blocks:
        yield from (test.group() for test in TEST_NAME.finditer(part) if not has_test(root, *test.groups()))


def check(root):
    sources = Sources(root)
    errors = []
    for path in ["README.md", "CONTRIBUTING.md", "docs/*.md"]:
        for document in sorted(glob.glob(os.path.join(root, path))):
            names = sorted(set(missing_names(root, sources, sourcetree.read(document))))
            errors += [f"{os.path.relpath(document, root)}: {name}" for name in names]
    return errors


def self_test(tree):
    tree.write("canvas/ShownBase.h", "class ShownBase\n{\n    void inherited(int argument);\n};\n")
    tree.write("canvas/ShownTitle.h", "class ShownTitle : public QObject, private ShownBase\n{\npublic:\n"
               "    ~ShownTitle() override;\n    bool save() { return inner(helper()); }\n"
               "    enum class Gesture { None, Press };\n    int m_data = other(1);\n};\n"
               "namespace Motion\n{\nint step(int way, int by = other(2));\n}\n"
               "namespace Titles\n{\n#define tagPath_FIELDS(FIELD) FIELD(Wide, path)\n}\n// class Gone { void f(); };\n")
    tree.write("messaging/services/ITitler.h", "#define Titler_CALLS(CALL) \\\n    CALL(1, show, int, type) \\\n"
               "    CALL(5, hide)\n#define Titler_ANSWERS(ANSWER) \\\n    ANSWER(1, finished)\n")
    tree.write("tests/canvas/tst_shown.cpp", "")
    tree.write("tests/e2e/test_list.py", "")
    tree.write("fuzz/fuzz_title.cpp", "")
    good = ("`ShownTitle::save`, `ShownTitle::save()` and `~ShownTitle`, `ShownTitle::inherited`, `Motion::step`,\n"
            "`ShownTitle::Gesture`, `Gesture::Press`, `ShownTitle::m_data`, `QImage::save`, `std::async`,\n"
            "`ShownBase`, `ITitler::show`, `TitlerRemoteProxy::hide`, `TitlerCallBackAdapter::finished`,\n"
            "`tst_shown`, `e2e_list`, `fuzz_replay_title`, `fuzz_replay_*`, `canvas/ShownTitle.h`,\n"
            "`canvas/ShownTitle`, `tests/NAME/x`, `tests/e2e/`, `canvas/I*.h`, `build/bin/x`, `Titles::tagPath`\n"
            "Gone::f and tst_gone\n```sh\nctest -R '^e2e_list$'\n```\n")
    tree.write("README.md", good)
    tree.write("docs/GUIDE.md", good)
    assert check(tree.root) == [], check(tree.root)

    # Each of these is one error.
    bad = ["ShownTitle::inner", "ShownTitle::helper", "ShownTitle::way", "ShownTitle::other", "ShownBase::argument",
           "Gone::f", "Motion::leap", "ITitler::finished", "ShownBase::save", "ShownPage", "tst_gone", "tst_show",
           "e2e_shown", "fuzz_replay_gone", "canvas/Gone.h", "tests/gone/"]
    for name in bad:
        tree.write("docs/GUIDE.md", good + f"`{name}`\n")
        assert check(tree.root) == [f"docs/GUIDE.md: {name}"], (name, check(tree.root))
    tree.write("docs/GUIDE.md", "```sh\nctest -R e2e_gone\n```\n")
    tree.write("README.md", "`tst_gone`\n")
    assert check(tree.root) == ["README.md: tst_gone", "docs/GUIDE.md: e2e_gone"], check(tree.root)


if __name__ == "__main__":
    sys.exit(sourcetree.main(__doc__, check, self_test))

#!/usr/bin/env python3
"""Checks that every test is where it is looked for: check_tests.py ROOT

 - tests/FOLDER/tst_NAME.cpp tests a source of FOLDER: NAME, or the part of it before the first "_", is the name of a
   file or folder below FOLDER, in small letters and without signs. In tests/session/ (the whole window) and
   tests/properties/ (at random) it is a source of any folder.
 - Its class has the same name, it includes its moc output, and the CMakeLists.txt beside it registers it.
 - tests/FOLDER/test_*.py, which drive whole programs, are in tests/e2e/ and tests/faults/.
 - An interface with a fake in tests/fakes/ has no other.
 - What ONLY_IN names stands in its one file.
Prints every test that is not so and ends 1 if there is one. With --self-test it checks that it finds such tests in a
small tree.
"""
import collections
import os
import re
import sys

import sourcetree

WHOLE_PROGRAM = {"session", "properties"}
SCRIPTED = {"e2e", "faults"}
# Folders besides those of classes that have tests.
OTHER_SOURCES = ["resources", "scripts"]
FAKES = "tests/fakes/"

TEST = re.compile(r"tst_([a-z0-9]+)(_[a-z0-9]+)*\.cpp$")
DERIVED = re.compile(r"^\s*(?:class|struct)\s+(\w+)(?:\s+final)?\s*:(?!:)([^{;]*)\{", re.MULTILINE)
BASE = re.compile(r"public\s+([\w:]+)")
ONLY_IN = {
    re.compile(r"\bcreateTouchDevice\b"): {"tests/touchui/TouchDevice.h"},
    re.compile(r"(?:qEnvironment\w*|qgetenv|environ\b.*?)\(\W*TITLER_\w*SEED"): {"tests/support/RandomSeed.h",
                                                                             "tests/seededrandom.py"},
}


def small(name):
    return re.sub(r"[^a-z0-9]", "", name.lower())


def subjects(root, folder):
    """What tests of a folder may be named after."""
    found = set()
    for _, folders, names in os.walk(os.path.join(root, folder)):
        found.update(small(name) for name in folders)
        found.update(small(os.path.splitext(name)[0]) for name in names)
    return found


def check_test(root, path, known):
    folder, name = path.split("/")[1], os.path.basename(path)
    match = TEST.match(name)
    if not match:
        yield f"{path}: its name is not tst_<class>.cpp or tst_<class>_<aspect>.cpp in small letters"
        return
    if folder in WHOLE_PROGRAM:
        tested = set().union(*known.values())
    else:
        tested = known.get(folder, set())
    if match.group(1) not in tested:
        yield f"{path}: there is no source {match.group(1)} in {'any folder' if folder in WHOLE_PROGRAM else folder}"
    stem = os.path.splitext(name)[0]
    text = sourcetree.read(os.path.join(root, path))
    if not re.search(rf"^class {stem}\b", text, re.MULTILINE):
        yield f"{path}: it has no class {stem}"
    if f'#include "{stem}.moc"' not in text:
        yield f"{path}: it does not include {stem}.moc"
    registered = os.path.join(root, "tests", folder, "CMakeLists.txt")
    if not os.path.exists(registered) or not re.search(rf"\(\s*{stem}\b", sourcetree.read(registered)):
        yield f"{path}: tests/{folder}/CMakeLists.txt does not register it"


def check_fakes(texts):
    derived = collections.defaultdict(list)  # by base class: the files of the classes derived from it
    for path, text in texts.items():
        for _, bases in DERIVED.findall(text):
            for base in BASE.findall(bases):
                derived[base].append(path)
    for base, paths in sorted(derived.items()):
        # Qt's classes and the fakes themselves have subclasses for other reasons.
        if len(paths) > 1 and any(path.startswith(FAKES) for path in paths) and not base.startswith(("Q", "Fake")):
            yield f"{base}: one fake is enough: {', '.join(sorted(paths))}"


def check(root):
    known = {folder: subjects(root, folder)
             for folder in sourcetree.LAYERS + sourcetree.PROGRAMS + OTHER_SOURCES}
    errors, texts = [], {}
    for path in sourcetree.files(root, ["tests"], (".h", ".cpp", ".py")):
        name = os.path.basename(path)
        if name == os.path.basename(__file__):
            continue
        texts[path] = sourcetree.read(os.path.join(root, path))
        if name.startswith("tst_"):
            errors += check_test(root, path, known)
        elif name.startswith("test_") and path.split("/")[1] not in SCRIPTED:
            errors.append(f"{path}: tests of whole programs are in tests/e2e/ and tests/faults/")
        for pattern, places in ONLY_IN.items():
            if pattern.search(texts[path]) and path not in places:
                errors.append(f"{path}: {pattern.search(texts[path]).group()} stands in {', '.join(sorted(places))}")
    return errors + list(check_fakes({path: text for path, text in texts.items() if not path.endswith(".py")}))


def self_test(tree):
    def test(path, text=None):
        stem = os.path.splitext(os.path.basename(path))[0]
        tree.write(path, text or f'class {stem} : public QObject\n{{\n}};\n#include "{stem}.moc"\n')

    tree.write("canvas/ShownTitle.h")
    tree.write("messaging/ptc/CPack.h")
    tree.write("scripts/make-fonts")
    tree.write("tests/canvas/CMakeLists.txt", "titler_add_test(tst_showntitle x)\ntitler_add_test(tst_showntitle_disk x)\n")
    test("tests/canvas/tst_showntitle.cpp")
    test("tests/canvas/tst_showntitle_disk.cpp")
    for folder, name in (("messaging", "cpack"), ("scripts", "makefonts"), ("session", "showntitle_whole")):
        tree.write(f"tests/{folder}/CMakeLists.txt", f"titler_add_test(tst_{name} x)\n")
        test(f"tests/{folder}/tst_{name}.cpp")
    tree.write("tests/e2e/test_list.py")
    tree.write("tests/fakes/FakeHost.h", "class FakeHost : public IHost\n{\n};\n")
    tree.write("tests/canvas/Fixture.h", "class Slow : public FakeHost\n{\n};\nclass Part : public QObject\n{\n};\n")
    tree.write("tests/touchui/TouchDevice.h", "QTest::createTouchDevice()\n")
    tree.write("tests/support/RandomSeed.h", 'qEnvironmentVariable("TITLER_SEED")\n')
    tree.write("tests/seededrandom.py", 'os.environ.get("TITLER_SEED", 1)\n')
    assert check(tree.root) == [], check(tree.root)

    # Each of these is one error.
    bad = {
        "tests/canvas/tst_shown_title.cpp": "no source shown in canvas",
        "tests/canvas/tst_cpack.cpp": "no source cpack in canvas",
        "tests/session/tst_window.cpp": "no source window in any folder",
        "tests/canvas/tst_ShownTitle.cpp": "its name is not",
    }
    for path, error in bad.items():
        folder, stem = os.path.dirname(path), os.path.splitext(os.path.basename(path))[0]
        kept = sourcetree.read(os.path.join(tree.root, folder, "CMakeLists.txt"))
        tree.write(f"{folder}/CMakeLists.txt", kept + f"titler_add_test({stem} x)\n")
        test(path)
        errors = check(tree.root)
        assert len(errors) == 1 and error in errors[0], (path, errors)
        tree.write(f"{folder}/CMakeLists.txt", kept)
        os.remove(os.path.join(tree.root, path))
    test("tests/canvas/tst_showntitle_more.cpp")
    assert ["does not register" in error for error in check(tree.root)] == [True], check(tree.root)
    os.remove(os.path.join(tree.root, "tests/canvas/tst_showntitle_more.cpp"))

    good = 'class tst_showntitle : public QObject\n{\n};\n#include "tst_showntitle.moc"\n'
    texts = {
        good.replace("class tst_", "class Test_"): "no class tst_showntitle",
        good.replace("tst_showntitle.moc", "other.moc"): "does not include",
        good + "class Host : public IHost\n{\n};\n": "IHost: one fake is enough",
        good + "struct Host final : private Other,\n    public IHost {\n};\n": "IHost: one fake is enough",
        good + "device = QTest::createTouchDevice();\n": "createTouchDevice stands in",
        good + 'qEnvironmentVariableIntValue("TITLER_FUZZ_SEED");\n': "stands in tests/seededrandom.py",
        good + 'qgetenv("TITLER_SEED");\n': "stands in tests/seededrandom.py",
    }
    for text, error in texts.items():
        test("tests/canvas/tst_showntitle.cpp", text)
        errors = check(tree.root)
        assert len(errors) == 1 and error in errors[0], (text, errors)
    test("tests/canvas/tst_showntitle.cpp", good)
    tree.write("tests/canvas/test_list.py")
    assert ["whole programs" in error for error in check(tree.root)] == [True], check(tree.root)


if __name__ == "__main__":
    sys.exit(sourcetree.main(__doc__, check, self_test))

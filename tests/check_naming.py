#!/usr/bin/env python3
"""Checks how members, classes and constants are named: check_naming.py ROOT FLAGS [FOLDER...]

Runs clang-tidy's readability-identifier-naming, with the options of .clang-tidy, over one source for each folder
that includes all of its headers. FLAGS is a file with the include folders and definitions of a compilation, one a
line. Sources, benchmarks and tests are only searched for words in the old spelling of members. Prints what it finds
and ends 1; ends 77 if clang-tidy is not installed. With --self-test it checks that it finds such names.
"""
import os
import re
import shutil
import subprocess
import sys
import tempfile

import sourcetree

# Their headers are read by clang-tidy.
TIDY_FOLDERS = sourcetree.LAYERS + ["titlectl", "appliance", "gallery"]
CHECK = "readability-identifier-naming"

COMMENT_OR_STRING = re.compile(r'//[^\n]*|/\*.*?\*/|"(?:\\.|[^"\\\n])*"', re.DOTALL)
OLD_MEMBER = re.compile(r"\b[ms][A-Z]\w*\b")


def old_members(root):
    """Words that look like members without an underscore, in all sources."""
    rules = sourcetree.read(os.path.join(root, ".clang-tidy"))
    kept = re.search(r"PrivateMemberIgnoredRegexp\s+value: (\S+)", rules).group(1).split("|")
    errors = []
    for path in sourcetree.files(root, sourcetree.FOLDERS, (".h", ".cpp")):
        text = sourcetree.read(os.path.join(root, path))
        text = COMMENT_OR_STRING.sub(lambda found: "\n" * found.group().count("\n"), text)
        for number, line in enumerate(text.split("\n"), 1):
            for name in OLD_MEMBER.findall(line):
                if name not in kept:
                    errors.append(f"{path}:{number}: {name} is not spelt {name[0]}_{name[1].lower()}{name[2:]}")
    return errors


def tidy(root, flags, folder):
    """What clang-tidy says about the names in the headers of the folder."""
    headers = list(sourcetree.files(root, [folder], ".h"))
    if not headers:
        return []
    with tempfile.TemporaryDirectory() as work:
        source = os.path.join(work, folder + ".cpp")
        with open(source, "w", encoding="utf-8") as stream:
            stream.writelines(f'#include "{header}"\n' for header in headers)
        command = ["clang-tidy", "--quiet", f"--config-file={root}/.clang-tidy", f"--checks=-*,{CHECK}",
                   f"--header-filter=^{re.escape(root)}/{folder}/", source, "--", "-std=c++20", "-fsyntax-only",
                   "-I" + root] + flags
        result = subprocess.run(command, capture_output=True, text=True, check=False)
    lines = [line.replace(root + "/", "") for line in result.stdout.splitlines()]
    found = [line for line in lines if re.search(r": (warning|error): ", line)]
    if result.returncode != 0 and not found:
        found = [f"clang-tidy cannot read the headers of {folder}: {result.stderr}"]
    return found


def check(root, flags_file, folders):
    root = os.path.realpath(root)
    errors = old_members(root)
    if shutil.which("clang-tidy"):
        # The root is not a system folder, and clang has /usr/include at its place already.
        flags = [flag for flag in sourcetree.read(flags_file).split("\n")
                 if flag and flag not in ("-isystem" + root, "-isystem/usr/include")]
        for folder in folders or TIDY_FOLDERS:
            errors += tidy(root, flags, folder)
    return errors


def self_test():
    with tempfile.TemporaryDirectory() as work:
        root = os.path.realpath(work)
        here = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
        shutil.copy(os.path.join(here, ".clang-tidy"), root)
        tree = sourcetree.SmallTree(root)
        tree.write("support/A.h",
                   "class lower {\nint plain; int m_good; int mOld; int mInstance;\n"
                   "static constexpr int Limit = 1;\nstatic constexpr int MOST = 2;\n};\n"
                   "namespace Names { constexpr int oddOne = 1; }\n")
        tree.write("flags")
        flags = os.path.join(root, "flags")
        found = "\n".join(check(root, flags, []))
    assert "mOld is not spelt m_old" in found, found
    if shutil.which("clang-tidy"):
        for name in ("lower", "plain", "mOld", "Limit", "oddOne"):
            assert f"'{name}'" in found, (name, found)
    for name in ("m_good", "mInstance", "MOST", "Names"):
        assert f"'{name}'" not in found, (name, found)


def main(arguments):
    if arguments == ["--self-test"]:
        self_test()
        return 0
    if len(arguments) < 2:
        print(__doc__, file=sys.stderr)
        return 2
    errors = check(arguments[0], arguments[1], arguments[2:])
    for error in errors:
        print(error)
    if not errors and not shutil.which("clang-tidy"):
        print("clang-tidy is not installed (scripts/setup installs it): only the spelling of members was looked at")
        return 77
    return 1 if errors else 0


if __name__ == "__main__":
    sys.exit(main(sys.argv[1:]))

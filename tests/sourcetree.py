"""The source tree as the checks beside this file read it, and what their main programs share."""
import os
import sys
import tempfile

# In the order of dependence: a folder includes only from itself and from those before it.
LAYERS = ["support", "messaging", "document", "touchui", "canvas", "panel", "library", "app"]
# Above all layers, and not included by one.
PROGRAMS = ["titlectl", "appliance", "gallery", "bench"]
FOLDERS = LAYERS + PROGRAMS + ["fuzz", "tests"]


def read(path):
    with open(path, encoding="utf-8", errors="replace") as stream:
        return stream.read()


def files(root, folders, suffixes):
    """The paths, relative to root and sorted, of the files below folders whose names end with one of suffixes."""
    for top in folders:
        for folder, inner, names in os.walk(os.path.join(root, top)):
            inner.sort()
            for name in sorted(names):
                if name.endswith(suffixes):
                    yield os.path.relpath(os.path.join(folder, name), root)


class SmallTree:
    """A source tree for a self-test, below root."""

    def __init__(self, root):
        self.root = root

    def write(self, path, text=""):
        os.makedirs(os.path.join(self.root, os.path.dirname(path)), exist_ok=True)
        with open(os.path.join(self.root, path), "w", encoding="utf-8") as stream:
            stream.write(text)


def main(usage, check, self_test):
    """Runs a check over the root in the command line: check(root) returns its errors, which are printed. Runs
    self_test(tree), with an empty SmallTree, for --self-test. Returns the exit code: 0, 1 for errors, 2 for a wrong command line."""
    arguments = sys.argv[1:]
    if arguments == ["--self-test"]:
        with tempfile.TemporaryDirectory() as root:
            self_test(SmallTree(root))
        return 0
    if len(arguments) != 1:
        print(usage, file=sys.stderr)
        return 2
    root = arguments[0]
    errors = check(root)
    if next(files(root, FOLDERS, ".cpp"), None) is None:
        errors = [f"no sources under {root}"]
    for error in errors:
        print(error)
    return 1 if errors else 0

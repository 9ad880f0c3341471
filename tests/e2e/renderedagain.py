"""Renders what a titler has left once more with titlectl: the bytes of the pictures have to be the same."""
import os
import subprocess
import tempfile


def different_pictures(build, environment, root):
    """The pictures below the folder of title folders that are another, by path; those older than their title do not
    count."""
    environment = {name: value for name, value in environment.items() if name not in ("DISPLAY", "QT_QPA_PLATFORM")}
    different = []
    with tempfile.TemporaryDirectory(prefix="titler-") as out:
        done = subprocess.run([os.path.join(build, "bin", "titlectl"), "render", "--force", "--jobs", "1", "--out", out, root],
                              env=environment, check=False, capture_output=True, text=True)
        if done.returncode not in (0, 1):  # 1 says that a title could not be rendered, which some tests see to
            return [f"titlectl ended {done.returncode}: {done.stderr}"]
        for parent, _, names in os.walk(out):
            for name in names:
                new = os.path.join(parent, name)
                old = os.path.join(root, os.path.relpath(new, out))
                if _is_current(old) and _bytes(old) != _bytes(new):
                    different.append(old)
    return different


def _is_current(picture):
    title = picture.rpartition("_")[0] + ".xml"
    try:
        return os.path.getmtime(picture) >= os.path.getmtime(title)
    except OSError:
        return False


def _bytes(path):
    with open(path, "rb") as stream:
        return stream.read()

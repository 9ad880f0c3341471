"""The start of the process: what it needs from its environment."""
import os
import resource
import shutil
import subprocess
import tempfile
import unittest

import harness

DATA_PATH_EXIT = 2
TITLER = os.path.join(harness.BUILD, "bin", "titler")


class BadDataPath(unittest.TestCase):
    """Without a display: a titler that got further would say so in more than one line."""

    def setUp(self):
        self.work = tempfile.mkdtemp(prefix="titler-")
        self.addCleanup(shutil.rmtree, self.work, ignore_errors=True)

    def assert_refused(self, path, *words, **changes):
        environment = harness.session.program_environment(harness.BUILD, K2SYS_LOG_DIR=self.work, K2SYS_AC_DATA=path,
                                                          K2SYS_AC_ROOT="", **changes)
        environment.pop("DISPLAY", None)
        done = subprocess.run([TITLER], env=environment, capture_output=True, text=True, timeout=60 * harness.SLOW,
                              check=False, cwd=self.work)
        self.assertEqual((done.returncode, done.stdout), (DATA_PATH_EXIT, ""), done.stderr)
        self.assertEqual(done.stderr.count("\n"), 1, done.stderr)
        self.assertTrue(done.stderr.startswith("titler: the data path "), done.stderr)
        for word in words:
            self.assertIn(word, done.stderr)

    def test_too_long(self):
        self.assert_refused("/tmp/" + 120 * "x", "too long", "125 bytes")
        self.assert_refused("", "too long", XDG_DATA_HOME="/tmp/" + 300 * "x")

    def test_relative(self):
        self.assert_refused("some/data", "not absolute", "some/data")
        self.assert_refused("", "not absolute", XDG_DATA_HOME="some")
        self.assertEqual(os.listdir(self.work), [])

    def test_unwritable(self):
        path = os.path.join(self.work, "file")
        with open(path, "w", encoding="ascii"):
            pass
        self.assert_refused(path, "cannot be written", path)
        self.assert_refused(os.path.join(path, "data"), "cannot be written", "Not a directory")
        self.assert_refused("/proc/titler", "cannot be written")


class Descriptors(harness.TitlerTest):
    SOFT_LIMIT = 256

    def start_titler(self):
        limit = resource.getrlimit(resource.RLIMIT_NOFILE)
        resource.setrlimit(resource.RLIMIT_NOFILE, (self.SOFT_LIMIT, limit[1]))
        try:
            super().start_titler()
        finally:
            resource.setrlimit(resource.RLIMIT_NOFILE, limit)

    def test_the_soft_limit_is_raised(self):
        with open(f"/proc/{self.titler.pid}/limits", encoding="ascii") as limits:
            soft, hard = next(line.split()[3:5] for line in limits if line.startswith("Max open files"))
        self.assertEqual(int(soft), min(4096, int(hard)))


if __name__ == "__main__":
    unittest.main()

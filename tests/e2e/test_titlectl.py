"""The program titlectl on the sample titles, without a display: pictures like the titler's, what it finds and changes."""
import fcntl
import json
import os
import re
import shutil
import signal
import subprocess
import tempfile
import unittest

import harness
import samples

TITLECTL = os.path.join(harness.BUILD, "bin", "titlectl")
DONE, FINDINGS, WRONG_USE = 0, 1, 2


class Titlectl(unittest.TestCase):
    made = None

    @classmethod
    def setUpClass(cls):
        cls.made = os.environ.get("TITLER_SAMPLES")
        if cls.made is None:
            cls.made = tempfile.mkdtemp(prefix="titler-")
            cls.addClassCleanup(shutil.rmtree, cls.made, ignore_errors=True)
            samples.make(harness.BUILD, cls.made)

    def setUp(self):
        self.work = tempfile.mkdtemp(prefix="titler-")
        self.addCleanup(shutil.rmtree, self.work, ignore_errors=True)
        data = os.path.join(self.work, "d")
        samples.copy(self.made, data)
        self.environment = harness.session.program_environment(harness.BUILD, K2SYS_AC_DATA=data, K2SYS_AC_ROOT="",
                                                               K2SYS_LOG_DIR=self.work)
        for name in ("DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"):
            self.environment.pop(name, None)
        self.titles = os.path.join(data, "defaultuser", "resources", "Titles")
        self.folder = os.path.join(self.titles, "Welcome")

    def run_titlectl(self, *arguments, code=DONE):
        done = subprocess.run([TITLECTL, *arguments], env=self.environment, capture_output=True, text=True, check=False,
                              timeout=120 * harness.SLOW, cwd=self.work)
        self.assertEqual(done.returncode, code, done.stdout + done.stderr)
        self.assertIsNone(harness.SANITIZER_REPORT.search(done.stderr), done.stderr)
        return done

    def json(self, *arguments, code=DONE):
        return json.loads(self.run_titlectl(*arguments, "--json", code=code).stdout)

    @staticmethod
    def pictures(folder):
        """The bytes of the four pictures of each title below the folder, by path."""
        found = {}
        for parent, _, names in os.walk(folder):
            for name in names:
                if name.endswith(tuple(harness.PICTURES)) and "_source_" not in name:
                    with open(os.path.join(parent, name), "rb") as stream:
                        found[os.path.relpath(os.path.join(parent, name), folder)] = stream.read()
        return found

    def first_title(self):
        return os.path.join(self.folder, sorted(name for name in os.listdir(self.folder)
                                                if name.endswith(".xml") and not name.startswith("."))[0])

    def test_rendering_gives_the_bytes_of_the_titler(self):
        before = self.pictures(self.titles)
        self.assertGreater(len(before), 8)
        for jobs in ("1", "2"):
            out = os.path.join(self.work, "out" + jobs)
            self.run_titlectl("render", "--jobs", jobs, "--out", out, self.titles)
            self.assertEqual(self.pictures(out), before)
        for name in before:
            os.remove(os.path.join(self.titles, name))
        self.run_titlectl("render", self.titles)
        self.assertEqual(self.pictures(self.titles), before)

    def test_one_size(self):
        out = os.path.join(self.work, "out")
        self.run_titlectl("render", "--only", "1920", "--out", out, self.folder)
        self.assertTrue(os.listdir(out))
        self.assertTrue(all(name.endswith("_1920.png") for name in os.listdir(out)), os.listdir(out))

    def test_folders_without_faults_have_no_findings(self):
        self.assertEqual(self.json("check", self.titles)["findings"], [])

    def test_faults_are_reported(self):
        title = self.first_title()
        stem = title[:-len(".xml")]
        os.remove(stem + "_960.png")
        shutil.copy(title, os.path.join(self.folder, "unlisted.xml"))
        found = self.json("check", self.folder, code=FINDINGS)["findings"]
        self.assertEqual(sorted((one["rule"], os.path.basename(one["file"])) for one in found),
                         [("order-omits", "unlisted.xml"), ("picture-missing", os.path.basename(title))])
        self.run_titlectl("check", "--without", "order-omits,picture-missing", self.folder)

    def test_set_changes_what_show_shows(self):
        title = self.first_title()
        text = self.json("show", title)["texts"][0]
        before = self.pictures(self.folder)
        self.run_titlectl("set", title, f"{text['id']}=Neuer Text")
        after = self.json("show", title)["texts"][0]
        self.assertEqual(after["text"], "Neuer Text")
        self.assertEqual(after["runs"][0]["font"], text["runs"][0]["font"])
        changed = sorted(name for name, data in self.pictures(self.folder).items() if data != before[name])
        stem = os.path.basename(title)[:-len(".xml")]
        self.assertEqual(changed, sorted(stem + suffix for suffix in harness.PICTURES))

    def order(self, folder):
        with open(os.path.join(folder, ".order.xml"), encoding="utf-8") as stream:
            return re.findall(r'file-path="([^"]*)"', stream.read())

    def write_list(self, text, name="list.csv"):
        path = os.path.join(self.work, name)
        with open(path, "w", encoding="utf-8", newline="") as stream:
            stream.write(text)
        return path

    def test_a_list_makes_titles_and_updates_them(self):
        template = self.first_title()
        text = str(self.json("show", template)["texts"][0]["id"])
        names = self.write_list(f"No,{text}\r\n1,Anna Berg\r\n2,Bo Lind\r\n3,\"Cem, Ay\"\r\n")
        folder = os.path.join(self.titles, "Made")
        dry = self.json("make", "--dry-run", template, names, folder)
        self.assertEqual([row["outcome"] for row in dry["rows"]], ["would be made"] * 3)
        self.assertFalse(os.path.exists(folder))
        self.run_titlectl("make", "--key", "No", template, names, folder)
        first = self.order(folder)
        self.assertEqual(len(first), 3)
        shown = [self.json("show", os.path.join(folder, name))["texts"] for name in first]
        wanted = ["Anna Berg", "Bo Lind", "Cem, Ay"]
        self.assertEqual([next(one["text"] for one in texts if str(one["id"]) == text) for texts in shown], wanted)
        self.assertEqual(self.json("check", "--without", "text-outside-safe-area", folder)["findings"], [])
        before = self.pictures(folder)
        self.run_titlectl("render", folder)
        self.assertEqual(self.pictures(folder), before)

        # The same list again, with one row changed and one more.
        names = self.write_list(f"No,{text}\n3,Cem Ay\n1,Anna Berg\n4,Dora\n")
        again = self.json("make", "--key", "No", template, names, folder)
        self.assertEqual([row["outcome"] for row in again["rows"]], ["updated", "updated", "made"])
        self.assertEqual(self.order(folder)[:3], first)
        self.assertEqual(len(self.order(folder)), 4)
        self.assertEqual([name for name in os.listdir(folder) if name.startswith(".") and name != ".order.xml"], [])

    def test_a_wrong_row_stops_no_other_but_with_strict(self):
        template = self.first_title()
        text = str(self.json("show", template)["texts"][0]["id"])
        names = self.write_list(f"{text}\nAnna\n{'x' * 301}\nBo\n")
        folder = os.path.join(self.work, "made")
        done = self.run_titlectl("make", "--strict", template, names, folder, code=FINDINGS)
        self.assertIn("line 3:", done.stderr)
        self.assertFalse(os.path.exists(folder))
        done = self.run_titlectl("make", template, names, folder, code=FINDINGS)
        self.assertIn("line 3:", done.stderr)
        self.assertEqual(len(self.order(folder)), 2)
        self.run_titlectl("make", template, os.path.join(self.work, "none.csv"), folder, code=WRONG_USE)

    def test_sheet(self):
        for name, begin in (("sheet.pdf", b"%PDF-"), ("sheet.png", b"\x89PNG")):
            path = os.path.join(self.work, name)
            self.run_titlectl("sheet", self.folder, path)
            with open(path, "rb") as stream:
                self.assertTrue(stream.read().startswith(begin))

    def test_an_open_folder_is_refused(self):
        descriptor = os.open(self.folder, os.O_RDONLY)
        self.addCleanup(os.close, descriptor)
        fcntl.flock(descriptor, fcntl.LOCK_EX)  # as the titler holds it
        before = self.pictures(self.folder)
        for arguments in (("render", self.folder), ("set", self.first_title(), "1=x"), ("check", self.folder)):
            self.assertIn("--force", self.run_titlectl(*arguments, code=WRONG_USE).stderr)
        self.assertEqual(self.pictures(self.folder), before)
        self.run_titlectl("render", "--force", self.folder)

    def test_killed_while_rendering_leaves_whole_pictures(self):
        before = self.pictures(self.titles)
        for delay in range(1, 6):
            process = subprocess.Popen([TITLECTL, "render", "--jobs", "2", self.titles], env=self.environment,
                                       stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, start_new_session=True)
            try:
                process.wait(delay * 0.1)
            except subprocess.TimeoutExpired:
                os.killpg(process.pid, signal.SIGKILL)
                process.wait()
            self.assertEqual(self.pictures(self.titles), before)

    def test_wrong_use(self):
        for arguments in ((), ("paint",), ("render",), ("render", "--fast", self.folder), ("check", "/nowhere")):
            done = self.run_titlectl(*arguments, code=WRONG_USE)
            self.assertTrue(done.stderr.startswith("titlectl: "), done.stderr)
            self.assertEqual(done.stdout, "")

    def test_help_needs_no_titles(self):
        self.assertIn("render", self.run_titlectl("--help").stdout)
        page = self.run_titlectl("--man-page").stdout
        self.assertTrue(page.startswith(".TH TITLECTL 1"))
        completion = os.path.join(self.work, "completion")
        with open(completion, "w", encoding="utf-8") as stream:
            stream.write(self.run_titlectl("--completion").stdout)
        subprocess.run(["bash", "-n", completion], check=True)


if __name__ == "__main__":
    unittest.main()

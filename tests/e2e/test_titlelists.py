"""Titles from lists: what is made of each format, and what stays of it in the window, after kills and on a full disk.
TITLER_KILLS is the number of kills."""
import json
import os
import shutil
import signal
import subprocess
import unittest

import harness
import longfolder
import titlectlhands
from seededrandom import SeededRandom
from titlectlhands import DONE, FINDINGS, TITLECTL, WRONG_USE, TitlectlHands, TitlectlTest

KILLS = int(os.environ.get("TITLER_KILLS", "5"))
SCRIPTS = ("Élections in Århus", "晚间新闻 记者 王芳", "속보 김민준 기자", "速報 さくら タロウ")
BAD_ROW = 17
FIT_WIDTH, SIZE, SMALLEST = 600, 96, 10
RASTER_OF_CANVAS = 1.5
# Where titles of this name may stand; that they reach beyond the safe area is no matter here.
NOT_CHECKED = "text-outside-safe-area,text-cut-off"
MOST_ROWS = 100_000
MOST_MEMORY = 400  # MB


def rows_of_forty():
    """A header and forty rows: four scripts, a row with signs of the format, and one that cannot be used."""
    rows = [["No", "Name", "Role"]]
    for number in range(1, 41):
        rows.append([str(number), f"{SCRIPTS[number % 4]} {number}", f"Role {number}"])
    rows[5] = ["5", 'Rita "Rio" Ray', "Camera; sound,\nlight\t & <more>"]
    rows[BAD_ROW][2] = "x" * 301
    return rows


def wanted_texts(rows):
    good = [row for row in rows[1:] if row[0] != str(BAD_ROW)]
    return [{"1": row[1], "2": row[2].replace("\t", " ")} for row in good]


class FortyRows:
    """Mixed into a test case with titlectl: a template with two named texts, and a list of forty rows."""

    def template(self):
        path = os.path.join(self.work, "strap.xml")
        folder = os.path.join(self.root, "Welcome")
        stem = self.order(folder)[0].removesuffix(".xml")
        for name in os.listdir(folder):
            if name.startswith(stem):
                shutil.copy(os.path.join(folder, name), os.path.join(self.work, name))
        os.rename(os.path.join(self.work, stem + ".xml"), path)
        self.write("strap.fields.json", json.dumps({"fields": {"1": {"name": "Name"}, "2": {"name": "Role"}}}))
        return path

    def lists(self, rows):
        """The list in each format by its ending, with the number that names the bad row."""
        self.write("list.csv", "\ufeff" + titlectlhands.csv_text(rows))
        self.write("semicolons.csv", titlectlhands.csv_text(rows, ";"))
        self.write("list.tsv", titlectlhands.csv_text(rows, "\t"))
        self.write("list.json", titlectlhands.json_text(rows))
        titlectlhands.write_workbook(os.path.join(self.work, "list.xlsx"), rows)
        # A line for each row and one more for the line break in the fifth; five lines for each object.
        line = BAD_ROW + 2
        return {"list.csv": line, "semicolons.csv": line, "list.tsv": line, "list.json": 2 + 5 * (BAD_ROW - 1),
                "list.xlsx": BAD_ROW + 1}


class Lists(FortyRows, TitlectlTest):
    def test_each_format_gives_the_same_titles(self):
        template, rows = self.template(), rows_of_forty()
        for name, bad_line in self.lists(rows).items():
            with self.subTest(list=name):
                folder = os.path.join(self.root, "Names " + name)
                done = self.run_titlectl("make", template, os.path.join(self.work, name), folder, "--key", "No",
                                         code=FINDINGS)
                self.assertEqual(done.stderr, f'titlectl: line {bad_line}: field "Role" has 301 characters, '
                                              "300 is the limit\n")
                self.assertEqual(done.stdout, "39 of 40 rows made\n")
                self.assertEqual(self.texts(folder), wanted_texts(rows))
                self.assertEqual(self.json("check", folder, "--without", NOT_CHECKED)["findings"], [])

    def test_a_wrong_row_of_a_csv_stops_no_other(self):
        rows = rows_of_forty()
        lines = titlectlhands.csv_text(rows).split("\r\n")
        lines[9] = '9,"never closed,x'  # behind a row of two lines
        done = self.run_titlectl("make", self.template(), self.write("list.csv", "\r\n".join(lines)),
                                 os.path.join(self.root, "Names"), "--json", code=FINDINGS)
        wrong = [row for row in json.loads(done.stdout)["rows"] if row["outcome"] == "wrong"]
        self.assertEqual([row["line"] for row in wrong], [11, BAD_ROW + 2])

    def test_names_of_any_length_stay_within_their_width(self):
        longfolder.write_title(self.work, "name", "Name")
        template = os.path.join(self.work, "name.xml")
        letters = "Wilhelmine Müller-Ångström von und zu Île d'Or 快讯 記者 속보 "
        names = [(letters * 2)[:length - 1].rstrip().ljust(length, "x") for length in range(5, 61)]
        rows = self.write("names.csv", titlectlhands.csv_text([["1"]] + [[name] for name in names]))
        plain, fitted = os.path.join(self.work, "plain"), os.path.join(self.work, "fitted")
        self.run_titlectl("make", template, rows, plain)
        fit = {"width": FIT_WIDTH, "smallest": SMALLEST}
        self.write("name.fields.json", json.dumps({"fields": {"1": {"fit": fit}}}))
        self.run_titlectl("make", template, rows, fitted)
        unchanged = 0
        for name, file in zip(names, self.order(fitted)):
            picture = file.replace(".xml", "_1920.png")
            before, after = (harness.pngdiff("alpha", os.path.join(folder, picture))["width"] for folder in (plain, fitted))
            self.assertLessEqual(after, FIT_WIDTH * RASTER_OF_CANVAS, name)
            sizes = {run["size"] for run in self.json("show", os.path.join(fitted, file))["texts"][0]["runs"]}
            self.assertEqual(len(sizes), 1, name)
            # A little is left for text that is laid out at another scale.
            if before <= FIT_WIDTH * RASTER_OF_CANVAS - 9:
                self.assertEqual(sizes, {SIZE}, name)
                self.assertEqual(self.read(fitted, picture), self.read(plain, picture), name)
                unchanged += 1
            else:
                self.assertGreater(after, FIT_WIDTH * RASTER_OF_CANVAS * 0.9, name)
        self.assertGreater(unchanged, 3)
        self.assertLess(unchanged, len(names) - 20)

    @staticmethod
    def read(folder, name):
        with open(os.path.join(folder, name), "rb") as stream:
            return stream.read()

    def test_the_longest_list(self):
        longfolder.write_title(self.work, "name", "Name")
        arguments = ("make", "--dry-run", os.path.join(self.work, "name.xml"))
        folder = os.path.join(self.work, "made")
        for rows, code in ((MOST_ROWS, DONE), (MOST_ROWS + 1, WRONG_USE)):
            path = self.write("long.csv", "1\n" + "".join(f"Name of row {row}\n" for row in range(rows)))
            with open(os.path.join(self.work, "output"), "w+b") as output:
                process = subprocess.Popen([TITLECTL, *arguments, path, folder], env=self.titlectl_environment(),
                                           stdout=output, stderr=output)
                _, status, usage = os.wait4(process.pid, 0)
                process.returncode = os.waitstatus_to_exitcode(status)
                output.seek(0)
                text = output.read().decode()
            self.assertEqual(process.returncode, code, text[-1000:])
            print(f"{rows} rows: {usage.ru_maxrss / 1024:.0f} MB, {usage.ru_utime + usage.ru_stime:.1f} s", flush=True)
            self.assertLess(usage.ru_maxrss / 1024, MOST_MEMORY * harness.SLOW)
        self.assertIn(f"The list has more than {MOST_ROWS} rows", text)


class Kills(FortyRows, TitlectlTest):
    """A titlectl that is killed at any moment of its work, with the processes that it has started."""

    TURNS = 4  # of one folder

    def names(self, turn):
        """Each turn changes all rows of the one before and adds one."""
        rows = [["No", "Name", "Role"]]
        for number in range(9 + turn % self.TURNS):
            rows.append([str(number), f"Name {number} of {turn}", SCRIPTS[number % 4]])
        return rows

    def arguments(self, rows, folder):
        return "make", "--key", "No", self.template(), self.write("list.csv", titlectlhands.csv_text(rows)), folder

    def kill(self, arguments, seconds):
        """Returns whether the process was still running then."""
        process = subprocess.Popen([TITLECTL, *arguments], env=self.titlectl_environment(), stdout=subprocess.DEVNULL,
                                   stderr=subprocess.DEVNULL, start_new_session=True)
        try:
            process.wait(seconds)
            return False
        except subprocess.TimeoutExpired:
            os.killpg(process.pid, signal.SIGKILL)
            process.wait()
            return True

    def assert_titles_are_whole(self, folder, texts):
        """Each title that the order names is one of the wanted ones. A kill between its files leaves pictures that are
        older than the title, of one title at most."""
        for found in self.texts(folder):
            self.assertIn(found, texts)
        rules = NOT_CHECKED + ",order-omits,leftover"
        found = json.loads(subprocess.run([TITLECTL, "check", "--json", "--without", rules, folder],
                                          env=self.titlectl_environment(), stdout=subprocess.PIPE, check=False).stdout)
        self.assertEqual([one for one in found["findings"] if one["rule"] != "picture-old"], [])
        self.assertLessEqual(len({one["file"] for one in found["findings"]}), 1, found)

    def test_titles_are_whole_after_a_kill_at_any_moment(self):
        rng = SeededRandom()
        folder = os.path.join(self.root, "Names")
        order, killed = [], 0
        for turn in range(KILLS):
            with self.subTest(turn=turn, seed=rng.first_seed):
                if turn % self.TURNS == 0 and os.path.exists(folder):
                    shutil.rmtree(folder)
                    order = []
                rows = self.names(turn)
                before = wanted_texts(self.names(turn - 1))
                arguments = self.arguments(rows, folder)
                planned = [row["title"] + ".xml" for row in self.json(*arguments, "--dry-run")["rows"]]
                killed += self.kill(arguments, rng.uniform(0.02, 1.5) * harness.SLOW)
                if os.path.exists(os.path.join(folder, ".order.xml")):
                    self.assertIn(self.order(folder), (order, planned))
                    self.assert_titles_are_whole(folder, before + wanted_texts(rows))
                self.run_titlectl(*arguments)
                order = self.order(folder)
                self.assertEqual(order, planned)
                self.assertEqual(self.texts(folder), wanted_texts(rows))
                self.assertEqual(self.json("check", folder, "--without", NOT_CHECKED)["findings"], [])
                self.assertEqual({name for name in os.listdir(folder) if name.startswith(".")}, {".order.xml"})
        print(f"{killed} of {KILLS} were still at work", flush=True)
        self.assertGreater(killed, 0)


@unittest.skipUnless(os.geteuid() == 0, "only the superuser can mount a file system")
class FullDisk(FortyRows, TitlectlTest):
    def mount(self, folder, options):
        mounted = subprocess.run(["mount", "-t", "tmpfs", "-o", options, "tmpfs", folder], check=False, capture_output=True)
        if mounted.returncode != 0:
            self.skipTest("no file system can be mounted here")

    def test_what_has_no_room_is_named_and_made_later(self):
        disk = os.path.join(self.work, "disk")
        os.makedirs(disk)
        self.mount(disk, "size=3m")
        self.addCleanup(subprocess.run, ["umount", "-l", disk], check=True)
        folder = os.path.join(disk, "Names")
        rows = [row for row in rows_of_forty() if row[0] != str(BAD_ROW)]
        arguments = ("make", "--key", "No", self.template(), self.write("list.csv", titlectlhands.csv_text(rows)), folder)
        done = self.run_titlectl(*arguments, code=FINDINGS)
        self.assertIn("No space left on device", done.stderr)
        made = self.texts(folder)
        self.assertGreater(len(made), 0)
        self.assertLess(len(made), 39)
        self.assertEqual(len(done.stderr.splitlines()), 39 - len(made))
        for texts in made:
            self.assertIn(texts, wanted_texts(rows))
        self.assertEqual(self.json("check", folder, "--without", NOT_CHECKED)["findings"], [])

        # A title that is changed has its files or keeps the old ones.
        title = os.path.join(folder, self.order(folder)[0])
        before = self.pictures(folder)
        with open(os.path.join(disk, "filler"), "wb", buffering=0) as filler:
            try:
                while True:
                    filler.write(bytes(1 << 12))
            except OSError:
                pass
        self.assertIn("No space left on device", self.run_titlectl("set", title, "1=Other", code=FINDINGS).stderr)
        self.assertEqual(self.pictures(folder), before)
        self.assertEqual(self.texts(folder), made)

        os.remove(os.path.join(disk, "filler"))
        subprocess.run(["mount", "-o", "remount,size=200m", disk], check=True)
        self.run_titlectl(*arguments)
        self.assertCountEqual(self.texts(folder), wanted_texts(rows))
        self.assertEqual(self.json("check", folder, "--without", NOT_CHECKED)["findings"], [])


class InTheWindow(FortyRows, TitlectlHands, harness.TitlerTest):
    def setUp(self):
        super().setUp()
        self.root = os.path.dirname(self.folder())

    def test_the_window_shows_what_a_list_made(self):
        rows = rows_of_forty()
        template = self.template()
        path = self.write("list.csv", "\ufeff" + titlectlhands.csv_text(rows))
        folder = self.folder("Names")
        self.run_titlectl("make", template, path, folder, "--key", "No", code=FINDINGS)
        before, order = self.pictures(folder), self.order(folder)
        titles = self.titles(folder)
        for number in (0, 20, 38):
            self.open_title(titles[number])
            self.assert_canvas_shows(titles[number], mean=1.0, visible=0.01)
            self.screenshot(f"names-{number}.png")
            refused = self.run_titlectl("make", template, path, folder, "--key", "No", code=WRONG_USE)
            self.assertIn("--force", refused.stderr)
            self.close_window()
        self.assertEqual(self.order(folder), order)
        self.assertEqual(self.pictures(folder), before)
        self.assert_no_leftovers(folder)


if __name__ == "__main__":
    unittest.main()

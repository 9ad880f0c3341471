"""The program titlectl on the sample titles, without a display: pictures like the titler's, what it finds and changes."""
import fcntl
import os
import re
import shutil
import signal
import subprocess
import unittest

import harness
import longfolder
from titlectlhands import FINDINGS, TITLECTL, WRONG_USE, TitlectlTest


class Titlectl(TitlectlTest):
    def test_rendering_gives_the_bytes_of_the_titler(self):
        before = self.pictures(self.root)
        self.assertGreater(len(before), 8)
        for jobs in ("1", "2"):
            out = os.path.join(self.work, "out" + jobs)
            self.run_titlectl("render", "--jobs", jobs, "--out", out, self.root)
            self.assertEqual(self.pictures(out), before)
        for name in before:
            os.remove(os.path.join(self.root, name))
        self.run_titlectl("render", self.root)
        self.assertEqual(self.pictures(self.root), before)

    def test_one_size(self):
        out = os.path.join(self.work, "out")
        self.run_titlectl("render", "--only", "1920", "--out", out, self.folder)
        self.assertTrue(os.listdir(out))
        self.assertTrue(all(name.endswith("_1920.png") for name in os.listdir(out)), os.listdir(out))

    def test_pictures_of_folders_of_the_same_name_are_not_mixed(self):
        other = shutil.copytree(self.folder, os.path.join(self.work, "other", "Welcome"))
        out = os.path.join(self.work, "out")
        self.assertIn("Welcome", self.run_titlectl("render", "--out", out, self.folder, other, code=WRONG_USE).stderr)
        self.assertFalse(os.path.exists(out))

    def test_what_killed_processes_left_is_removed(self):
        with open(os.path.join(self.folder, ".titler-new-1-1-1"), "w", encoding="ascii") as stream:
            stream.write("half")
        os.mkdir(os.path.join(self.folder, ".titlectl-abcdef"))
        self.run_titlectl("check", "--without", "text-outside-safe-area", self.folder, code=FINDINGS)
        self.run_titlectl("set", self.first_title(), "1=Text")
        self.assertEqual([name for name in os.listdir(self.folder) if name.startswith(".")], [".order.xml"])

    def test_folders_without_faults_have_no_findings(self):
        self.assertEqual(self.json("check", self.root)["findings"], [])

    def test_faults_are_reported(self):
        title = self.first_title()
        stem = title[:-len(".xml")]
        os.remove(stem + "_960.png")
        shutil.copy(title, os.path.join(self.folder, "unlisted.xml"))
        found = self.json("check", self.folder, code=FINDINGS)["findings"]
        self.assertEqual(sorted((one["rule"], os.path.basename(one["file"])) for one in found),
                         [("order-omits", "unlisted.xml"), ("picture-missing", os.path.basename(title))])
        self.run_titlectl("check", "--without", "order-omits,picture-missing", self.folder)

    def made_folder(self, rows):
        """A folder of titles with one text and without a background, but for the last one, which is on black."""
        longfolder.write_title(self.work, "one", "One")
        harness.session.write_png(os.path.join(self.work, "black.png"), 192, 108, bytes(192 * 108 * 3))
        lines = ["1,picture"] + [f"Row {row}," for row in range(rows - 1)] + ["Row on black,black.png"]
        folder = os.path.join(self.root, "Made")
        self.run_titlectl("make", os.path.join(self.work, "one.xml"), self.write("rows.csv", "\n".join(lines)), folder)
        return folder

    def test_one_fault_of_each_kind(self):
        folder = self.made_folder(20)
        self.assertEqual(self.json("check", folder)["findings"], [])
        order = self.order(folder)
        wanted = []

        def change(number, rule, pattern, text):
            path = os.path.join(folder, order[number])
            with open(path, encoding="utf-8") as stream:
                before = stream.read()
            after = re.sub(pattern, text, before, flags=re.DOTALL)
            self.assertNotEqual(after, before)
            with open(path, "w", encoding="utf-8") as stream:
                stream.write(after)
            wanted.append((rule, order[number], "" if "<content" not in after else "text 1"))

        change(0, "font-missing", r' font="KST"', ' font="No Such Font"')
        change(1, "glyph-missing", r'<text-item text="R"', '<text-item text="\U000F0000"')
        change(2, "text-empty", r'<text-item text="[^"]*"', '<text-item text=" "')
        change(3, "text-empty", r'<meta-text.*</meta-text>', '<meta-text content-count="0" />')
        change(4, "text-invisible", r' size="96"', ' size="0"')
        change(19, "text-invisible", r' color="#FFFFFF"', ' color="#000000"')
        change(5, "text-outside", r'position-X="60"', 'position-X="4000"')
        change(6, "text-cut-off", r'position-Y="60"', 'position-Y="-60"')
        change(7, "text-outside-safe-area", r'position-X="60"', 'position-X="-20"')
        self.run_titlectl("render", folder)

        def add(rule, name, what="", file=None):
            wanted.append((rule, file or name, what))
            return os.path.join(folder, name)

        stems = [name.removesuffix(".xml") for name in order]
        with open(add("title-unreadable", order[8]), "w", encoding="utf-8") as stream:
            stream.write("<manifest")
        os.remove(add("picture-missing", stems[9] + "_960.png", "picture 960", order[9]))
        os.truncate(add("picture-torn", stems[10] + "_1920.png", "picture 1920", order[10]), 500)
        shutil.copy(os.path.join(folder, stems[11] + "_960.png"),
                    add("picture-size", stems[11] + "_240.png", "picture 240", order[11]))
        os.utime(add("picture-old", stems[12] + "_240S.png", "picture 240 on black", order[12]), (0, 0))
        rows = order[:13] + order[14:] + ["gone.xml", order[15]]
        longfolder.write_order(folder, [name.removesuffix(".xml") for name in rows])
        wanted += [("order-omits", order[13], ""), ("order-names-missing", ".order.xml", "gone.xml"),
                   ("order-names-missing", ".order.xml", order[15])]
        os.mkdir(add("leftover", ".titlectl-abcdef"))
        for name in ("other_960.png", ".titler-new-1-1-1"):
            shutil.copy(os.path.join(folder, stems[9] + "_240.png"), add("leftover", name))
        found = self.json("check", folder, code=FINDINGS)["findings"]
        self.assertCountEqual([(one["rule"], os.path.basename(one["file"]), one["object"]) for one in found], wanted)
        self.assertTrue(all(one["reason"] for one in found))
        rules = {rule["id"] for rule in self.json("check", "--rules")}
        self.assertEqual(rules - {rule for rule, _, _ in wanted}, {"order-unreadable"})

        os.truncate(os.path.join(folder, ".order.xml"), 200)
        found = self.json("check", folder, code=FINDINGS)["findings"]
        self.assertIn(("order-unreadable", ".order.xml"), [(one["rule"], os.path.basename(one["file"])) for one in found])

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

    def test_a_list_makes_titles_and_updates_them(self):
        template = self.first_title()
        text = str(self.json("show", template)["texts"][0]["id"])
        names = self.write("list.csv", f"No,{text}\r\n1,Anna Berg\r\n2,Bo Lind\r\n3,\"Cem, Ay\"\r\n")
        folder = os.path.join(self.root, "Made")
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
        names = self.write("list.csv", f"No,{text}\n3,Cem Ay\n1,Anna Berg\n4,Dora\n")
        again = self.json("make", "--key", "No", template, names, folder)
        self.assertEqual([row["outcome"] for row in again["rows"]], ["updated", "updated", "made"])
        self.assertEqual(self.order(folder)[:3], first)
        self.assertEqual(len(self.order(folder)), 4)
        self.assertEqual([name for name in os.listdir(folder) if name.startswith(".") and name != ".order.xml"], [])

    def test_a_wrong_row_stops_no_other_but_with_strict(self):
        template = self.first_title()
        text = str(self.json("show", template)["texts"][0]["id"])
        names = self.write("list.csv", f"{text}\nAnna\n{'x' * 301}\nBo\n")
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
        before = self.pictures(self.root)
        for delay in range(1, 6):
            process = subprocess.Popen([TITLECTL, "render", "--jobs", "2", self.root],
                                       env=self.titlectl_environment(),
                                       stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, start_new_session=True)
            try:
                process.wait(delay * 0.1)
            except subprocess.TimeoutExpired:
                os.killpg(process.pid, signal.SIGKILL)
                process.wait()
            self.assertEqual(self.pictures(self.root), before)

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

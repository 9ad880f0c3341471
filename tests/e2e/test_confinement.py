"""What other programs ask for and leave in files does not lead the titler outside of its folders, and nobody else may
write what it makes."""
import os
import shutil
import unittest

import harness
import wire

TEXT = "Ours alone"


def entries(*roots):
    """Every file and folder below the roots, with what tells whether it was made anew since."""
    found = {}
    for root in roots:
        for folder, folders, files in os.walk(root):
            for name in folders + files:
                path = os.path.join(folder, name)
                found[path] = os.lstat(path).st_ino
    return found


class OutsidePaths(harness.TitlerTest):
    def setUp(self):
        super().setUp()
        self.outside = os.path.join(self.work, "elsewhere", "Welcome")
        shutil.copytree(self.folder(), self.outside)
        # At Close, three of the four titles would be counted as deleted.
        title = self.titles(self.outside)[0]
        row = f'<index value="0" file-path="{os.path.basename(title.path)}" />'
        self.write_order(self.outside, row)
        self.before = wire.snapshot(self.outside)

    @staticmethod
    def write_order(folder, rows):
        with open(os.path.join(folder, ".order.xml"), "w", encoding="utf-8") as stream:
            stream.write(f'<manifest type="order">{rows}</manifest>')

    def refusals(self):
        with open(os.path.join(self.keep, "k2_ope_debug.log"), encoding="utf-8") as stream:
            return [line for line in stream if "[ConfinedPath]" in line]

    def test_requests_outside_open_nothing(self):
        os.symlink(self.outside, self.folder("link"))
        requests = [self.outside, self.titles(self.outside)[0].path, self.folder("link"),
                    os.path.join(self.folder(), "..", "..", "..", "..", "..", "elsewhere", "Welcome")]
        for number, path in enumerate(requests, 1):
            with self.subTest(path=path):
                start = self.appliance.mark()
                self.command(f'edit "{path}"')
                harness.session.wait_until(lambda wanted=number: len(self.refusals()) == wanted, 20 * harness.SLOW,
                                           "the line in the log")
                self.wait_hidden()
                self.assertEqual(self.calls("FileManagerController", "titlerEditStatus", start), [])
        self.assertEqual(wire.snapshot(self.outside), self.before)
        # And the next request is served.
        self.open_title(self.titles(self.folder())[0])
        self.close_window()
        self.assertEqual(wire.snapshot(self.outside), self.before)

    def test_rows_and_links_outside_are_not_edited(self):
        folder = self.folder()
        own = [os.path.basename(title.path) for title in self.titles(folder)]
        foreign = os.path.relpath(self.titles(self.outside)[0].path, folder)
        os.symlink(self.titles(self.outside)[0].path, os.path.join(folder, "link.xml"))
        rows = "".join(f'<index value="{i}" file-path="{name}" />' for i, name in enumerate([foreign, "link.xml", *own]))
        self.write_order(folder, rows)
        # The big picture of the first title is a link, too.
        big = harness.Title(os.path.join(folder, own[0])).picture("_1920.png")
        victim = os.path.join(self.work, "victim")
        shutil.move(big, victim)
        os.symlink(victim, big)
        with open(victim, "rb") as stream:
            kept = stream.read()
        self.command(f'edit "{folder}"')
        self.wait_shown()
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {TEXT}")
        self.display.wait_until_still()
        self.close_window()
        self.assertEqual(wire.snapshot(self.outside), self.before)
        self.assertIn(TEXT, harness.Title(os.path.join(folder, own[0])).texts())
        self.assertFalse(os.path.islink(big))
        with open(victim, "rb") as stream:
            self.assertEqual(stream.read(), kept)


class WideUmask(harness.TitlerTest):
    def start_titler(self):
        before = os.umask(0)
        try:
            super().start_titler()
        finally:
            os.umask(before)

    def test_nobody_else_may_write_what_is_made(self):
        roots = (self.base, self.keep)
        before = entries(self.base)
        folder = self.folder()
        self.open_title(self.titles(folder)[0])
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {TEXT}")
        self.display.wait_until_still()
        self.create_in_list(0)
        self.wait_titles(folder, 5)
        self.choose_in_list_menu(0, "Save as Template")
        self.leave_templates("Cancel")
        self.close_window()
        start = self.appliance.mark()
        self.command("sub")
        self.wait_picker()
        self.click_picker("New Folder")
        self.wait_keyboard(start)
        self.command("key Enter")
        harness.session.wait_until(lambda: len(self.folders()) == 3, 20 * harness.SLOW, "the new folder")
        self.click_picker("Cancel")
        self.wait_hidden()
        made = [path for path, inode in entries(*roots).items() if before.get(path) != inode]
        own = [path for path in made if not path.startswith(self.keep) or "k2_ope" in path]
        self.assertGreater(len(own), 15)
        self.assertTrue(any(path.endswith("k2_ope_debug.log") for path in own))
        for path in own:
            with self.subTest(path=path):
                mode = os.lstat(path).st_mode & 0o7777
                self.assertEqual(mode & 0o022, 0, oct(mode))
                if "k2_ope" in path:
                    self.assertEqual(mode, 0o640)


if __name__ == "__main__":
    unittest.main()

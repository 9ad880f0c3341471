"""A disk that fills up under an operator's hands: a small file system of its own, so only the superuser can run this."""
import os
import subprocess
import unittest

import harness
import session
import wire

TITLE_REFUSED = 114
CONFIRM_CLOSE = 117
CANCEL, OK = 1, 2
DISK_SIZE = "48m"


@unittest.skipUnless(os.geteuid() == 0, "only the superuser can mount a file system")
class FullDisk(harness.TitlerTest):
    def provision(self):
        data = self.environment["K2SYS_AC_DATA"]
        os.makedirs(data)
        mounted = subprocess.run(["mount", "-t", "tmpfs", "-o", "size=" + DISK_SIZE, "tmpfs", data], check=False,
                                 capture_output=True)
        if mounted.returncode != 0:
            self.skipTest("no file system can be mounted here")
        self.addCleanup(subprocess.run, ["umount", "-l", data], check=True)
        samples = os.path.join(self.work, "samples")
        self.environment["K2SYS_AC_DATA"] = samples
        super().provision()
        self.environment["K2SYS_AC_DATA"] = data
        subprocess.run(["cp", "-a", samples + "/.", data], check=True)
        return os.path.join(data, "defaultuser") + "/"

    def fill(self):
        with open(os.path.join(self.environment["K2SYS_AC_DATA"], "filler"), "wb", buffering=0) as filler:
            for size in (1 << 20, 1 << 12):
                try:
                    while True:
                        filler.write(bytes(size))
                except OSError:
                    pass

    def make_room(self):
        os.remove(os.path.join(self.environment["K2SYS_AC_DATA"], "filler"))

    def snapshot(self, folder):
        """The bytes of every file of the folder by name, once no version is kept that waits for the disk."""
        session.wait_until(lambda: not wire.kept_versions(folder), 60 * harness.SLOW, "the disk to take the folder")
        files = {}
        for name in sorted(os.listdir(folder)):
            with open(os.path.join(folder, name), "rb") as stream:
                files[name] = stream.read()
        return files

    def type_text(self, text):
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command("string " + text)
        self.display.wait_until_still()

    def wait_messages(self, start, wanted):
        session.wait_until(lambda: self.posted_messages(start) == wanted, 20 * harness.SLOW, f"messages {wanted}")

    def test_nothing_is_lost_and_nothing_is_silent(self):
        folder = self.folder()
        title = self.titles(folder)[0]
        before = self.snapshot(folder)
        self.open_title(title)
        self.fill()
        start = self.appliance.mark()
        self.type_text("first")
        self.click_tool("Close")
        self.wait_messages(start, [TITLE_REFUSED, CONFIRM_CLOSE])
        question = self.calls("MessageCenter", "postMessage", start)[-1]["text"]
        self.assertIn("Not saved: ", question)
        self.command(f"message-close {CONFIRM_CLOSE} {CANCEL}")
        self.stays_shown()
        self.display.wait_until_still()
        self.screenshot("refused.png")
        self.assertEqual(self.snapshot(folder), before)

        # With room again it is saved without anybody's doing.
        self.make_room()
        self.wait_text(title, "first")
        self.close_window()
        self.assertEqual(self.posted_messages(start), [TITLE_REFUSED, CONFIRM_CLOSE])
        self.wait_no_leftovers(folder)
        self.assert_pictures_have_their_sizes(title)
        self.assertEqual(set(self.snapshot(folder)), set(before))

    def test_what_is_given_up_leaves_the_old_files(self):
        folder = self.folder()
        title = self.titles(folder)[0]
        before = self.snapshot(folder)
        self.open_title(title)
        self.fill()
        start = self.appliance.mark()
        self.type_text("never")
        self.click_tool("Close")
        self.wait_messages(start, [TITLE_REFUSED, CONFIRM_CLOSE])
        self.command(f"message-close {CONFIRM_CLOSE} {OK}")
        self.wait_closed(start)
        self.assertEqual(self.snapshot(folder), before)
        self.make_room()
        self.open_title(title)
        self.assert_canvas_shows(title, mean=1.0, visible=0.01)

    def test_deleting_on_a_full_disk_costs_no_title(self):
        folder = self.folder()
        titles = self.titles(folder)
        before = self.snapshot(folder)
        self.open_title(titles[0])
        self.fill()
        start = self.appliance.mark()
        self.choose_in_list_menu(1, "Delete")
        self.wait_messages(start, [TITLE_REFUSED])
        self.click_tool("Close")
        self.wait_messages(start, [TITLE_REFUSED, CONFIRM_CLOSE])
        self.command(f"message-close {CONFIRM_CLOSE} {OK}")
        self.wait_closed(start)
        self.make_room()
        self.command(f'edit "{folder}"')
        self.wait_shown()
        self.close_window()
        self.wait_no_leftovers(folder)
        self.assertEqual(self.snapshot(folder), before)


if __name__ == "__main__":
    unittest.main()

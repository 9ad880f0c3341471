"""Title folders as disks and foreign programs leave them, and disks without room: the window stays usable."""
import os
import random
import re
import shutil
import subprocess
import unittest

import harness
import wire

MISSING_FONT, DISK_FULL_CREATE, DISK_FULL_PASTE = 109, 114, 116
MAX_FILE = 8 * 1024 * 1024
NEST = 60


def read(path):
    with open(path, "rb") as stream:
        return stream.read()


def write(path, data):
    with open(path, "wb") as stream:
        stream.write(data)


class TitleFolders(harness.TitlerTest):
    def copied_title(self, folder_name):
        """A folder with one title of the samples; its title file, to be damaged."""
        source = self.folder()
        folder = self.folder(folder_name)
        os.makedirs(folder)
        stem = os.path.basename(self.titles(source)[0].stem)
        for name in os.listdir(source):
            if name.startswith(stem):
                shutil.copy(os.path.join(source, name), folder)
        self.write_order(folder, [stem + ".xml"])
        return os.path.join(folder, stem + ".xml")

    @staticmethod
    def write_order(folder, names):
        rows = "".join(f'<index value="{i}" file-path="{name}" />' for i, name in enumerate(names))
        write(os.path.join(folder, ".order.xml"),
              f'<?xml version="1.0" encoding="utf-8" ?><manifest type="order">{rows}</manifest>'.encode())

    def variants(self, folder_name, contents):
        """A folder of two good titles, the first and the last, with damaged ones in between."""
        first = self.copied_title(folder_name)
        folder = os.path.dirname(first)
        good = read(first)
        names = [os.path.basename(first)]
        for index, content in enumerate(contents(good)):
            names.append(f"2024010109{index:02}.xml")
            write(os.path.join(folder, names[-1]), content)
        names.append("20240101091500.xml")
        write(os.path.join(folder, names[-1]), good)
        self.write_order(folder, names)
        return folder, [os.path.join(folder, name) for name in names]

    def close_unsaved(self):
        start = self.appliance.mark()
        self.close_window()
        self.assertEqual(self.posted_messages(start), [])

    def open_and_close(self, path):
        """Opens a title, looks that the window lives, and closes; the folder is as before."""
        folder = path if os.path.isdir(path) else os.path.dirname(path)
        before = wire.snapshot(folder)
        start = self.appliance.mark()
        self.command(f'edit "{path}"')
        self.wait_shown()
        messages = self.posted_messages(start)
        self.close_window()
        self.assertEqual(wire.snapshot(folder), before)
        return messages

    def test_a_missing_font_is_told_once_the_window_shows(self):
        path = self.copied_title("font")
        write(path, read(path).replace(b'font="KST"', 'font="No Such Gothic 黑"'.encode()))
        start = self.appliance.mark()
        self.command(f'edit "{path}"')
        message = self.wait_call("MessageCenter", "postMessage", start)
        self.assertEqual(message["messageId"], MISSING_FONT)
        self.assertTrue(self.window())
        self.display.wait_until_still(30 * harness.SLOW)
        self.command(f"message-close {MISSING_FONT} 1")
        self.close_window()
        self.assertEqual(self.posted_messages(start), [MISSING_FONT])
        self.assertIn("No Such Gothic 黑".encode(), read(path))
        # A title that has all its fonts is not spoken of.
        self.assertEqual(self.open_and_close(self.titles(self.folder())[0].path), [])


class NoRoomReported(harness.TitlerTest):
    environment_changes = {"K2SYS_FS_REMAIN": "1000"}

    def test_create_and_paste_are_refused_with_a_message(self):
        folder = self.folder()
        self.open_title(self.titles(folder)[0])
        before = wire.snapshot(folder)
        start = self.appliance.mark()
        self.choose_in_list_menu(0, "Create New")
        message = self.wait_call("MessageCenter", "postMessage", start)
        self.assertEqual(message["messageId"], DISK_FULL_CREATE)
        self.choose_in_list_menu(0, "Copy")
        start = self.appliance.mark()
        self.choose_in_list_menu(0, "Paste")
        message = self.wait_call("MessageCenter", "postMessage", start)
        self.assertEqual(message["messageId"], DISK_FULL_PASTE)
        self.close_window()
        self.assertEqual(wire.snapshot(folder), before)


class NoRoomOnTheDisk(harness.TitlerTest):
    def limited_folder(self):
        """A title folder on a disk of its own where that may be mounted; else under a limit of file sizes."""
        folder = self.folder("full")
        os.makedirs(folder)
        size = sum(len(read(os.path.join(self.folder(), name))) for name in os.listdir(self.folder()))
        done = subprocess.run(["mount", "-t", "tmpfs", "-o", f"size={size // 1024 + 6000}k", "tmpfs", folder],
                              capture_output=True, check=False)
        self.mounted = done.returncode == 0
        if self.mounted:
            self.addCleanup(subprocess.run, ["umount", "-l", folder], check=True)
        for name in os.listdir(self.folder()):
            shutil.copy(os.path.join(self.folder(), name), folder)
        return folder

    def fill(self, folder):
        with open(os.path.join(folder, "filler.bin"), "wb", buffering=0) as stream:
            for size in (65536, 4096, 1):
                try:
                    while True:
                        stream.write(b"x" * size)
                except OSError:
                    continue

    def type_and_close(self, title, text):
        self.open_title(title)
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {text}")
        self.display.wait_until_still()
        self.close_window()

    def test_a_save_without_room_keeps_the_old_files(self):
        folder = self.limited_folder()
        title = self.titles(folder)[0]
        before = title.texts()
        if self.mounted:
            self.fill(folder)
            self.type_and_close(title, "No room for this")
            self.assertEqual(title.texts(), before)
            self.assertEqual(wire.broken_files(folder), {})
            os.remove(os.path.join(folder, "filler.bin"))
        self.type_and_close(title, "Room again")
        self.assertEqual(title.texts(), [*before, "Room again"])
        self.assertEqual(wire.broken_files(folder), {})
        self.wait_no_leftovers(folder)


if __name__ == "__main__":
    unittest.main()

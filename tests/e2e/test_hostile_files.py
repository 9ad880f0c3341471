"""Title folders as disks and foreign programs leave them, and disks without room: the window stays usable."""
import os
import re
import shutil
import subprocess
import unittest

import harness
import wire
from seededrandom import SeededRandom

MISSING_FONT, DISK_FULL_CREATE, DISK_FULL_PASTE, CONFIRM_CLOSE = 109, 114, 116, 117
OK = 2  # the button of a question
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
        # The window shows and has read the folder.
        self.wait_call("FileManagerController", "titlerEditStatus", start)
        harness.session.wait_until(self.window, 20 * harness.SLOW, "the window")
        messages = self.posted_messages(start)
        self.close_window()
        self.assertEqual(wire.snapshot(folder), before)
        return messages

    def test_torn_and_oversized_title_files(self):
        rng = SeededRandom(20261121)

        def contents(good):
            yield b""
            for _ in range(8):
                yield good[:rng.randrange(1, len(good))]
            yield good + b" " * (MAX_FILE + 1 - len(good))
            yield good.replace(b"Evening", b"\xff\xfe\xc0Evening", 1)
            yield good.replace(b"Evening", b"\xed\xa0\x80", 1)
            yield rng.randbytes(20000)
            yield b"\0" * 5000

        folder, paths = self.variants("torn", contents)
        for path in (folder, paths[1], paths[4], paths[10], paths[-1]):
            with self.subTest(path=path):
                self.open_and_close(path)
        # The damaged ones are not in the list: the second row is the last file.
        self.command(f'edit "{paths[-1]}"')
        self.wait_shown()
        self.assert_canvas_shows(harness.Title(paths[0]), mean=1.0, visible=0.01)

    def test_deep_files_and_many_attributes(self):
        def contents(good):
            for depth in (NEST, NEST + 10, 50000):
                yield good.replace(b"</manifest>", b"<a>" * (depth - 1) + b"</a>" * (depth - 1) + b"</manifest>")
            yield good.replace(b"<manifest ", b"<manifest " + b"".join(b'a%d="1" ' % i for i in range(300)), 1)
            yield good.replace(b"<manifest ", b"<manifest " + b"".join(b'a%d="1" ' % i for i in range(200)), 1)
            yield good.replace(b'content-count="', b'content-count="99999999', 1)
            yield re.sub(rb'item-count="\d+"', b'item-count="-2147483648"', good)
            yield re.sub(rb'size="\d+"', b'size="999999999999"', good)
            yield re.sub(rb'position-([XY])="[^"]*"', rb'position-\1="-1e30"', good)
            yield re.sub(rb'edge-width="\d+"', b'edge-width="2000000000"', good)
            yield re.sub(rb'shadow-blur-radius="\d+"', b'shadow-blur-radius="2000000000"',
                         good.replace(b'text-shadow="0"', b'text-shadow="1"'))

        folder, paths = self.variants("deep", contents)
        for path in (folder, *paths):
            with self.subTest(path=path):
                self.open_and_close(path)

    def test_unreadable_pictures(self):
        path = self.copied_title("pictures")
        folder = os.path.dirname(path)
        stem = path[:-len(".xml")]
        damages = {
            "missing": lambda name: os.remove(name),
            "truncated": lambda name: write(name, read(name)[:len(read(name)) // 2]),
            "noise": lambda name: write(name, SeededRandom(1).randbytes(5000)),
            "empty": lambda name: write(name, b""),
            "folder": lambda name: (os.remove(name), os.mkdir(name)),
            "link to itself": lambda name: (os.remove(name), os.symlink(os.path.basename(name), name)),
            "pipe": lambda name: (os.remove(name), os.mkfifo(name)),
            # A header that claims more pixels than there is memory.
            "giant": lambda name: write(name, read(name)[:16] + b"\x7f\xff\xff\xff" * 2 + read(name)[24:]),
        }
        names = [os.path.basename(stem) + suffix
                 for suffix in ("_240.png", "_1920.png", "_source_1280.png", "_source_1920.png")]
        kept = {name: read(os.path.join(folder, name)) for name in names}
        for kind, damage in damages.items():
            with self.subTest(damage=kind):
                for name in names:
                    damage(os.path.join(folder, name))
                start = self.appliance.mark()
                self.command(f'edit "{path}"')
                self.wait_call("FileManagerController", "titlerEditStatus", start)
                harness.session.wait_until(self.window, 20 * harness.SLOW, "the window")
                self.close_unsaved()
                for name, data in kept.items():
                    target = os.path.join(folder, name)
                    if os.path.isdir(target):
                        os.rmdir(target)
                    elif os.path.lexists(target):
                        os.remove(target)
                    write(target, data)
        self.open_title(harness.Title(path))
        self.assert_canvas_shows(harness.Title(path), mean=1.0, visible=0.01)

    def test_nonsense_in_the_order_file(self):
        path = self.copied_title("order")
        folder = os.path.dirname(path)
        name = os.path.basename(path)
        row = f'<index value="0" file-path="{name}" />'
        # Each names as many titles as there are, so that the clean-up takes the folder to be in step.
        for rows in (f'<index value="x" file-path="a.xml" />{row}', f'<what /><index file-path="b.xml" />{row}',
                     f'{row}<index value="-7" file-path="../../../gone.xml" />',
                     f'{row}<index value="1" file-path="" /><index value="2" file-path="abc" />',
                     f'{row}<index value="1" file-path=".." /><index value="1" file-path="&#1;&#xFFFF;" />',
                     row * 300):
            with self.subTest(rows=rows[:90]):
                write(os.path.join(folder, ".order.xml"), f'<manifest type="order">{rows}</manifest>'.encode())
                self.open_and_close(path)

    def test_an_unreadable_order_file_lists_the_titles_by_name(self):
        path = self.copied_title("unordered")
        folder = os.path.dirname(path)
        other = os.path.join(folder, "notes.txt")
        write(other, b"not a title")
        for order in (b"", b"\xff\xff", b"<manifest><index", b"<a>" * 70000, read(path)[:300]):
            with self.subTest(order=order[:20]):
                write(os.path.join(folder, ".order.xml"), order)
                start = self.appliance.mark()
                self.command(f'edit "{folder}"')
                self.wait_shown()
                self.close_window()
                self.assertEqual(self.posted_messages(start), [])
                self.assertEqual([title.path for title in self.titles(folder)], [path])
                self.assertEqual(wire.broken_files(folder), {})
        self.assertEqual(read(other), b"not a title")

    def test_names_of_all_scripts(self):
        for name in ("Größe é", "新闻 快讯", "ニュース速報", "뉴스 속보", "e\u0301a\u0308 combining",
                     "\U0001F600 \U0001F1EF\U0001F1F5"):
            with self.subTest(name=name):
                path = self.copied_title(name)
                folder = os.path.dirname(path)
                title = os.path.join(folder, name + " 1.xml")
                os.rename(path, title)
                self.write_order(folder, [os.path.basename(title)])
                start = self.appliance.mark()
                self.open_title(harness.Title(title))
                self.click_tool("New Text")
                self.wait_keyboard(start)
                self.command(f"string {name}")
                self.display.wait_until_still()
                self.close_window()
                self.assertEqual(harness.Title(title).texts()[-1], name)
                self.assertEqual(wire.broken_files(folder), {})

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

    def type_text(self, title, text):
        self.open_title(title)
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {text}")
        self.display.wait_until_still()

    def test_a_save_without_room_keeps_the_old_files(self):
        folder = self.limited_folder()
        title = self.titles(folder)[0]
        before = title.texts()
        if self.mounted:
            self.fill(folder)
            self.type_text(title, "No room for this")
            start = self.appliance.mark()
            self.click_tool("Close")
            # Asks before anything is given up.
            harness.session.wait_until(lambda: CONFIRM_CLOSE in self.posted_messages(start), 20 * harness.SLOW,
                                       "the question")
            self.command(f"message-close {CONFIRM_CLOSE} {OK}")
            self.wait_closed(start)
            self.assertEqual(title.texts(), before)
            self.assertEqual(wire.broken_files(folder), {})
            os.remove(os.path.join(folder, "filler.bin"))
        self.type_text(title, "Room again")
        self.close_window()
        self.assertEqual(title.texts(), [*before, "Room again"])
        self.assertEqual(wire.broken_files(folder), {})
        self.wait_no_leftovers(folder)


if __name__ == "__main__":
    unittest.main()

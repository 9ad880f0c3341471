"""The title list under a real finger: the menu, scrolling, and titles carried to other places."""
import os
import shutil
import unittest

import harness
from libraryhands import HANDLE, LibraryTest

TITLES = 14
LIST_BOTTOM = 1062


class TitleList(LibraryTest):
    def setUp(self):
        super().setUp()
        self.long = self.long_folder()
        start = self.appliance.mark()
        self.command(f'edit "{self.long}"')
        self.wait_call("FileManagerController", "titlerEditStatus", start)
        self.wait_shown()

    def long_folder(self):
        source, folder = self.folder(), self.folder("Long")
        os.makedirs(folder)
        samples = self.titles(source)
        stems = [f"202601010900{number:02}000" for number in range(TITLES)]
        for number, stem in enumerate(stems):
            sample = os.path.basename(samples[number % len(samples)].stem)
            for name in os.listdir(source):
                if name.startswith(sample):
                    shutil.copy(os.path.join(source, name), os.path.join(folder, name.replace(sample, stem)))
            path = os.path.join(folder, stem + ".xml")
            with open(path, encoding="utf-8") as stream:
                text = stream.read().replace(sample, stem)
            with open(path, "w", encoding="utf-8") as stream:
                stream.write(text)
        rows = "".join(f'<index value="{i}" file-path="{stem}.xml" />' for i, stem in enumerate(stems))
        with open(os.path.join(folder, ".order.xml"), "w", encoding="utf-8") as stream:
            stream.write(f'<?xml version="1.0" encoding="utf-8" ?><manifest type="order">{rows}</manifest>')
        return folder

    def order(self):
        """The numbers of the titles in the folder's order."""
        return [int(os.path.basename(title.stem)[-5:-3]) for title in self.titles(self.long)]

    def wait_order(self, order):
        harness.session.wait_until(lambda: self.order() == order, 20 * harness.SLOW, f"the order {order}")

    def thumbnails(self):
        return self.part(60, 70, 560, 1060)

    def undo(self):
        self.display.tap(*harness.TOOL_POINTS["Undo"])

    def test_titles_are_carried_and_taken_back(self):
        original = list(range(TITLES))
        self.tap_move()
        self.lift()
        self.carry_to(HANDLE[1] + 2 * harness.LIST_ROW)
        self.drop(HANDLE[1] + 2 * harness.LIST_ROW)
        self.assertEqual(self.order(), [1, 2, 0] + original[3:])

        # Held over the lower edge the list runs to its end.
        self.lift()
        self.carry_to(LIST_BOTTOM - 10)
        self.drop(LIST_BOTTOM - 10)
        self.assertEqual(self.order(), [2, 0] + original[3:] + [1])

        # A press outside leaves move mode and does nothing else.
        self.undo()
        self.display.wait_until_still()
        self.assertEqual(self.order(), [2, 0] + original[3:] + [1])
        self.undo()
        self.wait_order([1, 2, 0] + original[3:])
        self.undo()
        self.wait_order(original)
        self.close_window()
        self.assertEqual(self.order(), original)
        self.wait_no_leftovers(self.long)

    def test_held_titles_are_copied_and_deleted(self):
        self.choose_in_list_menu(0, "Copy")
        self.choose_in_list_menu(0, "Paste")
        self.wait_titles(self.long, TITLES + 1)
        self.display.wait_until_still()
        pasted = self.titles(self.long)[1]
        self.assertEqual(pasted.texts(), self.titles(self.long)[0].texts())
        self.choose_in_list_menu(1, "Delete")
        self.wait_titles(self.long, TITLES)
        self.assertEqual(self.order(), list(range(TITLES)))
        self.close_window()
        self.assertFalse(os.path.exists(pasted.path))

    def test_scrolling_selects_nothing(self):
        shown, at_start = self.canvas(), self.thumbnails()
        self.display.down(300, 900)
        seen = []
        for y in range(880, 480, -20):
            self.display.move(300, y)
            seen.append(self.thumbnails() != at_start)
        self.display.up(300, 500)
        self.display.wait_until_still()
        self.assertIn(True, seen, "the list does not follow the finger")
        self.assertTrue(self.thumbnails() != at_start, "the list has not scrolled")
        self.assertTrue(self.canvas() == shown, "another title is on the canvas")
        self.close_window()
        self.assertEqual(self.order(), list(range(TITLES)))


if __name__ == "__main__":
    unittest.main()

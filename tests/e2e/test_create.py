"""A sibling asks for new titles: the operator makes two in the list, closes, and the sibling is told their paths."""
import os
import unittest

import harness

FOLDER = "天气"
CALL_TYPE = 7


class CreateTitles(harness.TitlerTest):
    def open_for_creation(self, folder, template=1):
        """Asks for new titles and chooses the folder and the template of the first new title."""
        self.command("register")
        self.command(f"create {CALL_TYPE}")
        self.wait_shown()
        self.wait_picker()
        count = len(self.titles(folder))
        self.choose_folder(os.path.basename(folder))
        self.choose_template(template)
        self.wait_titles(folder, count + 1)
        self.display.wait_until_still()

    def test_new_titles_come_back_in_the_order_of_the_folder(self):
        folder = self.folder(FOLDER)
        old = [title.path for title in self.titles(folder)]
        start = self.appliance.mark()
        self.open_for_creation(folder)
        # The second is made above the first, so the folder's order is not the order of making.
        self.create_in_list(0, template=0)
        self.wait_titles(folder, len(old) + 2)
        self.close_window()

        result = self.wait_result(start)
        new = [title.path for title in self.titles(folder) if title.path not in old]
        self.assertEqual(len(new), 2)
        self.assertGreater(new[0], new[1], "the names tell the time of making")
        self.assertEqual(result["type"], CALL_TYPE)
        self.assertEqual(result["path"], folder)
        # Titles are named relative to the folder, as in its order file.
        names = [os.path.basename(path) for path in new]
        self.assertEqual(result["paths"], names)
        self.assertEqual(result["count"], 2)
        self.assertEqual(result["size"], sum(self.packed_size(name) for name in names))
        templates = self.preset_templates()
        # The upper one was made last, from the first template.
        for path, template in zip(new, templates):
            title = harness.Title(path)
            self.assertEqual(title.texts(), template.texts())
            self.assert_pictures_have_their_sizes(title)

    def test_a_cancelled_picker_makes_no_title(self):
        folder = self.folder(FOLDER)
        old = [title.path for title in self.titles(folder)]
        self.open_title(self.titles(folder)[0])
        before = self.display.frame()
        self.choose_in_list_menu(0, "Create New")
        self.point_at_template(3)
        picker = self.display.frame()
        self.assertNotEqual(picker, before)
        # The rest of the window is out of reach meanwhile.
        self.click_tool("Close")
        self.display.wait_until_still()
        self.assertTrue(self.window())
        self.leave_templates("Cancel")
        self.close_window()
        self.assertEqual([title.path for title in self.titles(folder)], old)

    def test_no_folder_is_chosen(self):
        before = {name: self.titles(self.folder(name)) for name in self.folders()}
        self.command("register")
        start = self.appliance.mark()
        self.command(f"create {CALL_TYPE}")
        self.wait_shown()
        self.wait_picker()
        self.click_picker("Cancel")
        self.wait_closed(start)
        self.assertEqual(self.results(start), [])
        self.assertEqual(self.calls("FileManagerController", "titlerEditStatus", start), [])
        self.assertEqual({name: len(self.titles(self.folder(name))) for name in self.folders()},
                         {name: len(titles) for name, titles in before.items()})
        # The next request is a session of its own.
        first = self.titles(self.folder())[0]
        self.open_title(first)
        self.close_window()
        self.assertEqual(self.results(start), [])

    def test_a_title_that_was_deleted_again_is_not_named(self):
        folder = self.folder(FOLDER)
        old = [title.path for title in self.titles(folder)]
        start = self.appliance.mark()
        self.open_for_creation(folder)
        self.choose_in_list_menu(2, "Delete")
        self.wait_titles(folder, 2)
        self.close_window()
        # The session is answered nevertheless.
        result = self.wait_result(start)
        self.assertEqual((result["type"], result["path"]), (CALL_TYPE, folder))
        self.assertEqual((result["count"], result["size"], result["paths"]), (0, 0, []))
        self.assertEqual([title.path for title in self.titles(folder)], old)

    def wait_result(self, start):
        result = self.appliance.wait_event("callback", 20 * harness.SLOW, start)
        self.assertEqual(result["method"], "finishTitlerCreateCallback")
        return result

    @staticmethod
    def packed_size(text):
        """A wide string on the wire: its header, its bytes and a NUL."""
        length = len(text.encode()) + 1
        return (1 if length < 32 else 3 if length < 65536 else 5) + length


if __name__ == "__main__":
    unittest.main()

"""The folder picker under a finger on a touch screen, with the soft keyboard and the file manager of the appliance."""
import os
import shutil
import signal
import unittest

import harness
from libraryhands import LibraryTest

NAME_IN_USE = 47
ANSWER_OK = 2
TITLE_ADDED = 4
NEW_FOLDER = "Untitled"


class Folders(LibraryTest):
    def start_rename(self, name):
        """Holds a row until the file manager is told that the folder gets another name."""
        start = self.appliance.mark()
        point = self.row_point(name)
        self.display.down(*point)
        path = self.wait_call("FileManagerController", "renameFolderStart", start)["path"]
        self.display.up(*point)
        self.assertEqual(path, self.folder(name))
        self.wait_keyboard(start)

    def wait_folders(self, *names):
        harness.session.wait_until(lambda: set(self.folders()) == set(names), 20 * harness.SLOW, f"the folders {names}")

    def contents(self, name):
        return sorted(os.listdir(self.folder(name)))

    def test_make_copy_rename_and_open(self):
        self.open_picker_from_the_sub_panel()
        # A new folder.
        start = self.appliance.mark()
        self.click_picker("New Folder")
        field = self.wait_call("SoftKeyBoardController", "show", start)
        self.screenshot("editor.png")
        self.assertIn("Folder Name", field.values())
        self.assertIn(NEW_FOLDER, field.values())
        self.rows.append("速報 2")
        self.type_name("速報 2")
        self.wait_folders("Welcome", "天气", "速報 2")
        added = self.wait_call("FileManagerController", "updateTitlerStatus", start)
        self.assertEqual((added["path"], added["changeType"]), (self.folder("速報 2"), TITLE_ADDED))
        self.wait_call("SoftKeyBoardController", "close", start)
        # A copy of a folder; its own name is in use.
        start = self.appliance.mark()
        self.tap_row("Welcome")
        self.click_picker("Duplicate")
        self.rows.insert(1, "Copie")
        self.wait_keyboard(start)
        self.type_name("WELCOME")
        message = self.wait_call("MessageCenter", "postMessage", start)
        self.assertEqual((message["messageId"], message["text"]), (NAME_IN_USE, "WELCOME"))
        start = self.appliance.mark()
        self.tap_row("天气")
        self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])
        self.command(f"message-close {NAME_IN_USE} {ANSWER_OK}")
        self.wait_keyboard(start)
        self.type_name("Copie")
        self.wait_folders("Welcome", "天气", "速報 2", "Copie")
        harness.session.wait_until(lambda: self.contents("Copie") == self.contents("Welcome"), 20 * harness.SLOW,
                                   "the copied files")
        # Another name.
        self.start_rename("天气")
        start = self.appliance.mark()
        self.type_name("날씨")
        self.rows[self.rows.index("天气")] = "날씨"
        self.wait_folders("Welcome", "날씨", "速報 2", "Copie")
        call = self.wait_call("FileManagerController", "updateTitlerFolderName", start)
        self.assertIn(self.folder("天气"), call.values())
        self.assertIn(self.folder("날씨"), call.values())
        # Open the copy.
        start = self.appliance.mark()
        self.tap_row("Copie")
        self.click_picker("Open")
        self.assert_canvas_shows(self.titles(self.folder("Copie"))[0], mean=1.0, visible=0.01)
        opened = self.wait_call("FileManagerController", "titlerEditStatus", start)
        self.assertEqual(opened["path"], self.folder("Copie"))
        # The open folder takes no other name; Cancel goes back to it.
        self.click_tool("Folder")
        self.display.wait_until_still()
        self.rows = self.folders()
        start = self.appliance.mark()
        point = self.row_point("Copie")
        self.display.down(*point)
        self.display.wait_until_still(quiet=1.5)
        self.display.up(*point)
        self.assertEqual(self.calls("FileManagerController", "renameFolderStart", start), [])
        self.click_picker("Cancel")
        self.assert_canvas_shows(self.titles(self.folder("Copie"))[0], mean=1.0, visible=0.01)
        start = self.appliance.mark()
        self.close_window()
        self.assertEqual(self.calls("FileManagerController", "titlerEditEndStatus", start)[-1]["path"],
                         self.folder("Copie"))
        with open(os.path.join(self.keep, "k2_ope.log"), encoding="utf-8") as stream:
            log = [line for line in stream if "Folder Area" in line]
        for text in ("Tap New Folder Button", "Tap Duplicate Button", "Select Folder or File", "Tap Open Button",
                     "Tap Cancel Button"):
            self.assertTrue(any(text in line for line in log), f"{text} is not in the log")

    def test_names_that_are_refused(self):
        self.open_picker_from_the_sub_panel()
        start = self.appliance.mark()
        self.click_picker("New Folder")
        self.wait_keyboard(start)
        for text, code in (("a/b", 4001), ("a" * 21, 4002), ("a", 0)):
            start = self.appliance.mark()
            self.command(f"string-changed {text}")
            limit = self.wait_call("SoftKeyBoardController", "sendLimitInfo", start)
            self.assertIn(code, limit.values())
        self.command("string-changed a.b")
        # The keyboard comes up again over a name that is refused; Enter takes nothing.
        start = self.appliance.mark()
        self.command("key Enter")
        self.command("key-close")
        self.wait_keyboard(start)
        self.assertEqual(self.folders(), ["Welcome", "天气"])
        self.click_picker("Cancel")
        self.wait_hidden()
        self.assertEqual(self.folders(), ["Welcome", "天气"])

    def test_the_file_manager_works_at_the_same_time(self):
        self.open_picker_from_the_sub_panel()
        self.start_rename("天气")
        start = self.appliance.mark()
        os.rename(self.folder("天气"), self.folder("外"))
        self.command(f'rename-folder "{self.folder("天气")}" "{self.folder("外")}"')
        self.wait_keyboard(start)
        self.type_name("mine")
        self.rows[self.rows.index("天气")] = "mine"
        self.wait_folders("Welcome", "mine")
        self.tap_row("Welcome")
        shutil.rmtree(self.folder("Welcome"))
        self.command("delete-folder Welcome")
        self.display.wait_until_still()
        self.rows.remove("Welcome")
        # Nothing is chosen now, so Open does nothing.
        self.click_picker("Open")
        self.assertEqual(self.calls("FileManagerController", "titlerEditStatus", 0), [])
        self.tap_row("mine")
        self.click_picker("Open")
        self.wait_call("FileManagerController", "titlerEditStatus", 0)
        self.close_window()

    def test_the_process_ends_under_an_open_editor(self):
        for end in (lambda: self.titler.signal(signal.SIGTERM), lambda: self.command("power-off")):
            self.open_picker_from_the_sub_panel()
            start = self.appliance.mark()
            self.click_picker("New Folder")
            self.wait_keyboard(start)
            end()
            self.assertEqual(self.titler.wait(20 * harness.SLOW), 0)
            self.assertEqual(self.folders(), ["Welcome", "天气"])
            self.start_titler()

    def test_the_process_ends_under_two_dialogs(self):
        os.mkdir(self.folder("empty"))
        self.rows = self.folders()
        self.open_picker_from_the_sub_panel()
        self.tap_row("empty")
        self.click_picker("Open")
        self.titler.signal(signal.SIGTERM)
        self.assertEqual(self.titler.wait(20 * harness.SLOW), 0)
        self.assertEqual(os.listdir(self.folder("empty")), [])

    def test_no_template_leads_back_to_the_picker(self):
        os.mkdir(self.folder("empty"))
        self.rows = self.folders()
        self.command("register")
        start = self.appliance.mark()
        self.command("create 7")
        self.wait_shown()
        self.wait_picker()
        # Folders are made once one has been chosen.
        self.click_picker("New Folder")
        self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])
        self.tap_row("empty")
        self.click_picker("Open")
        self.leave_templates("Cancel")
        self.tap_row("天气")
        self.click_picker("Open")
        self.choose_template(1)
        self.wait_titles(self.folder("天气"), 3)
        self.display.wait_until_still()
        self.close_window()
        result = self.appliance.wait_event("callback", 20 * harness.SLOW, start)
        self.assertEqual((result["path"], result["count"]), (self.folder("天气"), 1))
        self.assertEqual([name for name in os.listdir(self.folder("empty")) if name.endswith(".xml")], [])


if __name__ == "__main__":
    unittest.main()

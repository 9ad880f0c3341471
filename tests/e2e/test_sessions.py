"""What a session does besides editing one title: the question on closing, requests that do not count, the sub panel."""
import os
import unittest

import harness

CONFIRM_CLOSE = 117
ANSWER_OK = 2


class ClosingQuestion(harness.TitlerTest):
    def test_new_titles_of_an_edit_request_are_asked_about(self):
        folder = self.folder()
        self.command("register")
        self.open_title(self.titles(folder)[0])
        self.choose_in_list_menu(0, "Copy")
        self.choose_in_list_menu(0, "Paste")
        self.wait_titles(folder, 5)

        start = self.appliance.mark()
        self.click_tool("Close")
        message = self.wait_call("MessageCenter", "postMessage", start)
        self.assertEqual(message["messageId"], CONFIRM_CLOSE)
        before = self.display.frame()
        self.command("message-mask 1")  # as the message center does around a box
        harness.session.wait_until(lambda: self.display.frame() != before, 20 * harness.SLOW, "the mask")
        self.assertTrue(self.stays_shown())
        # The answer to another question is not the answer to this one.
        self.command(f"message-close 110 {ANSWER_OK}")
        self.assertTrue(self.stays_shown())
        self.command(f"message-close {CONFIRM_CLOSE} {ANSWER_OK}")
        self.wait_closed(start)
        self.assertEqual(len(self.titles(folder)), 5)
        self.assertEqual(self.results(start), [])

        # The mask over the window went with it, and is not taken away before it is hidden.
        self.command("message-mask 0")
        self.open_title(self.titles(folder)[0])
        self.assert_canvas_shows(self.titles(folder)[0], mean=1.0, visible=0.01)
        self.close_window()

        # The question was for that session only.
        self.open_title(self.titles(folder)[0])
        start = self.appliance.mark()
        self.close_window()
        self.assertEqual(self.posted_messages(start), [])


class Requests(harness.TitlerTest):
    def test_a_request_for_a_window_that_shows_is_dropped(self):
        first, second = self.titles(self.folder())[:2]
        self.open_title(first)
        before = self.display.frame()
        self.command(f'edit "{second.path}"')
        # A later call on the same connection is handled after the dropped one.
        self.command("dialog-mask 1")
        harness.session.wait_until(lambda: self.display.frame() != before, 20 * harness.SLOW, "the mask")
        self.command("dialog-mask 0")
        harness.session.wait_until(lambda: self.display.frame() == before, 20 * harness.SLOW, "the first title again")
        self.assert_canvas_shows(first, mean=1.0, visible=0.01)

    def test_the_folder_of_the_titles_is_printed_once(self):
        self.open_title(self.titles(self.folder())[0])
        with open(os.path.join(self.keep, "titler.log"), encoding="utf-8") as stream:
            printed = [line.strip() for line in stream if line.startswith("mTitleRootFolderPath")]
        self.assertEqual(printed, ["mTitleRootFolderPath = " + os.path.dirname(self.folder())])

    def test_a_path_that_does_not_exist_shows_nothing(self):
        self.command(f'edit "{self.folder("gone")}/gone.xml"')
        first = self.titles(self.folder())[0]
        self.open_title(first)
        self.assert_canvas_shows(first, mean=1.0, visible=0.01)

    def test_the_sub_panel_opens_the_window_and_gets_no_result(self):
        self.open_title(self.titles(self.folder())[0])
        self.close_window()
        start = self.appliance.mark()
        self.command("register")
        self.command("sub")
        self.wait_shown()
        self.wait_picker()
        self.choose_folder("Welcome")
        first = self.titles(self.folder())[0]
        self.assert_canvas_shows(first, mean=1.0, visible=0.01)
        # Cancel goes back to the editor; another folder replaces this one.
        self.open_picker()
        self.click_picker("Cancel")
        self.assert_canvas_shows(first, mean=1.0, visible=0.01)
        self.open_picker()
        self.choose_folder("天气")
        paths = [call["path"] for call in self.calls("FileManagerController", "titlerEditStatus", start)]
        self.assertEqual(paths, [self.folder(), self.folder("天气")])
        ends = [call["path"] for call in self.calls("FileManagerController", "titlerEditEndStatus", start)]
        self.assertEqual(ends, [self.folder()])
        with self.assertRaises(AssertionError):
            self.assert_canvas_shows(first, mean=1.0, visible=0.01)
        self.close_window()
        self.assertEqual(self.results(start), [])
        self.assertEqual(self.posted_messages(start), [])


class RightScreen(harness.TitlerTest):
    titler_arguments = ("-right",)

    def test_the_window_lies_to_the_right(self):
        self.command(f'edit "{self.titles(self.folder())[0].path}"')
        self.wait_shown()
        self.assertEqual(self.display.geometry(self.window()), (1280, 0, 1920, 1080))


if __name__ == "__main__":
    unittest.main()

"""Every button of the tools bar in the real window, by finger on a touch screen and by mouse."""
import unittest
import zlib

import harness
import touchscreen

TEXT = "Bar"
# The entries of the Canvas menu, and the place that the new text finds beside the other, in pixels of the window.
MENU = {"Black": (1680, 107), "White": (1680, 171), "Checker": (1680, 235)}
# Nothing of the title or of a menu lies here.
CORNER = (640, 780)
BESIDE_THE_CANVAS = (300, 900)
NEW_TEXT_PLACE = (1419, 366)
# Where the picture of the pointer is no part of what is compared.
POINTER_PLACE = (300, 1000)


class Buttons:
    """The steps, the same for finger and mouse; press() is what they differ in."""

    def press(self, x, y):
        raise NotImplementedError

    def setUp(self):
        super().setUp()
        self.display.xdotool("mousemove", *POINTER_PLACE)
        self.open_title(self.titles(self.folder())[3])  # on nothing
        self.fresh = self.canvas()

    def use(self, name):
        self.press(*harness.TOOL_POINTS[name])
        self.display.wait_until_still()

    def rect(self, x, y, width, height):
        return self.display.part(x, y, width, height)

    def safe_area_button(self):
        return zlib.crc32(self.rect(1440, 12, 110, 60))

    def insert_text(self):
        start = self.appliance.mark()
        self.use("New Text")
        self.wait_keyboard(start)
        self.command(f"string {TEXT}")
        self.display.wait_until_still()

    def steps_until(self, name, wanted):
        """How often a button is used until the canvas shows what is wanted; a step that changes nothing ends it."""
        shown = self.canvas()
        for step in range(1, 6):
            self.use(name)
            now = self.canvas()
            if now == wanted:
                return step
            self.assertNotEqual(now, shown, f"{name} changed nothing")
            shown = now
        return self.fail(f"{name} does not lead there")

    def test_new_text_undo_and_redo(self):
        self.insert_text()
        steps = self.steps_until("Undo", self.fresh)
        for _ in range(steps):
            self.use("Redo")
        with_text = self.canvas()
        self.assertNotEqual(with_text, self.fresh)
        self.assertEqual(self.steps_until("Undo", self.fresh), steps)
        for _ in range(steps):
            self.use("Redo")
        self.assertEqual(self.canvas(), with_text)
        title = self.titles(self.folder())[3]
        start = self.appliance.mark()
        self.use("Close")
        self.wait_closed(start)
        self.assertIn(TEXT, title.texts())

    def test_delete(self):
        self.insert_text()
        title = self.titles(self.folder())[3]
        # Beside all objects: leaves the text. Then it is taken as an object.
        self.press(*CORNER)
        self.display.wait_until_still()
        self.wait_text(title, TEXT)
        self.press(*NEW_TEXT_PLACE)
        self.display.wait_until_still()
        self.use("Delete")
        self.assertEqual(self.canvas(), self.fresh)
        start = self.appliance.mark()
        self.use("Close")
        self.wait_closed(start)
        self.assertNotIn(TEXT, title.texts())

    def test_safe_area(self):
        button = self.safe_area_button()
        self.use("Safe Area")
        self.assertNotEqual(self.canvas(), self.fresh)
        self.assertNotEqual(self.safe_area_button(), button, "the button does not show that it is on")
        self.use("Safe Area")
        self.assertEqual(self.canvas(), self.fresh)
        self.assertEqual(self.safe_area_button(), button)

    def test_canvas_menu(self):
        for name, colour in (("White", (255, 255, 255)), ("Black", (0, 0, 0))):
            self.use("Canvas")
            self.press(*MENU[name])
            self.display.wait_until_still()
            self.assertEqual(self.pixel(*CORNER), colour)
        self.use("Canvas")
        self.press(*MENU["Checker"])
        self.display.wait_until_still()
        self.assertEqual(self.canvas(), self.fresh)
        # The button closes its menu, too.
        self.use("Canvas")
        self.assertNotEqual(self.canvas(), self.fresh)
        self.use("Canvas")
        self.assertEqual(self.canvas(), self.fresh)

    def test_a_press_outside_the_open_menu_does_nothing_else(self):
        for place in (harness.TOOL_POINTS["New Text"], CORNER, BESIDE_THE_CANVAS, harness.TOOL_POINTS["Close"]):
            with self.subTest(place=place):
                self.use("Canvas")
                self.assertNotEqual(self.canvas(), self.fresh, "the menu does not show")
                start = self.appliance.mark()
                self.press(*place)
                self.display.wait_until_still()
                self.assertEqual(self.canvas(), self.fresh)
                self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])
                self.assertTrue(self.window())
        self.insert_text()
        self.assertNotEqual(self.canvas(), self.fresh)

    def test_folder_is_disabled_for_a_title_that_a_sibling_named(self):
        self.use("Folder")
        self.assertEqual(self.canvas(), self.fresh)


class ByFinger(Buttons, harness.TitlerTest):
    display_class = touchscreen.TouchDisplay

    def press(self, x, y):
        self.display.tap(x, y)

    def test_a_text_left_empty_goes_with_the_next_tap(self):
        title = self.titles(self.folder())[3]
        before = title.texts()
        # More often than a title has texts.
        for _ in range(5):
            start = self.appliance.mark()
            self.use("New Text")
            self.wait_keyboard(start)
            self.press(*CORNER)
            self.display.wait_until_still()
            self.assertEqual(self.canvas(), self.fresh)
            self.assertEqual(self.posted_messages(start), [])
        start = self.appliance.mark()
        self.use("Close")
        self.wait_closed(start)
        self.assertEqual(title.texts(), before)

    def test_a_finger_that_slides_off_a_button_does_not_use_it(self):
        start = self.appliance.mark()
        x, y = harness.TOOL_POINTS["New Text"]
        self.display.drag((x, y), (x, y + 200))
        self.display.wait_until_still()
        self.assertEqual(self.canvas(), self.fresh)
        self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])

    def test_one_button_at_a_time(self):
        # The second finger's touch is lost while the first one holds its button, which then works.
        start = self.appliance.mark()
        self.display.down(*harness.TOOL_POINTS["Safe Area"], finger=0)
        self.display.tap(*harness.TOOL_POINTS["New Text"], finger=1)
        self.display.up(*harness.TOOL_POINTS["Safe Area"], finger=0)
        self.display.wait_until_still()
        self.assertNotEqual(self.canvas(), self.fresh)
        self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])
        self.use("Safe Area")
        self.assertEqual(self.canvas(), self.fresh)


class ByMouse(Buttons, harness.TitlerTest):
    def press(self, x, y):
        self.display.click(x, y)
        self.display.xdotool("mousemove", *POINTER_PLACE)


if __name__ == "__main__":
    unittest.main()

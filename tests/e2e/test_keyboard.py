"""What the keyboard service is asked for, call by call: once for each touch into a text, for the end of a field and
for the end of a text, on every way out of them; and what of the texts is on disk after that."""
import signal
import unittest

import harness
import session
from panelhands import CORNER_OF_CANVAS, ON_THE_TEXT, PANEL, TEXT, PanelTest

WHOLE_TEXT, SOME_LETTERS = 2, 1
SIZE_FIELD, TEXT_FIELD = 1, 0


class Keyboard(PanelTest):
    def keyboard_calls(self, start, *methods):
        """The names of those calls of the keyboard service since start."""
        return [event["method"] for event in self.appliance.since(start)
                if (event.get("event"), event.get("service")) == ("call", "SoftKeyBoardController")
                and event["method"] in methods]

    def shows(self, start):
        return self.calls("SoftKeyBoardController", "show", start)

    def show_of_one_touch(self, start):
        """What the one touch since start has asked for."""
        self.wait_keyboard(start)
        self.display.wait_until_still()
        shows = self.shows(start)
        self.assertEqual(len(shows), 1, shows)
        self.assertEqual(shows[0]["title"], "Text Input")
        self.assertEqual(shows[0]["fieldKind"], TEXT_FIELD)
        return shows[0]

    def select_whole_text(self):
        """Taps twice until the second tap came soon enough to make a double tap."""
        def double_tap():
            start = self.appliance.mark()
            self.display.tap(*ON_THE_TEXT)
            self.display.tap(*ON_THE_TEXT)
            session.wait_until(lambda: len(self.shows(start)) >= 2, 20 * harness.SLOW, "two requests for two taps")
            self.display.wait_until_still()
            self.assertEqual(len(self.shows(start)), 2)
            return self.shows(start)[-1]["selectionMode"] == WHOLE_TEXT

        session.wait_until(double_tap, 60 * harness.SLOW, "a double tap")

    def test_each_touch_asks_once(self):
        self.type_new_text()
        start = self.appliance.mark()
        self.display.tap(*ON_THE_TEXT)
        self.show_of_one_touch(start)
        self.select_whole_text()
        # A long press selects one letter; lifting the finger selects nothing else.
        start = self.appliance.mark()
        self.display.tap(*ON_THE_TEXT)
        self.show_of_one_touch(start)
        start = self.appliance.mark()
        self.hold_until(ON_THE_TEXT, lambda: self.shows(start), "the request of a long press")
        show = self.show_of_one_touch(start)
        self.assertEqual(show["selectionMode"], SOME_LETTERS)
        self.assertEqual(abs(show["selectionEnd"] - show["selectionStart"]), 1)

    def test_the_size_fields_end_puts_the_keyboard_away(self):
        self.type_new_text()
        ways = {"Return": lambda: self.command("key Return"), "Enter": lambda: self.command("key Enter"),
                "a tap elsewhere": lambda: self.tap(ON_THE_TEXT), "another tool": lambda: self.use("Bold")}
        for name, leave in ways.items():
            with self.subTest(way=name):
                start = self.appliance.mark()
                self.use("SizeField")
                self.wait_keyboard(start)
                self.assertEqual(self.shows(start)[-1]["fieldKind"], SIZE_FIELD)
                self.command("string-enter 120")
                start = self.appliance.mark()
                leave()
                self.wait_call("SoftKeyBoardController", "close", start)
                self.display.wait_until_still()
                calls = self.keyboard_calls(start, "show", "close", "dummyClose", "simpleClose")
                self.assertEqual(calls, ["close", "show"] if name == "a tap elsewhere" else ["close"])
        # What is typed after that goes into the text again.
        start = self.appliance.mark()
        self.display.tap(*ON_THE_TEXT)
        self.show_of_one_touch(start)
        self.command("string ++")
        session.wait_until(lambda: any("++" in text for text in self.title.texts()), 20 * harness.SLOW, "the text")

    def test_align_ends_the_text_and_the_keyboard(self):
        self.type_new_text()
        self.select_whole_text()
        start = self.appliance.mark()
        self.display.tap(*PANEL["AlignCenter"])
        self.wait_call("SoftKeyBoardController", "dummyClose", start)
        self.display.wait_until_still()
        self.assertEqual(self.keyboard_calls(start, "show", "close", "dummyClose"), ["dummyClose"])
        # The object is selected now: a tap edits it again, and nothing was lost.
        start = self.appliance.mark()
        self.display.tap(*ON_THE_TEXT)
        self.show_of_one_touch(start)
        self.tap(CORNER_OF_CANVAS)
        self.wait_text(self.title, TEXT)

    def test_power_off_and_signals_put_the_keyboard_away(self):
        for end in (lambda: self.command("power-off"), lambda: self.titler.signal(signal.SIGTERM)):
            self.type_new_text()
            start = self.appliance.mark()
            end()
            self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)
            self.assertEqual(self.keyboard_calls(start, "dummyClose", "simpleClose"), ["dummyClose"])
            self.start_titler()
            self.open_title(self.title)


class Texts(PanelTest):
    def new_text(self):
        start = self.appliance.mark()
        self.tool("New Text")
        self.wait_keyboard(start)

    def close(self):
        start = self.appliance.mark()
        self.tool("Close")
        self.wait_closed(start)

    def test_blank_texts_are_not_saved(self):
        before = self.title.texts()
        ways = {"Close": self.close, "power-off": lambda: self.command("power-off"),
                "a signal": lambda: self.titler.signal(signal.SIGTERM)}
        for name, end in ways.items():
            with self.subTest(way=name):
                self.new_text()
                self.assertEqual(self.title.texts(), before)
                self.command('string "  "')
                end()
                if name != "Close":
                    self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)
                    self.start_titler()
                self.assertEqual(self.title.texts(), before)
                self.open_title(self.title)
        # A tap beside it takes it away, undo brings it back, and Close goes without it.
        self.new_text()
        self.tap(CORNER_OF_CANVAS)
        self.tool("Undo")
        self.close()
        self.assertEqual(self.title.texts(), before)

    def test_the_only_text_stays_deleted(self):
        self.type_new_text()
        self.tap(CORNER_OF_CANVAS)
        self.wait_text(self.title, TEXT)
        self.delete_text(ON_THE_TEXT)
        while self.title.texts():
            self.delete_text(self.place_of_first_text())
        self.close()
        self.assertEqual(self.title.texts(), [])
        self.assert_pictures_have_their_sizes(self.title)
        self.open_title(self.title)
        self.assert_canvas_shows(self.title, mean=1.0, visible=0.01)

    def delete_text(self, place):
        count = len(self.title.texts())
        self.tap(place)
        self.tool("Delete")
        session.wait_until(lambda: len(self.title.texts()) == count - 1, 20 * harness.SLOW, "one text less")

    def place_of_first_text(self):
        """A point on the first text of the file, in pixels of the window."""
        x, y, _, _ = harness.CANVAS
        content = next(self.title.root().iter("content"))
        return x + float(content.get("position-X")) + 30, y + float(content.get("position-Y")) + 30

    def looks_of_new_text(self):
        """What a letter of a new text looks like, once it is saved."""
        self.new_text()
        self.command("string x")
        self.wait_text(self.title, "x")  # is saved by itself; only then it is sure to have come
        self.tap(CORNER_OF_CANVAS)
        item = dict(self.new_content().find("text-item").attrib)
        self.tool("Undo")
        self.tool("Undo")
        session.wait_until(lambda: "x" not in self.title.texts(), 20 * harness.SLOW, "the text to go")
        return item

    def test_a_new_text_looks_as_the_selected_one(self):
        plain = dict(next(self.title.root().iter("text-item")).attrib, text="x")
        self.type_new_text()
        self.select_word()
        self.style_word()
        styled = dict(self.new_content().findall("text-item")[TEXT.index("快")].attrib, text="x")
        # The word was changed last, but another text is selected, so the panel shows what that looks like.
        self.tap(self.place_of_first_text())
        self.assertEqual(self.looks_of_new_text(), plain)
        # The word alone is selected again.
        self.tap(ON_THE_TEXT)
        self.tap(ON_THE_TEXT)
        self.command(f"cursor {TEXT.index('快')} {TEXT.index('快') + 2} {TEXT.index('快') + 2} 1")
        self.display.wait_until_still()
        self.screenshot("shown.png")
        self.assertEqual(self.looks_of_new_text(), styled)


if __name__ == "__main__":
    unittest.main()

"""The property panel by finger in the real window: what mixed letters show and keep, what leaves no step to be undone,
and sizes that are none."""
import unittest

import harness
from panelhands import (BESIDE_EVERYTHING, CORNER_OF_CANVAS, ON_THE_TEXT, PALETTE_BLUE, PALETTE_CANCEL, SLIDER_AT_FIVE,
                        SLIDER_AT_TWO, RED, TEXT, WORD, PanelTest)

SIZE_REFUSED = 111
CANCEL = 1


class Panel(PanelTest):
    def setUp(self):
        super().setUp()
        self.type_new_text()

    def leave_text(self):
        self.tap(CORNER_OF_CANVAS)
        self.wait_text(self.title, TEXT)

    def saved(self, attribute):
        """The values of the letters before the word, within it and behind it; each must be one."""
        values = [item.get(attribute) for item in self.new_content().findall("text-item")]
        begin = TEXT.index(WORD)
        parts = values[:begin], values[begin:begin + len(WORD)], values[begin + len(WORD):]
        for part in parts:
            self.assertEqual(len(set(part)), 1, values)
        return [part[0] for part in parts]

    def close(self):
        start = self.appliance.mark()
        self.tool("Close")
        self.wait_closed(start)

    def test_mixed_letters(self):
        self.select_word()
        self.style_word()
        self.tap(ON_THE_TEXT)
        mixed = self.canvas()

        # Cancel gives each letter its own colour back, and nothing is left to be undone by it.
        self.open("Color", PALETTE_BLUE)
        self.tap(PALETTE_BLUE)
        self.assertNotEqual(self.canvas(), mixed)
        self.tap(PALETTE_CANCEL)
        self.assertEqual(self.canvas(), mixed)

        # Each letter climbs the ladder by itself, and does not come down where it began when that was beside it.
        self.use("SizeUp")
        larger = self.canvas()
        self.assertNotEqual(larger, mixed)
        self.use("SizeDown")
        self.assertNotEqual(self.canvas(), mixed)
        self.tool("Undo")
        self.assertEqual(self.canvas(), larger)
        self.tool("Undo")
        self.assertEqual(self.canvas(), mixed)
        self.tool("Redo")
        self.tool("Redo")

        # Bold is shown off, so a tap makes all letters bold.
        self.use("Bold")
        self.close()
        self.assertEqual(self.saved("color"), ["#FFFFFF", RED, "#FFFFFF"])
        self.assertEqual(self.saved("size"), ["96", "138", "96"])
        self.assertEqual(self.saved("bold"), ["1", "1", "1"])
        self.assertEqual(self.saved("text-edge"), ["0", "1", "0"])
        self.assertEqual(self.saved("edge-width"), ["2", "5", "2"])

    def test_a_slider_moved_and_returned_leaves_no_step(self):
        self.leave_text()
        self.tap(ON_THE_TEXT)
        plain = self.canvas()
        self.use("EdgeOn")
        edged = self.canvas()
        self.open("EdgeWidth", SLIDER_AT_TWO)
        self.display.down(*SLIDER_AT_TWO)
        self.display.move(*SLIDER_AT_FIVE)
        self.display.wait_until_still()
        self.assertNotEqual(self.canvas(), edged)
        self.display.move(*SLIDER_AT_TWO)
        self.display.wait_until_still()
        self.display.up(*SLIDER_AT_TWO)
        self.tap(BESIDE_EVERYTHING)
        self.assertEqual(self.canvas(), edged)
        self.tool("Undo")
        self.assertEqual(self.canvas(), plain)
        self.close()
        self.assertEqual(self.saved("edge-width"), ["2", "2", "2"])

    def edit_size(self):
        start = self.appliance.mark()
        self.use("SizeField")
        self.wait_keyboard(start)

    def test_sizes_that_are_none(self):
        self.select_word()
        before = self.canvas()
        for text in ("19", "1000", "abc", "9999999999", "-50", "6 4", ""):
            with self.subTest(text=text):
                self.edit_size()
                start = self.appliance.mark()
                self.command(f'string-enter "{text}"')
                self.command("key Return")
                self.display.wait_until_still()
                self.assertEqual(self.posted_messages(start), [SIZE_REFUSED])
                self.command(f"message-close {SIZE_REFUSED} {CANCEL}")
                self.display.wait_until_still()
                self.assertEqual(self.canvas(), before)
        # A size that is one still works, and so does dropping one halfway by another box.
        self.edit_size()
        self.command("string-enter 150")
        self.command("key Return")
        self.display.wait_until_still()
        self.edit_size()
        self.command("string-changed 7")
        self.use("Bold")
        self.leave_text()
        self.close()
        self.assertEqual(self.saved("size"), ["96", "150", "96"])
        self.assertEqual(self.saved("bold"), ["0", "1", "0"])


if __name__ == "__main__":
    unittest.main()

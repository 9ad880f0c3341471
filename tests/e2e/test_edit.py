"""A sibling names a title; it shows as it goes on air, gets a text by mouse, keyboard service and keys, and is saved."""
import os
import shutil
import unittest

import harness

SERVICE_TEXT = "Breaking 快讯"
KEY_TEXT = "速報 속보 é"


class EditTitle(harness.TitlerTest):
    extra_keys = "".join(dict.fromkeys(KEY_TEXT.replace(" ", "")))

    def test_the_canvas_shows_what_goes_on_air(self):
        # A shadow, whose softness is in pixels of either raster, is somewhat wider on the canvas; all else agrees.
        folder = self.folder()
        self.open_title(self.titles(folder)[0])
        self.assert_canvas_shows(self.titles(folder)[0], mean=1.0, visible=0.01)

    def test_a_text_is_added_typed_and_saved(self):
        title = self.titles(self.folder())[0]
        before = {}
        for suffix in harness.PICTURES:
            before[suffix] = os.path.join(self.work, "before" + suffix)
            shutil.copy(title.picture(suffix), before[suffix])
        texts = title.texts()

        self.open_title(title)
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {SERVICE_TEXT}")
        self.type_keys(KEY_TEXT)
        self.display.wait_until_still()
        self.screenshot("typed.png")
        self.close_window()

        self.assertEqual(title.texts(), [*texts, SERVICE_TEXT + KEY_TEXT])
        self.assertEqual(title.items()[-1], list(SERVICE_TEXT + KEY_TEXT))
        for text, items in zip(title.texts(), title.items()):
            self.assertEqual("".join(items), text)
        self.assert_pictures_have_their_sizes(title)
        for suffix, (width, height) in harness.PICTURES.items():
            with self.subTest(picture=suffix):
                changed = harness.pngdiff("changed", before[suffix], title.picture(suffix))
                # A new text starts in the middle of the title and grows to the right.
                self.assertGreater(changed["count"], width * height // 500)
                self.assertAlmostEqual(changed["x"], width * 0.5, delta=width * 0.03)
                self.assertGreater(changed["x"] + changed["width"], width * 0.9)
                self.assertLess(changed["y"], height * 0.55)
                self.assertGreater(changed["y"] + changed["height"], height * 0.45)

        # What was saved is what shows when the title is opened again.
        self.open_title(title)
        self.assert_canvas_shows(title, mean=1.0, visible=0.01)


if __name__ == "__main__":
    unittest.main()

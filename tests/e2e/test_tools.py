"""The tools of the end-to-end tests: the picture writer and what titler_pngdiff says about pictures."""
import os
import re
import subprocess
import tempfile
import unittest

import harness


def picture(width, height, colour_at):
    return b"".join(bytes(colour_at(x, y)) for y in range(height) for x in range(width))


class PictureTools(unittest.TestCase):
    def setUp(self):
        folder = tempfile.TemporaryDirectory()
        self.addCleanup(folder.cleanup)
        self.folder = folder.name

    def write(self, name, width, height, colour_at):
        path = os.path.join(self.folder, name)
        harness.session.write_png(path, width, height, picture(width, height, colour_at))
        return path

    def screen(self, shot, title, rect):
        return harness.pngdiff("screen", shot, *rect, title, os.path.join(self.folder, "difference.png"))

    def test_size_and_alpha_of_an_opaque_picture(self):
        path = self.write("a.png", 20, 10, lambda x, y: (x, y, 0))
        self.assertEqual(harness.pngdiff("size", path), {"width": 20, "height": 10})
        self.assertEqual(harness.pngdiff("alpha", path), {"x": 0, "y": 0, "width": 20, "height": 10, "count": 200})

    def test_changed_gives_the_box_of_what_differs(self):
        old = self.write("old.png", 20, 10, lambda x, y: (9, 9, 9))
        new = self.write("new.png", 20, 10, lambda x, y: (200, 9, 9) if 5 <= x < 8 and y == 4 else (9, 9, 9))
        self.assertEqual(harness.pngdiff("changed", old, new), {"x": 5, "y": 4, "width": 3, "height": 1, "count": 3})
        self.assertEqual(harness.pngdiff("changed", old, old)["count"], 0)

    def test_the_screen_is_compared_with_the_scaled_title(self):
        def two_halves(half):
            return lambda x, y: (240, 0, 0) if x < half else (0, 0, 240)

        title = self.write("title.png", 60, 30, two_halves(30))
        # The title at two thirds, 3 to the right and 2 down on a larger screen.
        shot = self.write("shot.png", 50, 30, lambda x, y: (240, 0, 0) if x < 23 else (0, 0, 240))
        same = self.screen(shot, title, (3, 2, 40, 20))
        self.assertEqual((same["compared"], same["visible"]), (800, 0))
        self.assertLess(same["mean"], 1)
        # A pixel to the side is the same, more is not.
        self.assertEqual(self.screen(shot, title, (4, 2, 40, 20))["visible"], 0)
        shifted = self.screen(shot, title, (0, 2, 40, 20))
        self.assertGreater(shifted["visible"], 0.05)
        self.assertEqual(shifted["largest"], 240)

    def test_a_line_that_is_missing_on_either_side_is_seen(self):
        plain = self.write("plain.png", 60, 30, lambda x, y: (10, 10, 10))
        lined = self.write("lined.png", 60, 30, lambda x, y: (250, 250, 250) if 10 <= y < 15 else (10, 10, 10))
        for shot, title in ((plain, lined), (lined, plain)):
            self.assertGreater(self.screen(shot, title, (0, 0, 60, 30))["visible"], 0.09)

    def test_wrong_use_and_unreadable_pictures_are_refused(self):
        path = self.write("a.png", 4, 4, lambda x, y: (0, 0, 0))
        other = self.write("b.png", 5, 4, lambda x, y: (0, 0, 0))
        for arguments in (("size",), ("size", "/nowhere.png"), ("changed", path, other), ("nothing", path),
                          ("screen", path, 0, 0, 9, 9, path, "/dev/null")):
            done = subprocess.run([os.path.join(harness.BUILD, "tests", "titler_pngdiff"), *map(str, arguments)],
                                  capture_output=True, check=False)
            self.assertEqual(done.returncode, 2, arguments)


class Screen(unittest.TestCase):
    def test_spare_keys_take_characters(self):
        with tempfile.TemporaryDirectory() as folder:
            display = harness.session.Display(folder, harness.session.program_environment(harness.BUILD))
            try:
                display.add_keys("速é")
                keymap = subprocess.run(["xkbcomp", "-xkb", display.name, "-"], env=display.environment, check=True,
                                        capture_output=True, text=True).stdout
                symbols = {key: re.sub(r"\s+", "", text)
                           for key, text in re.findall(r"key +<(FK1[34])> +{(.*?)};", keymap, re.DOTALL)}
                self.assertIn("[U901F]", symbols["FK13"])
                self.assertIn("[eacute]", symbols["FK14"])
                self.assertRaises(harness.session.SessionError, display.add_keys, "x" * 13)
            finally:
                display.stop()

    def test_a_display_shows_and_takes_clicks(self):
        with tempfile.TemporaryDirectory() as folder:
            display = harness.session.Display(folder, harness.session.program_environment(harness.BUILD))
            try:
                width, height, rgb = display.grab()
                self.assertEqual((width, height, len(rgb)), (1920, 1080, 1920 * 1080 * 3))
                display.click(700, 400)
                self.assertIn("x:700 y:400", display.xdotool("getmouselocation"))
                self.assertIsNone(display.find_window("Titler"))
            finally:
                display.stop()
            self.assertFalse(display.server.running())
            self.assertFalse(display.manager.running())


if __name__ == "__main__":
    unittest.main()

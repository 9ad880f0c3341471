"""The ends of the process: power-off and signals, idle, with unsaved work, and during a save."""
import os
import signal
import unittest

import harness
import wire

TYPED = "Last words"


class Shutdown(harness.TitlerTest):
    def type_a_text(self):
        title = self.titles(self.folder())[0]
        self.open_title(title)
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.type_keys(TYPED)
        self.display.wait_until_still()
        return title

    def assert_whole(self, title):
        """The title is saved with its pictures, and nothing half written lies beside it."""
        self.assertIn(TYPED, title.texts())
        self.assert_pictures_have_their_sizes(title)
        left = self.leftovers(self.folder())
        if not left:
            return
        # A disk that is too slow: the former versions stay, the log names what may be lost, the next start sweeps.
        with open(os.path.join(self.keep, "k2_ope_debug.log"), encoding="utf-8") as log:
            lines = log.read()
        for name in left:
            self.assertTrue(name.startswith(wire.KEPT_PREFIX), left)
            path = os.path.join(self.folder(), name[len(wire.KEPT_PREFIX):].replace("%2E", "."))
            self.assertIn("ends before this is on the disk: " + path, lines)
        self.start_titler()
        self.wait_no_leftovers(self.folder())
        self.assertIn(TYPED, title.texts())
        self.assert_pictures_have_their_sizes(title)

    def test_power_off_ends_an_idle_titler(self):
        self.command("power-off")
        self.assertEqual(self.titler.wait(20 * harness.SLOW), 0)

    def test_power_off_saves_first(self):
        title = self.type_a_text()
        self.command("power-off")
        self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)
        self.assert_whole(title)

    def test_a_signal_ends_an_idle_titler(self):
        for number in (signal.SIGTERM, signal.SIGINT):
            with self.subTest(signal=number):
                self.titler.signal(number)
                self.assertEqual(self.titler.wait(20 * harness.SLOW), 0)
                self.start_titler()

    def test_a_signal_saves_first(self):
        title = self.type_a_text()
        self.titler.signal(signal.SIGTERM)
        self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)
        self.assert_whole(title)

    def test_a_signal_during_a_save_waits_for_it(self):
        title = self.type_a_text()
        self.click_tool("Close")
        self.titler.signal(signal.SIGTERM)
        self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)
        self.assert_whole(title)

    def test_a_killed_titler_leaves_whole_files(self):
        title = self.type_a_text()
        self.click_tool("Close")
        self.titler.signal(signal.SIGKILL)
        self.titler.wait(10)
        # Old or new, but readable. The largest picture is taken away before it is drawn anew.
        self.assertIn(len(title.texts()), (2, 3))
        self.assert_pictures_have_their_sizes(title, may_be_missing=("_1920.png",))
        # The next titler takes the title as it is.
        self.start_titler()
        self.open_title(title)


if __name__ == "__main__":
    unittest.main()

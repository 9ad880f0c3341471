"""A titler that is killed at any moment of its work. TITLER_KILLS is the number of kills; TITLER_SEED repeats a run,
as far as a machine can."""
import os
import signal
import unittest

import harness
import wire
from mortal import MortalTitler
from seededrandom import SeededRandom

KILLS = int(os.environ.get("TITLER_KILLS", "10"))


class Killed(MortalTitler, harness.TitlerTest):
    def edit_and_save(self, titles, rng):
        """Adds texts to titles and saves them, until the titler dies."""
        number = 0
        while True:
            title = rng.choice(titles)
            number += 1
            self.command(f'edit "{title.path}"')
            self.wait_shown()
            start = self.appliance.mark()
            self.click_tool("New Text")
            self.wait_keyboard(start)
            self.command(f"string kill {number}")
            self.command("key-text ab")
            self.close_window()

    def test_files_are_whole_after_a_kill_at_any_moment(self):
        rng = SeededRandom()
        folder = self.folder()
        for turn in range(KILLS):
            with self.subTest(turn=turn, seed=rng.first_seed):
                titles = self.titles(folder)
                # From the middle of the first edit to well into the writing of pictures.
                self.kill_during(lambda: self.edit_and_save(titles, rng), rng.uniform(0.3, 2.5) * harness.SLOW)
                self.assertEqual(wire.broken_files(self.base), {})
                self.start_titler()
                shown = rng.choice(self.titles(folder))
                self.open_title(shown)
                self.close_window()
                self.wait_no_leftovers(folder)
                self.assertEqual(len(self.titles(folder)), len(titles))
                self.assertEqual(wire.broken_files(self.base), {})

    def test_leftovers_are_swept_in_every_folder(self):
        resources = os.path.join(self.base, "resources")
        folders = [self.folder(), os.path.join(self.base, "resources", "Titles"), os.path.join(resources, "Templates")]
        folders += [os.path.join(resources, "Templates", "templates_" + name) for name in ("en", "chs")]
        self.titler.signal(signal.SIGKILL)
        self.assertEqual(self.titler.wait(10), -signal.SIGKILL)
        made = []
        for folder in folders:
            made.append(os.path.join(folder, ".titler-new-1-1-1"))  # of a process that has gone
            with open(made[-1], "w", encoding="ascii") as stream:
                stream.write("half")
        self.start_titler()
        self.assertEqual([path for path in made if os.path.exists(path)], [])


if __name__ == "__main__":
    unittest.main()

"""A titler that is killed at any moment of an operator's session in the title library: the next one shows every title
that was saved. TITLER_KILLS is the number of sessions; TITLER_SEED repeats a run, as far as a machine can."""
import os
import shutil
import time
import unittest

import harness
import wire
from librarysession import COPY, FOLDER, LibrarySession
from mortal import MortalTitler
from seededrandom import SeededRandom

KILLS = int(os.environ.get("TITLER_KILLS", "2"))


class KilledSession(MortalTitler, LibrarySession):
    doing = "nothing"
    saved_templates = ()

    def play(self):
        """The session; what each step leaves is noted when it is done, what it may take away before it begins."""
        for step in self.STEPS:
            self.doing = step.__name__
            if step is LibrarySession.delete_and_undo:
                self.saved[FOLDER].pop(os.path.basename(self.new_titles()[0].stem))
            step(self)
            self.note_saved()

    def assert_files_whole(self):
        """What was saved lies there whole, and so does every other file."""
        for folder, titles in self.saved.items():
            for stem, texts in titles.items():
                path = os.path.join(self.folder(folder), stem + ".xml")
                # A text more may have been saved since.
                self.assertEqual(harness.Title(path).texts()[:len(texts)], texts, path)
        for template in self.saved_templates:
            self.assertTrue(os.path.exists(template), template)
        self.assertEqual(wire.broken_files(self.base), {})

    def assert_nothing_lost(self):
        self.assert_files_whole()
        found = self.found()
        for folder, titles in self.saved.items():
            self.assertLessEqual(set(titles), set(found.get(folder, ())), folder)
        self.assertLessEqual(set(self.saved_templates), {title.path for title in self.user_templates()})
        self.assertEqual(wire.broken_files(self.base), {})

    def rows_shown(self):
        """How many of the first titles the list shows: a row's picture is not of one colour."""
        count = 0
        for row in range(6):
            x, y = self.list_point(row)
            pixels = self.part(x - 300, y - 40, x - 150, y + 40)
            if len({pixels[at:at + 3] for at in range(0, len(pixels), 4)}) == 1:
                break
            count += 1
        return count

    def note_saved(self):
        super().note_saved()
        self.saved_templates = [title.path for title in self.user_templates()]

    def show(self, name):
        """Opens a folder and closes it again, which takes nothing from it."""
        before = self.found()[name]
        start = self.appliance.mark()
        self.command(f'edit "{self.folder(name)}"')
        self.wait_call("FileManagerController", "titlerEditStatus", start)
        self.wait_shown()
        # The pictures of the rows come from the disk, which may be slow.
        harness.session.wait_until(lambda: self.rows_shown() == len(before), 20 * harness.SLOW,
                                   f"{len(before)} rows of the list")
        self.screenshot("shown.png")
        self.close_window()
        self.wait_no_leftovers(self.folder(name))
        self.assertEqual(self.found()[name], before)

    def clear(self):
        for name in (FOLDER, COPY):
            shutil.rmtree(self.folder(name), ignore_errors=True)
        self.rows = self.folders()

    def kill_and_look(self, seconds):
        self.note_saved()
        self.kill_during(self.play, seconds)
        self.display.lift_all()
        self.assert_files_whole()
        self.start_titler()
        for name, titles in self.found().items():
            if titles and name in (FOLDER, COPY, "Welcome"):
                self.show(name)
        self.assert_nothing_lost()
        self.clear()

    def test_every_saved_title_is_there_after_a_kill(self):
        rng = SeededRandom()
        self.note_saved()
        begin = time.monotonic()
        self.play()
        length = time.monotonic() - begin
        self.clear()
        for turn in range(KILLS):
            try:
                self.kill_and_look(rng.uniform(0, length))
            except Exception as error:
                # A turn begins with what the one before it has left.
                raise AssertionError(f"turn {turn} of the run with seed {rng.first_seed}, in {self.doing}") from error
            print(f"turn {turn}: killed in {self.doing}", flush=True)


if __name__ == "__main__":
    unittest.main()

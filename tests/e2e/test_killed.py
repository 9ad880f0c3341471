"""A titler that is killed at any moment of its work."""
import random
import signal
import threading
import time
import unittest

import harness
import wire

KILLS = 25


class Killed(harness.TitlerTest):
    # A titler that is dead does nothing any more: no need to wait for it.

    def wait_call(self, service, method, start, timeout=20):
        def called():
            self.titler.check()
            return self.calls(service, method, start)

        return harness.session.wait_until(called, timeout * harness.SLOW, f"{service}.{method}")[0]

    def wait_closed(self, start):
        def closed():
            self.titler.check()
            return any(call["topWindow"] == harness.TOP_WINDOW_MAIN
                       for call in self.calls("MessageCenter", "setTopWindow", start))

        harness.session.wait_until(closed, 20 * harness.SLOW, "the end of the session")

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

    def kill_during_work(self, titles, rng):
        # From the middle of the first edit to well into the writing of pictures.
        killed = threading.Event()

        def kill():
            killed.set()
            self.titler.signal(signal.SIGKILL)

        timer = threading.Timer(rng.uniform(0.3, 2.5) * harness.SLOW, kill)
        timer.start()
        try:
            self.edit_and_save(titles, rng)
        except (harness.session.SessionError, AssertionError, ValueError):
            # What fails after the kill fails because of it.
            if not killed.is_set():
                raise
        finally:
            timer.join()
        self.assertEqual(self.titler.wait(10), -signal.SIGKILL)

    def test_files_are_whole_after_a_kill_at_any_moment(self):
        rng = random.Random(time.time_ns())
        seed = rng.randrange(2 ** 32)
        rng.seed(seed)
        folder = self.folder()
        for turn in range(KILLS):
            with self.subTest(turn=turn, seed=seed):
                titles = self.titles(folder)
                self.kill_during_work(titles, rng)
                self.assertEqual(wire.broken_files(self.base), {})
                self.start_titler()
                shown = rng.choice(self.titles(folder))
                self.open_title(shown)
                self.close_window()
                self.wait_no_leftovers(folder)
                self.assertEqual(len(self.titles(folder)), len(titles))
                self.assertEqual(wire.broken_files(self.base), {})


if __name__ == "__main__":
    unittest.main()

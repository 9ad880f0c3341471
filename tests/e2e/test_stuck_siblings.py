"""Siblings that do not read, do not accept, or claim to be others."""
import os
import signal
import time
import unittest

import harness
import wire

PROJECT_LOADED = 1
# More calls than the sockets and the titler keep for a sibling that does not read.
FLOOD = 1500
MOST_SECONDS = 8
CREATE_TYPE = 3
# What a stranger may claim to be: nobody, the titler itself, and siblings that are not there.
STRANGE_CLIENTS = (0, -1, 1, 999, wire.peer.TITLER_PORT, 1005, 1009, 64000, 2 ** 31 - 1)


class StuckSiblings(harness.TitlerTest):
    def setUp(self):
        super().setUp()
        self.title = self.titles(self.folder())[0]
        self.project_adapter = self.wait_call("ProjectDataManager", "registerNotifyCallBack", 0)["adapterId"]
        self.wire = wire.Connection(self.offset)
        self.addCleanup(self.wire.close)

    def debug_lines(self, text):
        with open(os.path.join(self.keep, "k2_ope_debug.log"), encoding="utf-8") as log:
            return [line for line in log if text in line]

    def make_calls(self, count):
        """Makes the titler call the main process so many times."""
        for _ in range(count):
            self.wire.call(1, wire.pack_int(PROJECT_LOADED), target=self.project_adapter, callback=1)

    def edit(self):
        self.wire.call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_wide(self.title.path))

    def test_a_sibling_that_does_not_read(self):
        self.open_title(self.title)
        self.close_window()
        self.appliance.signal(signal.SIGSTOP)
        deadline = harness.session.deadline_after(MOST_SECONDS * harness.SLOW)
        self.make_calls(FLOOD)
        self.edit()
        window = harness.session.wait_until(self.window, 60 * harness.SLOW, "the window")
        self.assertLess(time.monotonic(), deadline)
        self.assertTrue(window)
        harness.session.wait_until(lambda: self.debug_lines("calls are lost"), 20 * harness.SLOW, "the line in the log")
        # It reads again: calls arrive, whole and in their order, without a restart and without registering anew.
        self.appliance.signal(signal.SIGCONT)
        self.display.wait_until_still(30 * harness.SLOW)
        self.close_window()
        self.open_title(self.title)
        start = self.appliance.mark()
        self.make_calls(1)
        self.wait_call("SystemSetupManager", "getLanguageInfo", start)
        self.close_window()
        self.assertEqual(len(self.debug_lines("calls are lost")), 1)

    def test_the_end_does_not_wait_for_a_sibling_that_does_not_read(self):
        self.appliance.signal(signal.SIGSTOP)
        self.make_calls(FLOOD)
        # Five seconds are for the power service to drop its client.
        deadline = harness.session.deadline_after((5 + MOST_SECONDS) * harness.SLOW)
        self.titler.signal(signal.SIGTERM)
        self.assertEqual(self.titler.wait(60 * harness.SLOW), 0)
        self.assertLess(time.monotonic(), deadline)
        self.appliance.signal(signal.SIGCONT)

    def test_a_sibling_that_is_started_anew(self):
        self.open_title(self.title)
        self.assertEqual(self.appliance.stop(), 0)
        self.programs.remove(self.appliance)
        self.appliance = harness.session.Appliance(harness.BUILD, os.path.join(self.keep, "anew.log"),
                                                   self.environment)
        self.addCleanup(self.appliance.stop)
        self.programs.append(self.appliance)
        self.appliance.wait_event("ready", 30 * harness.SLOW, 0)
        self.close_window()  # its last call arrives at the new one

    def test_strangers_take_no_result_away(self):
        self.command("register")
        for client in STRANGE_CLIENTS:
            self.wire.call(wire.REGISTER, wire.pack_int32(7) + wire.pack_int32(client))
        self.wire.call(wire.REGISTER, b"\xc0")
        # Behind them on the same connection comes a call that is answered.
        start = self.appliance.mark()
        self.make_calls(1)
        self.wait_call("SystemSetupManager", "getLanguageInfo", start)
        count = len(self.titles(self.folder()))
        self.command(f"create {CREATE_TYPE}")
        self.wait_shown()
        self.wait_picker()
        self.choose_folder("Welcome")
        self.choose_template(0)
        self.wait_titles(self.folder(), count + 1)
        self.display.wait_until_still()
        deadline = harness.session.deadline_after(MOST_SECONDS * harness.SLOW)
        self.close_window()
        self.assertLess(time.monotonic(), deadline)
        self.assertEqual([result["type"] for result in self.results(start)], [CREATE_TYPE])


if __name__ == "__main__":
    unittest.main()

"""Siblings that come late, or go and come back."""
import os
import signal
import unittest

import harness
import wire


class LateSiblings(harness.TitlerTest):
    def start_programs(self):
        """Each test starts its own."""

    def start_titler_alone(self):
        self.titler = harness.session.start_titler(harness.BUILD, os.path.join(self.keep, "titler.log"),
                                                   self.environment)
        self.addCleanup(self.titler.stop)
        harness.session.wait_listening(self.titler, harness.session.TITLER_PORT + self.offset, 60 * harness.SLOW)

    def start_appliance(self):
        self.appliance = harness.session.Appliance(harness.BUILD, os.path.join(self.keep, "appliance.log"),
                                                   self.environment)
        self.addCleanup(self.appliance.stop)

    def test_a_request_of_before_is_answered_when_the_siblings_come(self):
        # The titler listens before its siblings do, and waits for them with its interface built and hidden.
        self.start_titler_alone()
        title = self.titles(self.folder())[0]
        early = wire.Connection(self.offset)
        self.addCleanup(early.close)
        early.call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_wide(title.path))
        early.wait_acknowledgement()
        self.assertFalse(self.stays_shown(1.0))
        self.titler.check()
        self.start_appliance()
        self.wait_shown(30)
        self.assert_canvas_shows(title, mean=1.0, visible=0.01)
        self.command("wait-titler")
        self.wait_call("APPEventFilter", "registerNotify", 0)
        self.close_window()
        self.open_title(title)
        self.close_window()

    def test_a_signal_ends_a_titler_that_waits(self):
        self.start_titler_alone()
        self.titler.signal(signal.SIGTERM)
        self.start_appliance()
        self.assertEqual(self.titler.wait(40 * harness.SLOW), 0)

    def test_siblings_that_go_and_come_back(self):
        self.start_appliance()
        self.start_titler()
        title = self.titles(self.folder())[0]
        self.open_title(title)
        self.appliance.stop()
        self.click_tool("Close")
        self.wait_hidden()
        self.titler.check()
        early = wire.Connection(self.offset)
        self.addCleanup(early.close)
        early.call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_wide(title.path))
        self.wait_shown()
        self.assert_canvas_shows(title, mean=1.0, visible=0.01)


if __name__ == "__main__":
    unittest.main()

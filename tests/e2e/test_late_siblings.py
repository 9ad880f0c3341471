"""Siblings that come late, or go and come back."""
import os
import signal
import socket
import unittest

import harness
import wire

TOP_WINDOW_TITLER = 1
# Seconds that an end at once may take on a busy machine.
AT_ONCE = 10
HAND_SHAKES = (("SystemSetupManager", "registerNotifyCallBack"), ("FileManagerController", "registerNotify"),
               ("MessageCenter", "registerNotify"), ("PowerManager", "registerNotify"),
               ("ProjectDataManager", "registerNotifyCallBack"), ("APPEventFilter", "registerNotify"))

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

    def assert_introduced(self):
        """The window was shown after the hand-shakes, and named itself with the client id that it was given."""
        top = self.wait_call("MessageCenter", "setTopWindow", 0)
        self.assertEqual((top["clientId"] >= 0, top["topWindow"]), (True, TOP_WINDOW_TITLER), top)
        calls = [(event["service"], event["method"]) for event in self.appliance.since(0) if event["event"] == "call"]
        for hand_shake in HAND_SHAKES:
            self.assertLess(calls.index(hand_shake), calls.index(("MessageCenter", "setTopWindow")), calls)

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
        self.assert_introduced()
        self.assert_canvas_shows(title, mean=1.0, visible=0.01)
        self.command("wait-titler")
        self.wait_call("APPEventFilter", "registerNotify", 0)
        self.close_window()
        self.open_title(title)
        self.close_window()

    def test_a_signal_ends_a_titler_that_waits(self):
        for number in (signal.SIGTERM, signal.SIGINT):
            with self.subTest(signal=number):
                self.start_titler_alone()
                self.titler.signal(number)
                self.assertEqual(self.titler.wait(AT_ONCE * harness.SLOW), 0)

    def test_a_signal_ends_a_titler_that_waits_for_one_of_two(self):
        sub_panel = socket.create_server(("127.0.0.1", harness.session.SUB_PANEL_PORT + self.offset))
        self.addCleanup(sub_panel.close)
        self.start_titler_alone()
        connection, _ = sub_panel.accept()
        self.addCleanup(connection.close)
        self.wait_for_report(harness.session.MAIN_PORT)
        self.assertNotIn(str(harness.session.SUB_PANEL_PORT + self.offset), self.reports()[0])
        self.titler.signal(signal.SIGTERM)
        self.assertEqual(self.titler.wait(AT_ONCE * harness.SLOW), 0)

    def reports(self):
        """What the titler has said of its waiting."""
        with open(self.titler.log, encoding="utf-8") as log:
            return [line for line in log if line.startswith("titler: waiting")]

    def wait_for_report(self, *ports):
        report = harness.session.wait_until(self.reports, 20 * harness.SLOW, "a word about the waiting")[0]
        for port in ports:
            self.assertIn(f"port {port + self.offset}", report)

    def test_a_titler_that_waits_says_so(self):
        self.start_titler_alone()
        self.wait_for_report(harness.session.SUB_PANEL_PORT, harness.session.MAIN_PORT)
        self.start_appliance()
        self.wait_call("APPEventFilter", "registerNotify", 0)
        self.assertEqual(len(self.reports()), 1)

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

"""Who may touch: one finger's widget at a time, and one process at a time, by a touch screen and the real sockets."""
import time
import unittest

import harness
import session
import touchscreen

SIBLING = 1
TOUCHED, REMEMBERED = 1, 2
# On the ground of the window, between two buttons of the tools bar.
BESIDE_THE_BUTTONS = (747, 41)
BELOW_THE_BAR = (1300, 300)
CORNER = (640, 780)
SECOND_TITLE = (164, 269)


class TouchLock(harness.TitlerTest):
    display_class = touchscreen.TouchDisplay

    def setUp(self):
        super().setUp()
        self.display.xdotool("mousemove", 300, 1000)
        self.open_title(self.titles(self.folder())[3])
        self.fresh = self.canvas()

    def tap(self, name):
        self.display.tap(*harness.TOOL_POINTS[name])

    def locks(self, start):
        """The touch locks that the titler has announced since start, as type and state."""
        return [(call["lockType"], call["flag"]) for call in self.calls("APPEventFilter", "postAPPEventFilter", start)]

    def lock(self, kind, on):
        self.command(f"lock {kind} {int(on)} {SIBLING}")
        self.display.wait_until_still()

    def assert_fingers_work(self):
        """At once: what a stuck lock swallows is lost, whatever frees it later."""
        start = self.appliance.mark()
        self.tap("New Text")
        self.wait_keyboard(start)

    def assert_new_text_does_nothing(self):
        start = self.appliance.mark()
        self.tap("New Text")
        self.display.wait_until_still()
        self.assertEqual(self.canvas(), self.fresh)
        self.assertEqual(self.calls("SoftKeyBoardController", "show", start), [])

    def test_a_touch_is_announced_and_taken_back(self):
        start = self.appliance.mark()
        self.display.down(*harness.TOOL_POINTS["Safe Area"])
        session.wait_until(lambda: self.locks(start) == [(TOUCHED, True)], 20 * harness.SLOW, "the lock")
        self.display.up(*harness.TOOL_POINTS["Safe Area"])
        session.wait_until(lambda: self.locks(start) == [(TOUCHED, True), (TOUCHED, False)], 20 * harness.SLOW,
                           "its release")

    def test_a_siblings_lock_shuts_every_finger_until_it_is_released(self):
        for kind in (TOUCHED, REMEMBERED):
            with self.subTest(kind=kind):
                self.lock(kind, True)
                self.assert_new_text_does_nothing()
                self.lock(kind, False)
                self.tap("Safe Area")
                self.display.wait_until_still()
                self.assertNotEqual(self.canvas(), self.fresh)
                self.tap("Safe Area")
                self.display.wait_until_still()
                self.assertEqual(self.canvas(), self.fresh)
        self.assert_fingers_work()

    def test_both_locks_must_be_released(self):
        self.lock(TOUCHED, True)
        self.lock(REMEMBERED, True)
        self.lock(TOUCHED, False)
        self.assert_new_text_does_nothing()
        self.lock(REMEMBERED, False)
        self.assert_fingers_work()

    def test_a_press_asks_the_sibling_to_give_way(self):
        self.lock(REMEMBERED, True)
        start = self.appliance.mark()
        self.tap("New Text")
        self.wait_call("APPEventFilter", "postRestoreOriginal", start)
        self.assertEqual(self.canvas(), self.fresh)
        self.lock(REMEMBERED, False)
        self.assert_fingers_work()

    def test_a_sibling_that_asks_to_give_way_hears_of_every_control(self):
        start = self.appliance.mark()
        self.command(f"restore-original {SIBLING}")
        # Move mode, the slider of the edge, the Canvas menu and the two font lists, whether they are open or not.
        wanted = [(REMEMBERED, False)] * 5
        session.wait_until(lambda: self.locks(start) == wanted, 20 * harness.SLOW, "the notices")
        self.assert_fingers_work()

    def test_a_siblings_lock_breaks_the_touch_that_goes_on(self):
        self.display.down(*harness.TOOL_POINTS["Safe Area"])
        self.lock(TOUCHED, True)
        self.display.up(*harness.TOOL_POINTS["Safe Area"])
        self.display.wait_until_still()
        self.lock(TOUCHED, False)
        self.assertEqual(self.canvas(), self.fresh)
        self.assert_fingers_work()

    def test_a_siblings_lock_during_a_tap_on_a_title_opens_no_menu(self):
        start = self.appliance.mark()
        self.display.down(*SECOND_TITLE)
        session.wait_until(lambda: self.locks(start) == [(TOUCHED, True)], 20 * harness.SLOW, "the lock")
        start = self.appliance.mark()
        self.lock(TOUCHED, True)
        self.display.up(*SECOND_TITLE)
        time.sleep(1.5)  # twice what a hold takes
        self.display.wait_until_still()
        # Neither the menu nor a mark of the title that it would be for.
        self.assertEqual(self.locks(start), [])
        self.assertEqual(self.canvas(), self.fresh)
        self.lock(TOUCHED, False)
        self.display.tap(*SECOND_TITLE)
        session.wait_until(lambda: self.canvas() != self.fresh, 20 * harness.SLOW, "the second title")

    def test_a_finger_on_the_ground_of_the_window_leaves_the_others_free(self):
        self.display.tap(*BESIDE_THE_BUTTONS)
        self.display.wait_until_still()
        self.assert_fingers_work()

    def test_a_finger_that_slides_off_the_canvas_button_is_lifted_for_it(self):
        self.display.drag(harness.TOOL_POINTS["Canvas"], BELOW_THE_BAR)
        self.display.wait_until_still()
        self.assertNotEqual(self.canvas(), self.fresh, "the menu does not show")
        self.display.tap(*CORNER)
        self.display.wait_until_still()
        self.assertEqual(self.canvas(), self.fresh)
        self.assert_fingers_work()


if __name__ == "__main__":
    unittest.main()

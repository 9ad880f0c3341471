"""For tests that kill the titler in the middle of its work."""
import signal
import threading
import unittest
import unittest.mock

import harness


class MortalTitler:
    """Mixed into a test case: nothing waits for a titler that is dead, since that does nothing any more."""

    def setUp(self):
        wait_until = harness.session.wait_until

        def wait(condition, timeout, what):
            def alive_and_true():
                if self.titler:
                    self.titler.check()
                return condition()

            return wait_until(alive_and_true, timeout, what)

        patch = unittest.mock.patch.object(harness.session, "wait_until", wait)
        patch.start()
        # As soon as the test is over: the harness's own clean-up comes later, while the next test runs.
        unittest.TestCase.addCleanup(self, patch.stop)
        super().setUp()

    def wait_call(self, service, method, start, timeout=20):
        return harness.session.wait_until(lambda: self.calls(service, method, start), timeout * harness.SLOW,
                                          f"{service}.{method}")[0]

    def wait_closed(self, start):
        harness.session.wait_until(
            lambda: any(call["topWindow"] == harness.TOP_WINDOW_MAIN
                        for call in self.calls("MessageCenter", "setTopWindow", start)),
            20 * harness.SLOW, "the end of the session")

    def kill_during(self, work, seconds):
        """Kills the titler so long after work has begun; when work is done sooner, then."""
        killed = threading.Event()

        def kill():
            killed.set()
            self.titler.signal(signal.SIGKILL)

        timer = threading.Timer(seconds, kill)
        timer.start()
        try:
            work()
        except Exception:  # pylint: disable=broad-exception-caught
            # What fails after the kill fails because of it.
            if not killed.is_set():
                raise
        finally:
            timer.join()
        self.assertEqual(self.titler.wait(10), -signal.SIGKILL)

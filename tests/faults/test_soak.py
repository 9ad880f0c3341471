"""Sessions without end in one process: memory, descriptors, threads and files in use must stay flat.

TITLER_SESSIONS is their number; the suite plays a few.
"""
import os
import subprocess
import sys
import unittest

import faults

SESSIONS = int(os.environ.get("TITLER_SESSIONS", "60"))
WARM = 20  # sessions until everything has been used once
GROWTH = 6 * 1024  # kilobytes, whatever the number of sessions


class Soak(unittest.TestCase):
    def test_sessions_stay_flat(self):
        ground = faults.Ground()
        self.addCleanup(ground.close)
        ground.fresh()
        environment = ground.environment()
        done = subprocess.run([faults.PROGRAM, "soak", ground.data, str(SESSIONS)], env=environment, text=True,
                              capture_output=True, check=False, timeout=600 + 10 * SESSIONS)
        self.assertEqual(done.returncode, 0, done.stderr[-2000:])
        run = faults.Run(done, False)
        looks = [line for line in run.lines if "session" in line]
        warm = [look for look in looks if look["session"] <= WARM]
        later = [look for look in looks if look["session"] > WARM]
        print(f"{SESSIONS} sessions: {warm[-1]} to {later[-1]}", file=sys.stderr)
        for what in ("descriptors", "threads", "files"):
            self.assertLessEqual(max(look[what] for look in later), max(look[what] for look in warm), what)
        # Single looks swing with what the allocator holds back; what grows shows in the last ones.
        settled = min(look["kilobytes"] for look in later[-4:])
        self.assertLess(settled - max(look["kilobytes"] for look in warm[-2:]), GROWTH)
        self.assertEqual(ground.order(faults.FIRST_FOLDER), ["a", "b", "c", "d"])
        self.assertEqual(faults.check_end(run) + ground.problems_of_files(), [])


if __name__ == "__main__":
    unittest.main()

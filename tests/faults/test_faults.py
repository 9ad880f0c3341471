"""Each file operation of an operator's session fails once, or it and all that follow, with each error; or the process is
killed in it. After each: every title is whole, old or new, none is lost, and the operator was told of what was not done.

The suite takes every tenth operation. TITLER_FAULTS is the distance between the operations (1: all of them), TITLER_FAULTS_HOW
picks from once, on, healed (the disk is well again before Close) and kill, TITLER_FAULT plays a single one:
"17 ENOSPC once". What went wrong stands in faults.txt in the folder of the tests, a line for each.
"""
import os
import sys
import unittest

import faults

STEP = int(os.environ.get("TITLER_FAULTS", "10"))
HOW = os.environ.get("TITLER_FAULTS_HOW", "once on healed kill").split()
SINGLE = os.environ.get("TITLER_FAULT", "").split()
TABLE = os.path.join(faults.BUILD, "tests", "faults.txt")


class Faults(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.ground = faults.Ground()
        cls.addClassCleanup(cls.ground.close)
        cls.counts, cls.wanted = {}, None
        for error in faults.ERRORS:
            cls.ground.fresh()
            run = cls.ground.start("play", error=error)
            cls.counts[error] = run.count
            if cls.wanted is None:
                done = next(line for line in reversed(run.lines) if "done" in line)
                cls.wanted = {"folders": done["folders"], "templates": len(cls.ground.templates())}
                cls.ground.learn_pictures()
                cls.first = run

    def play(self, number, error, how):
        """One session; what is wrong after it, and the operation that was chosen."""
        self.ground.fresh()
        if how == "kill":
            run = self.ground.start("play", number, error, how)
            looked = self.ground.start("look")
            return faults.check_killed(self.ground, run, looked), run.last("begin").get("begin", "")
        command = "play-healed" if how == "healed" else "play"
        run = self.ground.start(command, number, error, "on" if how == "healed" else how)
        return faults.check_failed(self.ground, run, self.wanted), run.hit

    def cases(self):
        """Every STEPth operation. Where not all are taken, the errors and manners take turns."""
        if SINGLE:
            return [(int(SINGLE[0]), SINGLE[1], SINGLE[2])]
        most = max(self.counts.values())
        if STEP == 1:
            errors = {how: ("ENOSPC",) if how == "kill" else faults.ERRORS for how in HOW}
            return [(number, error, how) for how in HOW for error in errors[how]
                    for number in range(1, self.counts[error] + 1)]
        chosen = []
        for turn, number in enumerate(range(1, most + 1, STEP)):
            for shift, how in enumerate(HOW):
                error = "ENOSPC" if how == "kill" else faults.ERRORS[(turn + shift) % len(faults.ERRORS)]
                if number + shift <= self.counts[error]:
                    chosen.append((number + shift, error, how))
        return chosen

    def test_session_without_a_fault(self):
        self.assertEqual(faults.check_failed(self.ground, self.first, self.wanted), [])
        self.assertEqual(self.first.told, [])
        self.assertEqual(sorted(self.wanted["folders"]), ["copies", "news", "sports"])
        self.assertEqual([len(self.wanted["folders"][name]) for name in ("copies", "news", "sports")], [6, 6, 1])
        self.assertEqual(self.wanted["templates"], 2)
        self.assertGreater(min(self.counts.values()), 100)

    def test_faults(self):
        failed = []
        cases = self.cases()
        with open(TABLE, "w", encoding="utf-8") as table:
            for number, error, how in cases:
                wrong, hit = self.play(number, error, how)
                hit = hit.replace(self.ground.folder, "")
                for what in dict.fromkeys(wrong):
                    line = f"{number}\t{error}\t{how}\t{hit}\t{what}"
                    table.write(line + "\n")
                    table.flush()
                if wrong:
                    failed.append(f"{number} {error} {how} ({hit}): {'; '.join(dict.fromkeys(wrong))}")
        print(f"{len(cases)} sessions of {self.counts} operations, {len(failed)} went wrong", file=sys.stderr)
        self.assertEqual(failed, [])


if __name__ == "__main__":
    unittest.main()

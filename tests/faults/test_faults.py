"""Each file operation of an operator's session fails once, or it and all that follow, with each error; or the process is
killed in it. After each: every title is whole, old or new, none is lost, and the operator was told of what was not done.

The suite takes every tenth operation, and errors and manners by turns. TITLER_FAULTS is the distance between the operations;
TITLER_FAULTS_HOW names manners (once, on, healed: the disk is well again before Close, kill) and TITLER_FAULTS_ERRORS errors, all
of which are played then. TITLER_FAULTS=1 alone plays everything. TITLER_FAULT plays a single one: "17 ENOSPC once". What
went wrong stands in faults.txt in the folder of the tests, a line for each.
"""
import os
import sys
import unittest

import faults

STEP = int(os.environ.get("TITLER_FAULTS", "10"))
HOW = os.environ.get("TITLER_FAULTS_HOW", "once on healed kill").split()
ERRORS = os.environ.get("TITLER_FAULTS_ERRORS", " ".join(faults.ERRORS)).split()
BY_TURNS = STEP > 1 and not {"TITLER_FAULTS_HOW", "TITLER_FAULTS_ERRORS"} & set(os.environ)
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
                cls.told = run.told
                cls.wrong = faults.check_failed(cls.ground, run, cls.wanted)

    def play(self, number, error, how):
        """One session; what is wrong after it, and the operation that was chosen."""
        self.ground.fresh()
        if how == "kill":
            run = self.ground.start("play", number, error, how)
            looked = self.ground.start("look")
            return faults.check_killed(self.ground, run, looked), run.last("begin").get("begin", "")
        command = "play-healed" if how == "healed" else "play"
        run = self.ground.start(command, number, error, "on" if how == "healed" else how)
        return faults.check_failed(self.ground, run, self.wanted, how, reads_failed=error == "EIO"), run.hit

    def cases(self):
        """Numbers of operations, errors and manners."""
        if SINGLE:
            return [(int(SINGLE[0]), SINGLE[1], SINGLE[2])]
        # Reading is counted for EIO alone, and a kill in it is none.
        manners = [(error, how) for how in HOW for error in (ERRORS if how != "kill" else ["ENOSPC"])]
        if BY_TURNS:
            turns = [(faults.ERRORS[turn % len(faults.ERRORS)] if how != "kill" else "ENOSPC", how)
                     for turn, how in enumerate(HOW * len(faults.ERRORS))]
            return [(number, *turns[turn % len(turns)]) for turn, number in enumerate(range(1, max(self.counts.values()), STEP))
                    if number <= self.counts[turns[turn % len(turns)][0]]]
        return [(number, error, how) for error, how in manners for number in range(1, self.counts[error] + 1, STEP)]

    def test_session_without_a_fault(self):
        self.assertEqual(self.wrong, [])
        self.assertEqual(self.told, [])
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

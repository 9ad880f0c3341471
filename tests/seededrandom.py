"""Random numbers for tests that play at random, from a seed that repeats a run."""
import os
import random
import time


class SeededRandom(random.Random):
    """Begins with the seed in TITLER_SEED if that is set, else with the usual one of the test, else with one that is
    another in each run. The seed is printed, and stays in first_seed."""

    def __init__(self, usual=None):
        if usual is None:
            usual = time.time_ns() % 2 ** 32
        self.first_seed = int(os.environ.get("TITLER_SEED", usual))
        super().__init__(self.first_seed)
        print(f"TITLER_SEED={self.first_seed} repeats this run", flush=True)

"""Resident memory of the titler over many sessions, each of which opens a title, adds a text and saves it.

With --list instead: with a long folder in the list.
Runs the real programs on an X server of their own; started by titler_bench --memory. Needs Xvfb, openbox and xdotool.
"""
import argparse
import os
import subprocess
import sys
import tempfile
import time

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
sys.path.insert(0, os.path.join(ROOT, "scripts"))

import session  # noqa: E402  pylint: disable=wrong-import-position

OFFSET = 27000
WARM_UP = 25  # sessions after which caches and fonts are filled
TITLES_A_FOLDER = 90
GROWTH_AIM = 2048  # kB
TOTAL_AIM = 1.4
LONG_FOLDER = 99
VERY_LONG_FOLDER = 998
TITLE_AIM = 150  # kB
VERY_LONG_AIM = 80 * 1000  # kB
SMALL_PICTURE = 240 * 135 * 4 / 1024  # kB, decoded
LIST_AIM = 1.3
NEW_TEXT = (810, 41)  # the middle of the buttons, in pixels of the screen
CLOSE = (1850, 41)
TOP_WINDOW_MAIN = 2


def resident(pid):
    """Resident memory of a process in kB, and the part of it that is no file."""
    values = {}
    with open(f"/proc/{pid}/status", encoding="ascii") as status:
        for line in status:
            name, _, value = line.partition(":")
            if name in ("VmRSS", "RssAnon"):
                values[name] = int(value.split()[0])
    return values["VmRSS"], values["RssAnon"]


class Run:
    """The programs on their display, with titles in a data path of their own."""

    def __init__(self, build, folder, count):
        self.build = build
        environment = session.program_environment(
            build, K2SYS_AC_ROOT="", K2SYS_AC_DATA=os.path.join(folder, "d"), K2SYS_LOG_DIR=folder,
            K2SYS_PORT_OFFSET=OFFSET)
        base = subprocess.run([self.program("titler_provision")], env=environment, check=True,
                              stdout=subprocess.PIPE, text=True).stdout.splitlines()[-1]
        self.base = base
        self.paths = []
        while len(self.paths) < count:
            self.paths += self.write_titles(f"Folder{len(self.paths)}", TITLES_A_FOLDER)
        del self.paths[count:]
        self.folder = folder
        self.display = session.Display(os.path.join(folder, "x"), environment)
        self.environment = self.display.environment
        self.appliance = self.titler = None

    def write_titles(self, folder, count):
        titles = os.path.join(self.base, "resources", "Titles", folder)
        os.makedirs(titles)
        subprocess.run([self.program("titler_bench"), "--write-titles", titles, str(count)], check=True)
        return sorted(os.path.join(titles, name) for name in os.listdir(titles)
                      if name.endswith(".xml") and not name.startswith("."))

    def program(self, name):
        return os.path.join(self.build, "bin", name)

    def bare_window(self):
        process = session.Process([self.program("bare_window"), "--stay"], os.path.join(self.folder, "bare.log"),
                                  self.environment)
        session.wait_until(lambda: self.display.find_window("bare_window"), 20, "the bare window")
        self.display.wait_until_still()
        memory = resident(process.pid)
        process.stop()
        return memory

    def start(self):
        self.appliance = session.Appliance(self.build, os.path.join(self.folder, "appliance.log"), self.environment)
        for port in (session.MAIN_PORT, session.SUB_PANEL_PORT):
            session.wait_listening(self.appliance, port + OFFSET)
        self.titler = session.start_titler(self.build, os.path.join(self.folder, "titler.log"), self.environment)
        session.wait_listening(self.titler, session.TITLER_PORT + OFFSET)
        self.command("wait-titler")

    def command(self, line):
        start = self.appliance.mark()
        self.appliance.command(line)
        done = self.appliance.wait_for(lambda event: event.get("command") == line and event["event"] != "call", 30,
                                       start, f"an answer to {line}")
        if done["event"] != "ok":
            raise session.SessionError(f"{line}: {done}")

    def shown(self):
        self.titler.check()
        return self.display.find_window("Titler")

    def open(self, path):
        self.command(f'edit "{path}"')
        session.wait_until(self.shown, 30, "the window")
        self.display.wait_until_still()

    def edit_and_close(self):
        start = self.appliance.mark()
        self.display.click(*NEW_TEXT)
        self.appliance.wait_event("call", 20, start, service="SoftKeyBoardController", method="show")
        self.command("string Breaking 快讯")
        start = self.appliance.mark()
        self.display.click(*CLOSE)
        session.wait_until(lambda: not self.shown(), 30, "the window to go")
        self.appliance.wait_for(lambda event: event.get("method") == "setTopWindow" and
                                event["args"]["topWindow"] == TOP_WINDOW_MAIN, 20, start, "the end of the session")

    def stop_programs(self):
        for process in (self.titler, self.appliance):
            if process:
                process.stop()
        self.titler = self.appliance = None

    def stop(self):
        self.stop_programs()
        self.display.stop()


def measure(run):
    bare, bare_own = run.bare_window()
    print(f"bare window: {bare} kB, of it {bare_own} kB of its own", flush=True)
    run.start()
    before = opened = None
    saved = 0
    started = time.monotonic()
    for number, path in enumerate(run.paths, 1):
        was = os.stat(path).st_mtime_ns
        run.open(path)
        opened = resident(run.titler.pid)
        run.edit_and_close()
        saved += os.stat(path).st_mtime_ns != was
        if number == 1:
            print(f"one title open: {opened[0]} kB, of it {opened[1]} kB of its own", flush=True)
        if number == min(WARM_UP, len(run.paths)):
            before = resident(run.titler.pid)
        if number % WARM_UP == 0:
            now = resident(run.titler.pid)
            print(f"{number} sessions, {saved} saved: {now[0]} kB, of it {now[1]} kB of its own "
                  f"({time.monotonic() - started:.0f} s)", flush=True)
    after = resident(run.titler.pid)
    growth = after[0] - before[0]
    if saved != len(run.paths):
        raise session.SessionError(f"only {saved} of {len(run.paths)} titles were saved")
    print(f"growth from session {min(WARM_UP, len(run.paths))} to {len(run.paths)}: {growth} kB (aim {GROWTH_AIM})")
    print(f"with one title open: {opened[0]} kB, {opened[0] / bare:.2f} of the bare window's (aim {TOTAL_AIM})")
    return growth <= GROWTH_AIM and opened[0] <= TOTAL_AIM * bare


def settled(run):
    """Resident memory once it no longer changes."""
    last = []

    def is_same():
        last.append(resident(run.titler.pid))
        return len(last) > 5 and len(set(last[-5:])) == 1

    session.wait_until(is_same, 30, "the memory to settle")
    return last[-1]


def measure_list(run):
    """A process of its own for each folder; the same title is on the canvas of all."""
    sizes = []
    for folder, count in (("Short", 1), ("Long", LONG_FOLDER), ("VeryLong", VERY_LONG_FOLDER)):
        paths = run.write_titles(folder, count)
        run.start()
        run.open(paths[0])
        sizes.append(settled(run))
        print(f"{count} in the list: {sizes[-1][0]} kB, of it {sizes[-1][1]} kB of its own", flush=True)
        run.stop_programs()
    floor = sizes[0][0] + (LONG_FOLDER - 1) * SMALL_PICTURE
    ratio = sizes[1][0] / floor
    print(f"with {LONG_FOLDER}: {ratio:.2f} of one and the pictures of the others, {floor:.0f} kB (aim {LIST_AIM})")
    grown = (sizes[1][0] - sizes[0][0]) / (LONG_FOLDER - 1)
    print(f"a title in the list: {grown:.0f} kB, its decoded picture {SMALL_PICTURE:.0f} (aim {TITLE_AIM})")
    print(f"with {VERY_LONG_FOLDER}: {sizes[2][0]} kB (aim {VERY_LONG_AIM})")
    return ratio <= LIST_AIM and grown <= TITLE_AIM and sizes[2][0] <= VERY_LONG_AIM


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("build")
    parser.add_argument("count", nargs="?", type=int, default=500)
    parser.add_argument("--list", action="store_true")
    options = parser.parse_args()
    with tempfile.TemporaryDirectory(prefix="titler-") as folder:
        run = Run(options.build, folder, 0 if options.list else options.count)
        try:
            return 0 if (measure_list(run) if options.list else measure(run)) else 1
        except session.SessionError as error:
            print(f"memory: {error}", file=sys.stderr)
            return 2
        finally:
            run.stop()


if __name__ == "__main__":
    sys.exit(main())

"""What the end-to-end tests share: a titler and an appliance on a display and on data of their own.

Every test gets a fresh data path, log folder, display and pair of processes. When a test fails, its screenshot, the
logs and the picture differences stay under tests/e2e/ in the build tree.
"""
import atexit
import contextlib
import fcntl
import json
import os
import re
import shutil
import socket
import subprocess
import sys
import tempfile
import threading
import time
import unittest
import xml.etree.ElementTree
import zlib

HERE = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, os.path.join(os.path.dirname(os.path.dirname(HERE)), "scripts"))
sys.path.insert(0, os.path.dirname(HERE))

import renderedagain  # noqa: E402  pylint: disable=wrong-import-position
import samples  # noqa: E402  pylint: disable=wrong-import-position
import session  # noqa: E402  pylint: disable=wrong-import-position

BUILD = os.environ.get("TITLER_BUILD", os.path.join(session.ROOT, "build"))
# Sanitizers make everything slower, never wrong.
SLOW = 4 if os.path.basename(BUILD).endswith("asan") else 1
# Whether the pictures that each test leaves are rendered again and compared.
RENDER_AGAIN = os.environ.get("TITLER_RENDER_AGAIN") == "1"

SANITIZER_REPORT = re.compile(r"ERROR: \w*Sanitizer|WARNING: \w*Sanitizer|runtime error:")

# Where things are in the window, in its own pixels.
CANVAS = (609, 97, 1280, 720)
TOP_WINDOW_MAIN = 2
LIST_POINT = (380, 130)
LIST_ROW = 143
# The option menu opens under the point that was pressed: from there to the middle of its first entry, and on.
LIST_MENU_ENTRIES = ["Create New", "Copy", "Paste", "Delete", "Save as Template"]
LIST_MENU_TOP = 50
LIST_MENU_ROW = 60
# The template picker: the middle of its first template, the way to the next one, its columns and its buttons.
TEMPLATE_POINT = (431, 324)
TEMPLATE_STEP = (258, 153)
TEMPLATE_COLUMNS = 4
TEMPLATE_HEADING = (294, 140, 130, 36)
TEMPLATE_TABS = {"Preset": (356, 216), "User": (475, 216)}
TEMPLATE_BUTTONS = {"Select": (1285, 907), "Cancel": (1514, 907), "Delete": (1491, 829)}
# The folder picker: the middle of its first row and of its buttons.
PICKER_ROW = (800, 306)
PICKER_ROW_HEIGHT = 48
PICKER_BUTTONS = {"Duplicate": (513, 857), "New Folder": (681, 857), "Open": (1239, 857), "Cancel": (1407, 857)}
# Points of the pickers' Cancel buttons beside the text, which are brighter than anything else of the window there.
PICKER_LIT, TEMPLATES_LIT, LIT = (1350, 840), (1454, 890), 65
PICTURES = {"_1920.png": (1920, 1080), "_960.png": (960, 540), "_240.png": (240, 135), "_240S.png": (240, 135)}


def pngdiff(*arguments):
    done = subprocess.run([os.path.join(BUILD, "tests", "titler_pngdiff"), *map(str, arguments)],
                          capture_output=True, text=True, check=False)
    if done.returncode != 0:
        raise session.SessionError(f"titler_pngdiff {arguments}: {done.stderr.strip()}")
    return json.loads(done.stdout)


class PortOffset:
    """An offset at which all ports are free, kept from other suites on this machine until it is released."""

    def __init__(self):
        # The search starts at a place of this process: several suites can run at once.
        for number in range(1000):
            self.value = 20000 + 10 * ((os.getpid() + number) % 1000)
            path = os.path.join(tempfile.gettempdir(), f"titler-ports-{self.value}.lock")
            self.lock = open(path, "w", encoding="ascii")  # pylint: disable=consider-using-with
            try:
                fcntl.flock(self.lock, fcntl.LOCK_EX | fcntl.LOCK_NB)
                for port in (session.MAIN_PORT, session.SUB_PANEL_PORT, session.TITLER_PORT):
                    with socket.socket() as probe:
                        probe.bind(("127.0.0.1", port + self.value))
                return
            except OSError:
                self.lock.close()
        raise session.SessionError("no free ports")

    def release(self):
        self.lock.close()


class Title:
    """A title file as it lies on disk; read anew at each question."""

    def __init__(self, path):
        self.path = path
        self.stem = path[:-len(".xml")]

    def root(self):
        return xml.etree.ElementTree.parse(self.path).getroot()

    def texts(self):
        """The plain text of each text object, in the order of the file."""
        return [content.get("text") for content in self.root().iter("content")]

    def items(self):
        """For each text object the texts of its runs."""
        return [[item.get("text") for item in content.iter("text-item")] for content in self.root().iter("content")]

    def picture(self, suffix):
        return self.stem + suffix


class Ending(threading.Thread):
    """Ends the programs of a test that has passed while the next one begins: the end of a titler takes seconds. Leaks are
    only looked for at an orderly end, so what the programs leave is judged here."""

    def __init__(self, test):
        super().__init__()
        self.test = test
        self.problem = None
        self.start()

    def run(self):
        try:
            with self.test.at_end:
                self.problem = self.test.end_and_judge()
        except Exception as error:  # pylint: disable=broad-exception-caught
            self.problem = repr(error)
        if self.problem is None:
            shutil.rmtree(self.test.keep, ignore_errors=True)

    def verify(self):
        """Waits until the programs have ended."""
        self.join()
        if self.problem is not None:
            raise AssertionError(f"{self.test.id()}: {self.problem}, see {self.test.keep}")


class TitlerTest(unittest.TestCase):
    """A test case with a running appliance and titler."""

    ending = None
    samples = None
    # Characters to be typed that an ordinary keyboard has not.
    extra_keys = ""
    titler_arguments = ()
    display_class = session.Display
    environment_changes = {}

    def __init__(self, *arguments):
        super().__init__(*arguments)
        self.at_end = contextlib.ExitStack()

    @classmethod
    def setUpClass(cls):
        super().setUpClass()
        cls.addClassCleanup(cls.wait_for_ending)

    @classmethod
    def wait_for_ending(cls):
        """Waits until the programs of the test before have ended, and fails if they did not end well."""
        ending, TitlerTest.ending = TitlerTest.ending, None
        if ending:
            ending.verify()

    def addCleanup(self, function, /, *arguments, **options):
        """As unittest's, but called after the programs have ended."""
        self.at_end.callback(function, *arguments, **options)

    def setUp(self):
        super().addCleanup(self.clean_up)
        self.keep = os.path.join(BUILD, "tests", "e2e", self.id().split(".", 1)[-1])
        shutil.rmtree(self.keep, ignore_errors=True)
        os.makedirs(self.keep)
        # The platform's buffers for paths are short, so the data path is, too.
        self.work = tempfile.mkdtemp(prefix="titler-")
        self.addCleanup(shutil.rmtree, self.work, ignore_errors=True)
        ports = PortOffset()
        self.addCleanup(ports.release)
        self.offset = ports.value
        self.environment = session.program_environment(
            BUILD, K2SYS_AC_ROOT="", K2SYS_AC_DATA=os.path.join(self.work, "d"), K2SYS_LOG_DIR=self.keep,
            K2SYS_PORT_OFFSET=self.offset, **self.environment_changes)
        self.display = None
        self.appliance = None
        self.titler = None
        self.programs = []
        self.base = self.provision()
        self.display = self.display_class(os.path.join(self.work, "x"), self.environment)
        self.addCleanup(self.display.stop)
        self.display.add_keys(self.extra_keys)
        self.environment = self.display.environment
        self.start_programs()

    def provision(self):
        """Copies the sample data: that of TITLER_SAMPLES, which one run of the suite has made for all, or that which the
        first test of this process makes."""
        cls = TitlerTest
        if cls.samples is None:
            cls.samples = os.environ.get("TITLER_SAMPLES")
        if cls.samples is None:
            cls.samples = tempfile.mkdtemp(prefix="titler-")
            atexit.register(shutil.rmtree, cls.samples, ignore_errors=True)
            samples.make(BUILD, cls.samples)
        data = self.environment["K2SYS_AC_DATA"]
        samples.copy(cls.samples, data)
        return os.path.join(data, "defaultuser") + "/"

    def start_programs(self):
        self.appliance = session.Appliance(BUILD, os.path.join(self.keep, "appliance.log"), self.environment)
        self.addCleanup(self.appliance.stop)
        self.programs.append(self.appliance)
        self.display.watch(self.appliance)
        session.wait_listening(self.appliance, session.MAIN_PORT + self.offset, 30 * SLOW)
        session.wait_listening(self.appliance, session.SUB_PANEL_PORT + self.offset, 30 * SLOW)
        self.start_titler()

    def start_titler(self):
        start = self.appliance.mark()
        self.titler = session.start_titler(BUILD, os.path.join(self.keep, "titler.log"), self.environment,
                                           self.titler_arguments)
        self.addCleanup(self.titler.stop)
        self.programs.append(self.titler)
        self.display.watch(self.titler)
        session.wait_listening(self.titler, session.TITLER_PORT + self.offset, 60 * SLOW)
        self.command("wait-titler")
        # The last service that a titler registers at: from here on every notice reaches it.
        self.wait_call("APPEventFilter", "registerNotify", start, 60)

    def tearDown(self):
        outcome = self._outcome.result
        failed = any(test is self for test, _ in outcome.errors + outcome.failures)
        passed = not failed and sys.exc_info()[0] is None and self._outcome.success
        if not passed and self.display:
            self.display.screenshot(os.path.join(self.keep, "failed.png"))
        before, TitlerTest.ending = TitlerTest.ending, Ending(self) if passed else None
        problem = None if passed else self.end_and_judge()
        if before:
            before.verify()
        self.assertIsNone(problem)

    def clean_up(self):
        """Called after each test; a test that has passed is cleaned up by its ending."""
        if TitlerTest.ending is None or TitlerTest.ending.test is not self:
            self.at_end.close()

    def end_and_judge(self):
        """Ends what runs, the titler first. Returns what was wrong with the end, or None."""
        ends = [program.stop(30 * SLOW) for program in reversed(self.programs) if not program.killed]
        reports = self.sanitizer_reports()
        if reports:
            return reports
        if RENDER_AGAIN and not any(program.killed for program in self.programs):
            different = renderedagain.different_pictures(BUILD, self.environment, os.path.dirname(self.folder()))
            if different:
                return f"rendered otherwise: {different}"
        return f"exit codes {ends}" if set(ends) - {0} else None

    def sanitizer_reports(self):
        """What the sanitizers had to say about the programs of this test."""
        reports = []
        for program in self.programs:
            with open(program.log, encoding="utf-8", errors="replace") as stream:
                text = stream.read()
            found = SANITIZER_REPORT.search(text)
            if found:
                reports.append(text[text.rfind("\n", 0, found.start()) + 1:][:20000])
        return "\n".join(reports)

    def command(self, line):
        """Gives the appliance a command and waits until it has been carried out."""
        start = self.appliance.mark()
        self.appliance.command(line)
        done = self.appliance.wait_for(lambda event: event.get("command") == line and event["event"] != "call",
                                       30 * SLOW, start, f"an answer to {line}")
        self.assertEqual(done["event"], "ok", done)

    # Data

    def folder(self, name="Welcome"):
        return os.path.join(self.base, "resources", "Titles", name)

    def titles(self, folder):
        """The title files of a folder in its order."""
        return [Title(os.path.join(folder, row.get("file-path"))) for row in self.read_order(folder).iter("index")]

    @staticmethod
    def read_order(folder):
        """The order file of a folder. While it is written it is not there, or not whole."""
        deadline = time.monotonic() + 2
        while True:
            try:
                return xml.etree.ElementTree.parse(os.path.join(folder, ".order.xml")).getroot()
            except (FileNotFoundError, xml.etree.ElementTree.ParseError):
                if time.monotonic() > deadline:
                    raise
                time.sleep(0.01)

    # The window

    def window(self):
        return self.display.find_window("Titler")

    def wait_shown(self, timeout=20):
        def shown():
            self.titler.check()
            return self.window()

        window = session.wait_until(shown, timeout * SLOW, "the window")
        self.display.wait_until_still(30 * SLOW)
        return window

    def wait_hidden(self, timeout=20):
        def hidden():
            self.titler.check()
            return not self.window()

        session.wait_until(hidden, timeout * SLOW, "the window to go")

    def stays_shown(self, seconds=1.5):
        """Whether the window is there all the time; for what must not happen there is nothing else to wait for."""
        deadline = time.monotonic() + seconds * SLOW
        while time.monotonic() < deadline:
            self.titler.check()
            if not self.window():
                return False
            time.sleep(0.05)
        return True

    def click(self, x, y, button=1):
        """Clicks at a point of the window."""
        left, top, _, _ = self.display.geometry(self.window())
        self.display.click(left + x, top + y, button)

    def click_tool(self, name):
        self.click(*TOOL_POINTS[name])

    def folders(self):
        """The names of the title folders in the order of the folder picker."""
        root = os.path.dirname(self.folder())
        return sorted((name for name in os.listdir(root) if os.path.isdir(os.path.join(root, name))), key=str.lower)

    def pixel(self, x, y):
        """A pixel of the screen, which the window fills."""
        return self.display.pixel(x, y)

    def canvas(self):
        """A number for what the canvas shows."""
        return zlib.crc32(self.display.part(*CANVAS))

    def wait_picker(self, lit=PICKER_LIT):
        """Waits until the folder picker is there and no mask before it; a click before that is not for it."""
        session.wait_until(lambda: min(self.pixel(*lit)) > LIT, 20 * SLOW, "the picker")
        self.display.wait_until_still()

    def open_picker(self):
        self.click_tool("Folder")
        self.wait_picker()

    def click_folder(self, name):
        """Clicks at a folder's row in the picker, in which no folder is open and nothing is scrolled."""
        x, y = PICKER_ROW
        self.click(x, y + PICKER_ROW_HEIGHT * self.folders().index(name))
        self.display.wait_until_still()

    def click_picker(self, button):
        self.click(*PICKER_BUTTONS[button])
        self.display.wait_until_still()

    def choose_folder(self, name):
        """Opens a folder in the folder picker, which shows."""
        self.click_folder(name)
        self.click_picker("Open")

    def close_window(self):
        start = self.appliance.mark()
        self.click_tool("Close")
        self.wait_closed(start)

    def wait_closed(self, start):
        """Waits until the window is gone and the last call of a session has come: all others are here with it."""
        self.wait_hidden()
        self.appliance.wait_for(
            lambda event: event.get("method") == "setTopWindow" and event["args"]["topWindow"] == TOP_WINDOW_MAIN,
            20 * SLOW, start, "the end of the session")

    def choose_in_list_menu(self, row, entry):
        """Opens the option menu of the title in this row, one of the upper ones, by a right click and chooses."""
        x, y = LIST_POINT[0], LIST_POINT[1] + row * LIST_ROW
        self.click(x, y, button=3)
        self.display.wait_until_still()
        self.click(x, y + LIST_MENU_TOP + LIST_MENU_ENTRIES.index(entry) * LIST_MENU_ROW)
        self.display.wait_until_still()

    def point_at_template(self, number, tab="Preset"):
        """When the template picker is open, turns to the tab and chooses a template of the first rows."""
        self.wait_picker(TEMPLATES_LIT)
        self.click(*TEMPLATE_TABS[tab])
        self.display.wait_until_still()
        row, column = divmod(number, TEMPLATE_COLUMNS)
        self.click(TEMPLATE_POINT[0] + column * TEMPLATE_STEP[0], TEMPLATE_POINT[1] + row * TEMPLATE_STEP[1])
        self.display.wait_until_still()

    def choose_template(self, number, tab="Preset"):
        """Takes a template of the open picker, which closes it."""
        self.point_at_template(number, tab)
        self.leave_templates("Select")

    def leave_templates(self, button):
        """Clicks at a button of the open picker and waits until it has gone; a click before that is not for the window."""
        self.display.wait_until_still()  # it may just be coming to its place
        picker = self.display.part(*TEMPLATE_HEADING)
        self.click(*TEMPLATE_BUTTONS[button])
        session.wait_until(lambda: self.display.part(*TEMPLATE_HEADING) != picker, 20 * SLOW, "the template picker to go")
        self.display.wait_until_still()

    def create_in_list(self, row, template=0):
        """Begins a new title after the one in this row."""
        self.choose_in_list_menu(row, "Create New")
        self.choose_template(template)

    def preset_templates(self, language="en"):
        """The preset templates in the order in which the picker shows them."""
        return self.titles(os.path.join(self.base, "resources", "Templates", "templates_" + language))

    def wait_titles(self, folder, count, timeout=20):
        session.wait_until(lambda: len(self.titles(folder)) == count, timeout * SLOW, f"{count} titles in {folder}")

    def calls(self, service, method, start=0):
        """The arguments of the titler's calls of a service's method since start."""
        return [event["args"] for event in self.appliance.since(start)
                if (event.get("event"), event.get("service"), event.get("method")) == ("call", service, method)]

    def wait_call(self, service, method, start, timeout=20):
        """Waits for such a call and gives its arguments."""
        return self.appliance.wait_event("call", timeout * SLOW, start, service=service, method=method)["args"]

    def wait_keyboard(self, start):
        """Waits until the titler has asked for the soft keyboard."""
        self.wait_call("SoftKeyBoardController", "show", start)

    def posted_messages(self, start):
        return [call["messageId"] for call in self.calls("MessageCenter", "postMessage", start)]

    def results(self, start):
        """The results of create requests that the titler has sent back since start."""
        return [event for event in self.appliance.since(start) if event.get("event") == "callback"]

    def type_keys(self, text):
        # A character that no key has gets one for the length of the delay; it is lost when the titler looks later.
        self.display.xdotool("type", "--clearmodifiers", "--delay", 40 * SLOW, text)

    def screenshot(self, name="screen.png"):
        path = os.path.join(self.keep, name)
        self.display.screenshot(path)
        return path

    def open_title(self, title):
        self.command(f'edit "{title.path}"')
        return self.wait_shown()

    def assert_canvas_shows(self, title, mean, visible):
        """The canvas equals the title's on-air picture scaled down.

        mean: mean difference in levels of 0 to 255; visible: share of pixels that are more than 32 levels off.
        """
        left, top, _, _ = self.display.geometry(self.window())
        x, y, width, height = CANVAS
        answer = pngdiff("screen", self.screenshot(), left + x, top + y, width, height, title.picture("_1920.png"),
                         os.path.join(self.keep, "difference.png"))
        self.assertLessEqual(answer["mean"], mean, answer)
        self.assertLessEqual(answer["visible"], visible, answer)

    def assert_pictures_have_their_sizes(self, title, may_be_missing=()):
        for suffix, (width, height) in PICTURES.items():
            if suffix in may_be_missing and not os.path.exists(title.picture(suffix)):
                continue
            with self.subTest(picture=suffix):
                self.assertEqual(pngdiff("size", title.picture(suffix)), {"width": width, "height": height})

    def leftovers(self, folder):
        """What lies in the folder besides titles, their pictures and the order."""
        known = {".order.xml"}
        for title in self.titles(folder):
            stem = os.path.basename(title.stem)
            known.add(stem + ".xml")
            known.update(stem + suffix for suffix in PICTURES)
            known.update(stem + suffix for suffix in ("_source_1280.png", "_source_1920.png"))
        return set(os.listdir(folder)) - known

    def assert_no_leftovers(self, folder):
        self.assertEqual(self.leftovers(folder), set())

    def wait_no_leftovers(self, folder, timeout=20):
        """Waits until the versions that are kept while a save is on its way to the disk are gone."""
        session.wait_until(lambda: not self.leftovers(folder), timeout * SLOW, f"nothing left over in {folder}")

    def wait_text(self, title, wanted, timeout=20):
        """Waits until the file holds a text object with this text."""
        session.wait_until(lambda: wanted in title.texts(), timeout * SLOW, f"{wanted!r} in {title.path}")


# The middle of each button of the tools bar, in pixels of the window.
TOOL_POINTS = {"Folder": (664, 41), "New Text": (830, 41), "Delete": (996, 41), "Undo": (1163, 41), "Redo": (1328, 41),
               "Safe Area": (1494, 41), "Canvas": (1660, 41), "Close": (1826, 41)}

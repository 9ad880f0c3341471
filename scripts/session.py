"""Starts and drives the programs of a build: an X display of their own, the appliance and the titler.

Used by scripts/run and by the end-to-end tests. Python's standard library only. Whatever is started here is also ended
here, by its own process id.
"""
import atexit
import ctypes
import json
import os
import re
import shlex
import signal
import struct
import subprocess
import threading
import time
import zlib

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
WIDTH, HEIGHT = 1920, 1080
# The screen is still when this many looks at it, one after another, found nothing that moved or worked.
LOOKS_WHEN_STILL = 5
TITLER_PORT = 1003
MAIN_PORT = 1000
SUB_PANEL_PORT = 1002


class SessionError(Exception):
    """Something that should have happened has not, in the time it had."""


def deadline_after(seconds):
    """The moment at which to give up waiting for what takes at most so many seconds on a quiet machine. On a busy one a program
    gets a processor that much less often."""
    busy = os.getloadavg()[0] / (os.cpu_count() or 1)
    return time.monotonic() + seconds * (1 + busy)


def wait_until(condition, timeout, what):
    """Polls until condition() is true and returns its value; raises SessionError after timeout seconds, later on a busy
    machine."""
    deadline = deadline_after(timeout)
    while True:
        value = condition()
        if value:
            return value
        if time.monotonic() > deadline:
            raise SessionError(f"waited {timeout} s in vain for {what}")
        time.sleep(0.02)


def listening(port):
    """Whether a process listens on 127.0.0.1:port; asks the kernel, so that no connection is made."""
    wanted = f"0100007F:{port:04X}"
    with open("/proc/net/tcp", encoding="ascii") as table:
        return any(fields[1] == wanted and fields[3] == "0A" for fields in map(str.split, table))


def may_bind_low_ports():
    if os.geteuid() == 0:
        return True
    with open("/proc/sys/net/ipv4/ip_unprivileged_port_start", encoding="ascii") as value:
        return int(value.read()) <= MAIN_PORT


LIBC = ctypes.CDLL(None)
PR_SET_PDEATHSIG = 1


def die_with_parent():
    """Runs in a new child: a killed test must not leave servers and titlers behind."""
    LIBC.prctl(PR_SET_PDEATHSIG, signal.SIGKILL)


class Process:
    """A child process with its output in a file. It is ended when this program ends, however that comes."""

    def __init__(self, arguments, log, environment=None, **options):
        self.log = log
        self.killed = False
        self.name = os.path.basename(arguments[0])
        with open(log, "ab") as stream:
            options.setdefault("stdin", subprocess.DEVNULL)
            options.setdefault("stdout", stream)
            self.popen = subprocess.Popen(arguments, stderr=stream, env=environment, preexec_fn=die_with_parent,
                                          **options)
        atexit.register(self.stop)

    @property
    def pid(self):
        return self.popen.pid

    def running(self):
        return self.popen.poll() is None

    def works(self):
        """Whether a thread of the process runs or waits for the disk, or would run if a processor were free for it, at this
        moment. A process that has events left to handle is never found asleep, however long it waits for its turn on a busy
        machine: a line of its log can wait for a disk that all others use, too."""
        folder = f"/proc/{self.pid}/task"
        try:
            for thread in os.listdir(folder):
                with open(f"{folder}/{thread}/stat", encoding="utf-8", errors="replace") as stream:
                    if stream.read().rpartition(")")[2].split()[0] in "RD":
                        return True
        except OSError:
            pass  # it has ended, or a thread has
        return False

    def signal(self, number):
        if self.running():
            self.killed = self.killed or number == signal.SIGKILL
            self.popen.send_signal(number)

    def wait(self, timeout):
        """The exit code; raises SessionError when the process is still there after timeout seconds, later on a busy machine."""
        try:
            return self.popen.wait(deadline_after(timeout) - time.monotonic())
        except subprocess.TimeoutExpired:
            raise SessionError(f"{self.name} has not ended after {timeout} s") from None

    def stop(self, timeout=10):
        self.signal(signal.SIGTERM)
        if self.running():
            self.popen.send_signal(signal.SIGCONT)  # a test may have stopped it
        try:
            self.popen.wait(deadline_after(timeout) - time.monotonic())
        except subprocess.TimeoutExpired:
            self.signal(signal.SIGKILL)
            self.popen.wait()
        return self.popen.returncode

    def check(self):
        if not self.running():
            raise SessionError(f"{self.name} has ended with {self.popen.returncode}, see {self.log}")


class Display:
    """An Xvfb of 1920x1080 with openbox on it. Its frame buffer lies in a file, which screenshots are read from."""

    def __init__(self, folder, environment):
        os.makedirs(folder, exist_ok=True)
        self.folder = folder
        read_end, write_end = os.pipe()
        self.server = Process(self.server_arguments(write_end), os.path.join(folder, "server.log"),
                              pass_fds=[write_end])
        os.close(write_end)
        self.manager = None
        self.watched = [self.server]
        try:
            with os.fdopen(read_end) as stream:
                number = stream.readline().strip()
            if not number:
                raise SessionError(f"no display, see {self.server.log}")
            self.name = f":{number}"
            self.environment = dict(environment, DISPLAY=self.name)
            self._start_manager(os.path.join(folder, "openbox-started"))
        except BaseException:
            self.stop()
            raise

    def server_arguments(self, number_pipe):
        """How the server is started; it writes the number of its display into the pipe."""
        return ["Xvfb", "-displayfd", str(number_pipe), "-screen", "0", f"{WIDTH}x{HEIGHT}x24", "-nolisten", "tcp",
                "-noreset", "-fbdir", self.folder]

    def _start_manager(self, mark):
        """Starts openbox, which makes the file mark as soon as it has started. Before that it may miss a window that
        is shown, although it already says on the root window that it is there."""
        if os.path.exists(mark):
            os.remove(mark)
        self.manager = Process(["openbox", "--sm-disable", "--startup", shlex.join(["touch", mark])],
                               os.path.join(self.folder, "openbox.log"), self.environment)
        self.watch(self.manager)

        def has_started():
            self.manager.check()
            return os.path.exists(mark)

        wait_until(has_started, 20, "openbox")

    def stop(self):
        if self.manager:
            self.manager.stop()
        self.server.stop()

    def xdotool(self, *arguments):
        done = subprocess.run(["xdotool", *map(str, arguments)], env=self.environment, capture_output=True, text=True,
                              check=False, timeout=120)
        if done.returncode != 0:
            raise SessionError(f"xdotool {' '.join(map(str, arguments))}: {done.stderr.strip()}")
        return done.stdout

    def add_keys(self, characters):
        """Puts characters that no key has on spare keys. Before the programs start: a program that is busy while the
        keyboard changes takes a key for what it is by then."""
        old = subprocess.run(["xkbcomp", "-xkb", self.name, "-"], env=self.environment, capture_output=True, text=True,
                             check=True).stdout
        spare = [f"<FK{number}>" for number in range(13, 25)]
        if len(characters) > len(spare):
            raise SessionError(f"there are only {len(spare)} spare keys")
        lines = "".join(f"    replace key {key} {{ type = \"ONE_LEVEL\", [ U{ord(character):04X} ] }};\n"
                        for key, character in zip(spare, characters))
        head, brace, tail = old.partition("xkb_symbols ")
        name, opening, rest = tail.partition("{\n")
        end = rest.index("\n};")
        new = head + brace + name + opening + rest[:end] + "\n" + lines + rest[end + 1:]
        done = subprocess.run(["xkbcomp", "-w", "0", "-", self.name], env=self.environment, input=new, text=True,
                              capture_output=True, check=False)
        if done.returncode != 0:
            raise SessionError(f"xkbcomp: {done.stderr.strip()}")

    def find_window(self, title):
        """The id of the visible window with exactly this title, or None."""
        # A search in which another window, a menu or a dialog, goes away breaks off.
        for _ in range(5):
            done = subprocess.run(["xdotool", "search", "--onlyvisible", "--name", f"^{re.escape(title)}$"],
                                  env=self.environment, capture_output=True, text=True, check=False)
            if "X Error" not in done.stderr:
                break
        ids = done.stdout.split()
        return ids[-1] if done.returncode == 0 and ids else None

    def geometry(self, window):
        """x, y, width and height of a window's contents on the screen."""
        shell = self.xdotool("getwindowgeometry", "--shell", window)
        values = dict(line.split("=", 1) for line in shell.splitlines() if "=" in line)
        return tuple(int(values[key]) for key in ("X", "Y", "WIDTH", "HEIGHT"))

    def click(self, x, y, button=1):
        self.xdotool("mousemove", x, y, "click", button)

    def frame(self):
        """The screen as it is kept: a line after another, a pixel as the bytes blue, green, red and one that means nothing."""
        with open(os.path.join(self.folder, "Xvfb_screen0"), "rb") as stream:
            data = stream.read()
        header = struct.unpack(">25I", data[:100])
        header_size, width, height = header[0], header[4], header[5]
        bits_per_pixel, line, colours = header[11], header[12], header[19]
        if (width, height, bits_per_pixel, line) != (WIDTH, HEIGHT, 32, width * 4):
            raise SessionError(f"unexpected frame buffer of {bits_per_pixel} bits, {line} bytes a line")
        start = header_size + colours * 12
        return data[start:start + line * height]

    def part(self, left, top, width, height):
        """The pixels of a part of the screen, as in frame()."""
        pixels = self.frame()
        lines = ((WIDTH * row + left) * 4 for row in range(top, top + height))
        return b"".join(pixels[line:line + width * 4] for line in lines)

    def pixel(self, x, y):
        """The red, green and blue of a point of the screen."""
        return tuple(reversed(self.part(x, y, 1, 1)[:3]))

    def grab(self):
        """The screen as (width, height, RGB bytes); takes much longer than frame()."""
        pixels = self.frame()
        rgb = bytearray(WIDTH * HEIGHT * 3)
        rgb[0::3], rgb[1::3], rgb[2::3] = pixels[2::4], pixels[1::4], pixels[0::4]
        return WIDTH, HEIGHT, bytes(rgb)

    def screenshot(self, path):
        write_png(path, *self.grab())

    def watch(self, process):
        """Takes a process that has to do with what the display shows: while it works the screen is not still."""
        self.watched.append(process)

    def wait_until_still(self, timeout=60, quiet=0.3):
        """Waits until the screen has not changed for quiet seconds and no process behind it has worked at any look. On a
        busy machine a program may take longer than that to get a processor at all."""
        deadline = deadline_after(timeout)
        last, since, looks = self.frame(), time.monotonic(), 0
        while looks < LOOKS_WHEN_STILL or time.monotonic() - since < quiet:
            if time.monotonic() > deadline:
                raise SessionError(f"the screen still changes after {timeout} s")
            time.sleep(0.03)
            works = any(process.works() for process in self.watched)
            now = self.frame()
            looks += 1
            if works or now != last:
                last, since, looks = now, time.monotonic(), 0


def write_png(path, width, height, rgb):
    def chunk(kind, body):
        return struct.pack(">I", len(body)) + kind + body + struct.pack(">I", zlib.crc32(kind + body))

    line = width * 3
    rows = b"".join(b"\0" + rgb[y * line:(y + 1) * line] for y in range(height))
    with open(path, "wb") as stream:
        stream.write(b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", struct.pack(">IIBBBBB", width, height, 8, 2, 0, 0, 0)) +
                     chunk(b"IDAT", zlib.compress(rows, 1)) + chunk(b"IEND", b""))


class Appliance(Process):
    """The appliance: commands go in as lines, events come out as one JSON object a line and are kept in events."""

    def __init__(self, build, log, environment):
        self.events = []
        self.changed = threading.Condition()
        self.output = open(log + ".jsonl", "w", encoding="utf-8")  # pylint: disable=consider-using-with
        super().__init__([os.path.join(build, "bin", "appliance")], log, environment, stdin=subprocess.PIPE,
                         stdout=subprocess.PIPE, text=True, encoding="utf-8", bufsize=1)
        self.reader = threading.Thread(target=self._read, daemon=True)
        self.reader.start()

    def _read(self):
        for line in self.popen.stdout:
            self.output.write(line)
            self.output.flush()
            try:
                event = json.loads(line)
            except ValueError:
                event = {"event": "unreadable", "line": line}
            with self.changed:
                self.events.append(event)
                self.changed.notify_all()

    def command(self, line):
        try:
            self.popen.stdin.write(line + "\n")
            self.popen.stdin.flush()
        except OSError as error:
            raise SessionError(f"the appliance took no command ({error}), see {self.log}") from None

    def mark(self):
        """A point in the stream of events, to wait from."""
        with self.changed:
            return len(self.events)

    def since(self, start):
        """The events since start."""
        with self.changed:
            return self.events[start:]

    def wait_for(self, wanted, timeout, start, what):
        """The first event since start for which wanted(event) is true."""
        deadline = deadline_after(timeout)
        with self.changed:
            while True:
                for event in self.events[start:]:
                    if wanted(event):
                        return event
                left = deadline - time.monotonic()
                if left <= 0:
                    raise SessionError(f"waited {timeout} s in vain for {what}; got {self.events[start:]}")
                self.changed.wait(left)

    def wait_event(self, name, timeout, start, **fields):
        """The first event since start with this name and these values."""
        return self.wait_for(
            lambda event: event.get("event") == name and all(event.get(key) == fields[key] for key in fields),
            timeout, start, f"{name} {fields}")

    def stop(self, timeout=10):
        if self.running():
            try:
                self.popen.stdin.close()
            except OSError:
                pass
        code = super().stop(timeout)
        self.reader.join(5)
        self.output.close()
        return code


def program_environment(build, **changes):
    """The environment of the programs: the build's own fonts, UTF-8, and the changes given."""
    environment = dict(os.environ)
    environment.update(
        LC_ALL="C.UTF-8",
        FONTCONFIG_FILE=os.path.join(build, "fonts", "fonts.conf"),
        QT_QPA_PLATFORM="xcb",
        # What is in reach of the user's desktop must not change the looks or the input of the titler.
        QT_QPA_PLATFORMTHEME="none",
        NO_AT_BRIDGE="1",
    )
    for name in ("QT_IM_MODULE", "QT_STYLE_OVERRIDE", "QT_SCALE_FACTOR", "XMODIFIERS"):
        environment.pop(name, None)
    environment.update({name: str(value) for name, value in changes.items()})
    return environment


def start_titler(build, log, environment, arguments=()):
    return Process([os.path.join(build, "bin", "titler"), *arguments], log, environment)


def port_offset(environment):
    return int(environment.get("K2SYS_PORT_OFFSET") or 0)


def wait_listening(process, port, timeout=60):
    def ready():
        process.check()
        return listening(port)

    wait_until(ready, timeout, f"{process.name} to listen on {port}")

"""A display with a real touch screen: an X server on a dummy graphics card with a ten-finger touch device, which is
driven through a socket and reaches the programs as any other touch hardware does.

xdotool's pointer and keys work on it as on any server.
"""
import contextlib
import ctypes
import os
import socket
import struct
import threading

import session

# A finger that rests reports its place so often.
REPORT_SECONDS = 1
CONFIGURATION = """
Section "ServerFlags"
  Option "AutoAddDevices" "false"
  Option "AutoEnableDevices" "false"
  Option "AllowEmptyInput" "on"
  Option "DontVTSwitch" "true"
  Option "AutoAddGPU" "false"
EndSection
Section "Device"
  Identifier "card"
  Driver "dummy"
  VideoRam 256000
EndSection
Section "Monitor"
  Identifier "monitor"
  HorizSync 5.0-1000.0
  VertRefresh 5.0-200.0
  Modeline "1920x1080" 172.80 1920 2040 2248 2576 1080 1081 1084 1118
EndSection
Section "Screen"
  Identifier "screen"
  Device "card"
  Monitor "monitor"
  DefaultDepth 24
  SubSection "Display"
    Depth 24
    Modes "1920x1080"
    Virtual 1920 1080
  EndSubSection
EndSection
Section "InputDevice"
  Identifier "keyboard"
  Driver "inputtest"
  Option "SocketPath" "@FOLDER@/keyboard"
  Option "DeviceType" "Keyboard"
EndSection
Section "InputDevice"
  Identifier "pointer"
  Driver "inputtest"
  Option "SocketPath" "@FOLDER@/pointer"
  Option "DeviceType" "PointerAbsolute"
  Option "PointerButtonCount" "5"
EndSection
Section "InputDevice"
  Identifier "touch"
  Driver "inputtest"
  Option "SocketPath" "@FOLDER@/touch"
  Option "DeviceType" "Touch"
  Option "TouchCount" "10"
EndSection
Section "ServerLayout"
  Identifier "layout"
  Screen "screen"
  InputDevice "keyboard" "CoreKeyboard"
  InputDevice "pointer" "CorePointer"
  InputDevice "touch" "SendCoreEvents"
EndSection
"""

# Of the device's protocol.
CLIENT_VERSION, WAIT_FOR_SYNC, TOUCH = 0, 1, 6
PROTOCOL = (1, 1)
TOUCH_BEGIN, TOUCH_UPDATE, TOUCH_END = 18, 19, 20
AXES = 64
AXIS_X, AXIS_Y, AXIS_PRESSURE = 0, 1, 4
AXIS_MAXIMUM = 65535
PRESSURE = 1000.0


def valuators(values):
    mask = bytearray(AXES // 8)
    numbers = [0.0] * AXES
    for axis, value in values.items():
        mask[axis // 8] |= 1 << (axis % 8)
        numbers[axis] = value
    return struct.pack(f"<I8s4x{AXES}d{AXES}d", 0, bytes(mask), *numbers, *([0.0] * AXES))


class TouchDevice:
    """The socket of the touch device. The server does not bear a second client on it, nor the first one leaving."""

    def __init__(self, path):
        self.socket = socket.socket(socket.AF_UNIX)
        self.socket.settimeout(120)
        session.wait_until(lambda: os.path.exists(path), 20, "the touch device")
        self.socket.connect(path)
        self.socket.sendall(struct.pack("<IIHH", 12, CLIENT_VERSION, *PROTOCOL))
        if struct.unpack("<IIHH", self.socket.recv(64))[2] != PROTOCOL[0]:
            raise session.SessionError("the touch device speaks another version")

    @staticmethod
    def _packet(kind, finger, x, y):
        body = struct.pack("<II", finger, kind) + valuators({
            AXIS_X: x * AXIS_MAXIMUM / (session.WIDTH - 1), AXIS_Y: y * AXIS_MAXIMUM / (session.HEIGHT - 1),
            AXIS_PRESSURE: PRESSURE})
        return struct.pack("<II", 8 + len(body), TOUCH) + body

    def send(self, *events):
        """Sends events, each a kind, a finger and a place. They follow one another at once, however busy the machine is:
        this process may be kept waiting before or after them, but not between them."""
        sync = struct.pack("<II", 8, WAIT_FOR_SYNC)  # comes back when the server has taken the events
        self.socket.sendall(b"".join(self._packet(*event) for event in events) + sync)
        self.socket.recv(64)


class XImage(ctypes.Structure):
    _fields_ = [("width", ctypes.c_int), ("height", ctypes.c_int), ("xoffset", ctypes.c_int),
                ("format", ctypes.c_int), ("data", ctypes.c_void_p), ("byte_order", ctypes.c_int),
                ("bitmap_unit", ctypes.c_int), ("bitmap_bit_order", ctypes.c_int), ("bitmap_pad", ctypes.c_int),
                ("depth", ctypes.c_int), ("bytes_per_line", ctypes.c_int), ("bits_per_pixel", ctypes.c_int)]


class SharedSegment(ctypes.Structure):
    """Xlib's XShmSegmentInfo."""
    _fields_ = [("segment", ctypes.c_ulong), ("id", ctypes.c_int), ("address", ctypes.c_void_p),
                ("read_only", ctypes.c_int)]


class ScreenReader:
    """Reads the picture of a display's root window through memory that it shares with the server: through the socket, a
    picture takes many turns of both on a busy machine."""

    ALL_PLANES = 2 ** 32 - 1
    Z_PIXMAP = 2
    IPC_PRIVATE, IPC_CREAT, IPC_RMID = 0, 0o1000, 0

    def __init__(self, name):
        self.x11 = ctypes.CDLL("libX11.so.6")
        self.shm = ctypes.CDLL("libXext.so.6")
        self.libc = ctypes.CDLL(None, use_errno=True)
        pointer, number, long = ctypes.c_void_p, ctypes.c_int, ctypes.c_ulong
        image = ctypes.POINTER(XImage)
        segment = ctypes.POINTER(SharedSegment)
        for function, result, arguments in (
                (self.x11.XOpenDisplay, pointer, [ctypes.c_char_p]),
                (self.x11.XDefaultRootWindow, long, [pointer]),
                (self.x11.XDefaultScreen, number, [pointer]),
                (self.x11.XDefaultVisual, pointer, [pointer, number]),
                (self.x11.XDefaultDepth, number, [pointer, number]),
                (self.x11.XSync, number, [pointer, number]),
                (self.x11.XFree, number, [image]),
                (self.x11.XCloseDisplay, number, [pointer]),
                (self.shm.XShmCreateImage, image,
                 [pointer, pointer, ctypes.c_uint, number, pointer, segment, ctypes.c_uint, ctypes.c_uint]),
                (self.shm.XShmAttach, number, [pointer, segment]),
                (self.shm.XShmGetImage, number, [pointer, long, image, number, number, long]),
                (self.shm.XShmDetach, number, [pointer, segment]),
                (self.libc.shmget, number, [number, ctypes.c_size_t, number]),
                (self.libc.shmat, pointer, [number, pointer, number]),
                (self.libc.shmdt, number, [pointer]),
                (self.libc.shmctl, number, [number, number, pointer])):
            function.restype, function.argtypes = result, arguments
        self.display = self.x11.XOpenDisplay(name.encode())
        if not self.display:
            raise session.SessionError(f"the display {name} cannot be opened")
        self.segment = SharedSegment()
        self.image = self._share()

    def _share(self):
        screen = self.x11.XDefaultScreen(self.display)
        image = self.shm.XShmCreateImage(self.display, self.x11.XDefaultVisual(self.display, screen),
                                         self.x11.XDefaultDepth(self.display, screen), self.Z_PIXMAP, None,
                                         ctypes.byref(self.segment), session.WIDTH, session.HEIGHT)
        if not image:
            raise session.SessionError("the server shares no memory")
        contents = image.contents
        if contents.bits_per_pixel != 32 or contents.bytes_per_line != session.WIDTH * 4:
            raise session.SessionError(f"unexpected picture of {contents.bits_per_pixel} bits a pixel")
        self.size = contents.bytes_per_line * session.HEIGHT
        self.segment.id = self.libc.shmget(self.IPC_PRIVATE, self.size, self.IPC_CREAT | 0o600)
        if self.segment.id < 0:
            raise session.SessionError(f"no shared memory: {os.strerror(ctypes.get_errno())}")
        self.segment.address = contents.data = self.libc.shmat(self.segment.id, None, 0)
        attached = self.shm.XShmAttach(self.display, ctypes.byref(self.segment))
        self.x11.XSync(self.display, 0)
        # It is freed when the server and this process have let go of it, however they end.
        self.libc.shmctl(self.segment.id, self.IPC_RMID, None)
        if not attached:
            raise session.SessionError("the server cannot share memory")
        return image

    def read(self):
        root = self.x11.XDefaultRootWindow(self.display)
        if not self.shm.XShmGetImage(self.display, root, self.image, 0, 0, self.ALL_PLANES):
            raise session.SessionError("the screen cannot be read")
        return ctypes.string_at(self.segment.address, self.size)

    def close(self):
        self.shm.XShmDetach(self.display, ctypes.byref(self.segment))
        self.x11.XCloseDisplay(self.display)
        self.x11.XFree(self.image)
        self.libc.shmdt(self.segment.address)


class TouchDisplay(session.Display):
    """A display that fingers touch. Positions are pixels of the screen; a finger is a number from 0 to 9."""

    def __init__(self, folder, environment):
        self.device = None
        self.reader = None
        self.touching = {}
        super().__init__(folder, environment)
        try:
            self.device = TouchDevice(os.path.join(folder, "touch"))
            self.reader = ScreenReader(self.name)
        except BaseException:
            self.stop()
            raise

    def server_arguments(self, number_pipe):
        configuration = os.path.join(self.folder, "xorg.conf")
        with open(configuration, "w", encoding="ascii") as stream:
            stream.write(CONFIGURATION.replace("@FOLDER@", self.folder))
        return ["/usr/lib/xorg/Xorg", "-displayfd", str(number_pipe), "-config", configuration, "-noreset", "-nolisten",
                "tcp", "-sharevts", "-novtswitch", "-logfile", os.path.join(self.folder, "xorg.log")]

    def stop(self):
        if self.reader:
            self.reader.close()
            self.reader = None
        super().stop()
        # Only now: the server does not bear its clients leaving.
        if self.device:
            self.device.socket.close()
            self.device = None

    def frame(self):
        return self.reader.read()

    def down(self, x, y, finger=0):
        self.touching[finger] = (x, y)
        self.device.send((TOUCH_BEGIN, finger, x, y))

    def move(self, x, y, finger=0):
        self.touching[finger] = (x, y)
        self.device.send((TOUCH_UPDATE, finger, x, y))

    def up(self, x, y, finger=0):
        self.device.send((TOUCH_END, finger, x, y))
        self.touching.pop(finger, None)

    def lift_all(self):
        """Lifts the fingers that a test, cut off in a gesture, has left on the screen."""
        for finger, place in list(self.touching.items()):
            self.up(*place, finger)

    def wait_until_still(self, timeout=60, quiet=0.3):
        """As for every display. Fingers that lie on the screen meanwhile report their places again and again, as those of a hand
        do: a program takes one that is silent for long for left behind, and on a busy machine it can take long until all is still."""
        with self._fingers_reporting():
            super().wait_until_still(timeout, quiet)

    @contextlib.contextmanager
    def _fingers_reporting(self):
        enough = threading.Event()

        def report():
            while not enough.wait(REPORT_SECONDS):
                self.device.send(*((TOUCH_UPDATE, finger, *place) for finger, place in self.touching.items()))

        reporter = threading.Thread(target=report)
        if self.touching:
            reporter.start()
        try:
            yield
        finally:
            enough.set()
            if reporter.is_alive():
                reporter.join()

    def tap(self, x, y, finger=0):
        """Puts a finger down and lifts it, too quickly to be taken for one that stays."""
        self.device.send((TOUCH_BEGIN, finger, x, y), (TOUCH_END, finger, x, y))

    def drag(self, start, end, steps=12, finger=0):
        """Puts a finger down, moves it in a straight line without a stop at its beginning, and lifts it."""
        places = [tuple(a + (b - a) * step / steps for a, b in zip(start, end)) for step in range(1, steps + 1)]
        self.touching[finger] = start
        # What comes in one go may reach the program as a single move, so only the beginning does.
        away = (steps + 3) // 4
        self.device.send((TOUCH_BEGIN, finger, *start), *((TOUCH_UPDATE, finger, *place) for place in places[:away]))
        for place in places[away:]:
            self.move(*place, finger)
        self.up(*end, finger)

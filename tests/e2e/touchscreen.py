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
        self.socket.settimeout(20)
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


class ScreenReader:
    """Reads the picture of a display's root window."""

    ALL_PLANES = 2 ** 32 - 1
    Z_PIXMAP = 2

    def __init__(self, name):
        self.x11 = ctypes.CDLL("libX11.so.6")
        self.x11.XOpenDisplay.restype = ctypes.c_void_p
        self.x11.XDefaultRootWindow.argtypes = [ctypes.c_void_p]
        self.x11.XDefaultRootWindow.restype = ctypes.c_ulong
        self.x11.XGetImage.argtypes = [ctypes.c_void_p, ctypes.c_ulong, ctypes.c_int, ctypes.c_int, ctypes.c_uint,
                                       ctypes.c_uint, ctypes.c_ulong, ctypes.c_int]
        self.x11.XGetImage.restype = ctypes.POINTER(XImage)
        self.x11.XDestroyImage.argtypes = [ctypes.POINTER(XImage)]
        self.x11.XCloseDisplay.argtypes = [ctypes.c_void_p]
        self.display = self.x11.XOpenDisplay(name.encode())
        if not self.display:
            raise session.SessionError(f"the display {name} cannot be opened")

    def read(self):
        root = self.x11.XDefaultRootWindow(self.display)
        image = self.x11.XGetImage(self.display, root, 0, 0, session.WIDTH, session.HEIGHT, self.ALL_PLANES,
                                   self.Z_PIXMAP)
        if not image:
            raise session.SessionError("the screen cannot be read")
        contents = image.contents
        if contents.bits_per_pixel != 32 or contents.bytes_per_line != session.WIDTH * 4:
            raise session.SessionError(f"unexpected picture of {contents.bits_per_pixel} bits a pixel")
        pixels = ctypes.string_at(contents.data, contents.bytes_per_line * session.HEIGHT)
        self.x11.XDestroyImage(image)
        return pixels

    def close(self):
        self.x11.XCloseDisplay(self.display)


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

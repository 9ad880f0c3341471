"""A peer of the titler that may send anything; it shares no code with the messaging library."""
import hashlib
import os
import select
import socket
import sys
import xml.etree.ElementTree
import zlib

import harness

sys.path.insert(0, os.path.join(os.path.dirname(harness.HERE), "messaging"))

import peer  # noqa: E402  pylint: disable=wrong-import-position

FRAME_SIZE = peer.FRAME_SIZE
HEADER_SIZE = peer.HEADER.size
MAX_PAYLOAD = FRAME_SIZE - HEADER_SIZE
TITLER_OBJECT = 117
KEPT_PREFIX = ".titler-kept-"
SHOW_CREATE, SHOW_EDIT, DIALOG_MASK, MESSAGE_MASK, REGISTER = 1, 2, 3, 4, 5

pack_int = peer.pack_int
pack_raw = peer.pack_raw
pack_wide = peer.PACKERS["wide"]
pack_int32 = peer.PACKERS["int32"]


def frame(method, payload, receiver=peer.TITLER_RECEIVER, target=TITLER_OBJECT, callback=0, size=None):
    """A frame; size is what the header claims, when that differs from the truth."""
    header = peer.HEADER.pack(receiver, target, method, 0, callback, len(payload) if size is None else size, 1)
    return (header + payload)[:FRAME_SIZE].ljust(FRAME_SIZE, b"\0")


class Connection:
    """A connection to the titler. Acknowledgements are read and counted, but never waited for."""

    def __init__(self, offset, timeout=120):
        self.timeout = timeout * harness.SLOW
        self.socket = socket.create_connection(("127.0.0.1", peer.TITLER_PORT + offset), self.timeout)
        self.acknowledged = 0

    def _drain(self):
        while select.select([self.socket], [], [], 0)[0]:
            data = self.socket.recv(65536)
            if not data:
                raise ConnectionError("the titler closed the connection")
            self.acknowledged += len(data)

    def send(self, data):
        self._drain()
        self.socket.settimeout(self.timeout)
        self.socket.sendall(data)

    def call(self, method, payload, **fields):
        self.send(frame(method, payload, **fields))

    def wait_acknowledgement(self):
        """Waits until the titler has read something of this connection."""
        if self.acknowledged == 0:
            self.socket.settimeout(self.timeout)
            self.acknowledged += len(self.socket.recv(3))

    def close(self):
        self.socket.close()


class Asker:
    """A sibling that asks for new titles. It listens at a port of its own, to which the titler connects to answer."""

    CLIENT, RECEIVER = 1001, 2
    ADAPTER = 9

    def __init__(self, offset, timeout=120):
        self.listener = socket.create_server(("127.0.0.1", self.CLIENT + offset))
        self.listener.settimeout(timeout * harness.SLOW)
        self.calls = Connection(offset, timeout)
        self.answers = None

    def ask(self, call_type):
        self.calls.call(REGISTER, pack_int32(self.ADAPTER) + pack_int32(self.CLIENT))
        self.calls.call(SHOW_CREATE, pack_int(call_type))

    def answer(self):
        """The next frame that the titler sends back, acknowledged."""
        if self.answers is None:
            self.answers, _ = self.listener.accept()
            self.answers.settimeout(self.listener.gettimeout())
        data = peer.read_exactly(self.answers, FRAME_SIZE)
        self.answers.sendall(peer.ACKNOWLEDGEMENT)
        return data

    def close(self):
        for end in (self.answers, self.calls, self.listener):
            if end:
                end.close()


def resident(pid):
    """Kilobytes of memory that a process has in use."""
    with open(f"/proc/{pid}/status", encoding="ascii") as status:
        for line in status:
            if line.startswith("VmRSS:"):
                return int(line.split()[1])
    raise harness.session.SessionError(f"process {pid} has no memory")


def kept_versions(folder):
    return [name for _, _, files in os.walk(folder) for name in files if name.startswith(KEPT_PREFIX)]


def snapshot(folder):
    """What lies under a folder: a digest for each file, None for each folder. Waits until the versions that a titler keeps
    until the disk has synced are gone."""
    harness.session.wait_until(lambda: not kept_versions(folder), 60 * harness.SLOW, f"the disk to take {folder}")
    found = {}
    for place, folders, files in os.walk(folder):
        for name in folders:
            found[os.path.relpath(os.path.join(place, name), folder)] = None
        for name in files:
            path = os.path.join(place, name)
            with open(path, "rb") as stream:
                found[os.path.relpath(path, folder)] = hashlib.sha256(stream.read()).hexdigest()
    return found


def png_problem(path):
    """What is wrong with a PNG file: its chunks are counted and summed and the pixels unpacked."""
    with open(path, "rb") as stream:
        data = stream.read()
    if data[:8] != b"\x89PNG\r\n\x1a\n":
        return "signature"
    at, kinds, packed = 8, [], zlib.decompressobj()
    height_and_line, size = None, 0
    while at < len(data):
        length = int.from_bytes(data[at:at + 4], "big")
        kind, body, check = data[at + 4:at + 8], data[at + 8:at + 8 + length], data[at + 8 + length:at + 12 + length]
        if len(body) != length or int.from_bytes(check, "big") != zlib.crc32(kind + body):
            return f"chunk {kind} at {at}"
        kinds.append(kind)
        if kind == b"IHDR":
            width, height, depth, colour = (int.from_bytes(body[0:4], "big"), int.from_bytes(body[4:8], "big"),
                                            body[8], body[9])
            channels = {0: 1, 2: 3, 3: 1, 4: 2, 6: 4}[colour]
            height_and_line = height * (1 + (width * channels * depth + 7) // 8)
        elif kind == b"IDAT":
            size += len(packed.decompress(body))
        at += 12 + length
    if kinds[:1] != [b"IHDR"] or kinds[-1:] != [b"IEND"]:
        return f"chunks {kinds}"
    return None if packed.eof and size == height_and_line else f"{size} bytes of pixels for {height_and_line}"


def broken_files(folder):
    """The XML and PNG files under a folder that cannot be read whole, with the reason."""
    problems = {}
    for place, _, files in os.walk(folder):
        for name in files:
            path = os.path.join(place, name)
            if name.endswith(".xml"):
                try:
                    xml.etree.ElementTree.parse(path)
                except xml.etree.ElementTree.ParseError as error:
                    problems[path] = str(error)
            elif name.endswith(".png"):
                problem = png_problem(path)
                if problem:
                    problems[path] = problem
    return problems

#!/usr/bin/env python3
"""A peer of the messaging library that shares no code with it.

It packs and unpacks records and frames by itself, sends every kind of record to the probe program, and compares what the
probe read (a line of JSON) and what the probe packed and sent back (bytes) with what was sent.

Usage: peer.py PROBE
"""

import json
import os
import socket
import struct
import subprocess
import sys

sys.path.insert(0, os.path.dirname(os.path.dirname(os.path.abspath(__file__))))

from seededrandom import SeededRandom  # noqa: E402  pylint: disable=wrong-import-position

FRAME_SIZE = 20480
HEADER = struct.Struct("<qqqqB7xqB7x")
ACKNOWLEDGEMENT = b"OK\0"
TITLER_PORT, MAIN_PORT = 1003, 1000
TITLER_RECEIVER = 4
ECHO_OBJECT, ECHO_ADAPTER = 900, 901
PATIENCE = 20.0

# ---- packing ---------------------------------------------------------------------------------------------------------


def pack_int(value):
    """The smallest form."""
    if value >= 0:
        if value < 0x80:
            return bytes([value])
        if value < 0x100:
            return b"\xcc" + bytes([value])
        if value < 0x10000:
            return b"\xcd" + struct.pack(">H", value)
        return b"\xce" + struct.pack(">I", value)
    if value >= -32:
        return struct.pack("b", value)
    if value >= -0x80:
        return b"\xd0" + struct.pack("b", value)
    if value >= -0x8000:
        return b"\xd1" + struct.pack(">h", value)
    return b"\xd2" + struct.pack(">i", value)


def pack_raw(data):
    if len(data) < 32:
        return bytes([0xA0 | len(data)]) + data
    if len(data) < 0x10000:
        return b"\xda" + struct.pack(">H", len(data)) + data
    return b"\xdb" + struct.pack(">I", len(data)) + data


PACKERS = {
    "int": pack_int,
    "int32": lambda value: b"\xd2" + struct.pack(">i", value),
    "long": lambda value: b"\xd3" + struct.pack(">q", value),
    "boolint": lambda value: pack_int(1 if value else 0),
    "bool": lambda value: b"\xc3" if value else b"\xc2",
    "wide": lambda value: pack_raw(value.encode("utf-8") + b"\0"),
    "raw": pack_raw,
}

FIXED = {
    0xCC: ">B", 0xCD: ">H", 0xCE: ">I", 0xCF: ">Q",
    0xD0: ">b", 0xD1: ">h", 0xD2: ">i", 0xD3: ">q",
}


def unpack_value(data, at):
    """The value at an offset, and the offset behind it."""
    tag = data[at]
    at += 1
    if tag < 0x80:
        return tag, at
    if tag >= 0xE0:
        return tag - 0x100, at
    if tag in (0xC2, 0xC3):
        return tag == 0xC3, at
    if tag in FIXED:
        form = struct.Struct(FIXED[tag])
        return form.unpack_from(data, at)[0], at + form.size
    if 0xA0 <= tag <= 0xBF:
        length = tag & 0x1F
    elif tag == 0xDA:
        length = struct.unpack_from(">H", data, at)[0]
        at += 2
    elif tag == 0xDB:
        length = struct.unpack_from(">I", data, at)[0]
        at += 4
    else:
        raise ValueError("tag %#x" % tag)
    if at + length > len(data):
        raise ValueError("raw beyond the end")
    return data[at:at + length], at + length


def as_field(kind, value):
    if kind == "wide":
        assert value.endswith(b"\0"), "text without its NUL"
        return value[:-1].decode("utf-8")
    return bool(value) if kind in ("bool", "boolint") else value


# ---- records: method id, name, fields (name, kind); "strings:4" is a list ----------------------------------------------

RECORDS = [
    (1, "_tagAPPEvent", "clientId int32, lockType int32, flag boolint, eventReceiver int"),
    (2, "_tagTopWindowParam", "clientId int, topWindow int"),
    (3, "_tagMessageParam", "clientId int, boxKind int, boxType int, first wide, text wide, messageId int"),
    (4, "_tagCloseParam", "clientId int, closeType int, messageId int"),
    (5, "tagFOLDER_TYPE", "type int, path wide"),
    (6, "tagTitleChangeStatusParam", "clientId int32, path wide, changeType int"),
    (7, "tagChangeFolderNameParam", "clientId int32, oldPath wide, newPath wide"),
    (8, "tagSoftKeyBoardInitData",
     "fieldKind int32, title wide, keyboardType int32, maxLength int32, text wide, textLength int32, "
     "selectionStart int32, selectionEnd int32, selectionMode int32, limitCondition wide, lastValue int32"),
    (9, "tagSoftKeyBoardKeyData",
     "eventType int32, key int32, modifiers int32, text wide, autoRepeat boolint, nativeVirtualKey int32"),
    (10, "taLimitInfo", "text wide, secondText wide, code int"),
    (11, "tagRenameNotify", "fileType int, second int, third int, strings:4 wide"),
    (12, "tagImportNotify",
     "fileType int, fileTypeHigh int, third int, fourth long, fifth int, path wide, seventh int, eighth int, "
     "strings:3 wide, twelfth int, thirteenth bool, last:7 int"),
    (13, "tagDeleteNotify",
     "first int, fileType int, result int, path wide, fifth int, sixth long, seventh int"),
    (14, "tagTitlerPathParam", "clientId int32, path wide"),
    (15, "tagSoftKeyBoardKeyTextSelectionPos", "begin int32, end int32, current int32, mode int32"),
    (16, "tagSystemLanguageParam", "first int, systemLanguage int, inputLanguage int"),
    (17, "tagSystemInformation", "model int"),
    (18, "_SHOW_TITLER_PARAMTER", "type int, path wide"),
    (20, "_tagCallBackInfo", "adapterId int32, receiverIdentity int32"),
    (21, "_tagNotifyInfo", "adapterId int32, receiverIdentity int32, clientId int32"),
    (22, "an int", "value int"),
    (23, "a text", "value wide"),
]
SESSION_RESULT = 19

TEXTS = ["", "a", "/data/Titles/1.xml", "é", "速報 快讯", "속보", "e\u0301", "\U0001F600",
         "x" * 30, "x" * 31, "快" * 100, "y" * 3000]
INTS = [0, 1, 31, 127, 128, 255, 256, 65535, 65536, 2 ** 31 - 1, -1, -32, -33, -128, -129, -32768, -32769, -2 ** 31]
LONGS = INTS + [2 ** 31, 2 ** 53, -2 ** 40]


def fields_of(description):
    for field in description.split(", "):
        name, kind = field.split(" ")
        name, _, count = name.partition(":")
        yield name, kind, int(count or 0)


def random_value(kind, rng):
    if kind == "wide":
        return rng.choice(TEXTS)
    if kind in ("bool", "boolint"):
        return rng.random() < 0.5
    return rng.choice(LONGS if kind == "long" else INTS)


def random_record(description, rng):
    record = {}
    for name, kind, count in fields_of(description):
        record[name] = [random_value(kind, rng) for _ in range(count)] if count else random_value(kind, rng)
    return record


def pack_record(description, record):
    packed = b""
    for name, kind, count in fields_of(description):
        for value in record[name] if count else [record[name]]:
            packed += PACKERS[kind](value)
    return packed


def unpack_record(description, data):
    record, at = {}, 0
    for name, kind, count in fields_of(description):
        values = []
        for _ in range(count or 1):
            value, at = unpack_value(data, at)
            values.append(as_field(kind, value))
        record[name] = values if count else values[0]
    assert at == len(data), "%d bytes too many" % (len(data) - at)
    return record


# ---- frames ------------------------------------------------------------------------------------------------------------


def frame(method, payload):
    header = HEADER.pack(TITLER_RECEIVER, ECHO_OBJECT, method, 0x7FFF12345678, 0, len(payload), 1)
    return (header + payload).ljust(FRAME_SIZE, b"\0")


def read_exactly(connection, count):
    data = b""
    while len(data) < count:
        part = connection.recv(count - len(data))
        assert part, "the probe closed the connection"
        data += part
    return data


class Peer:
    def __init__(self, probe):
        self.offset = self.free_offset()
        self.listener = socket.create_server(("127.0.0.1", MAIN_PORT + self.offset))
        self.listener.settimeout(PATIENCE)
        environment = dict(os.environ, K2SYS_PORT_OFFSET=str(self.offset))
        self.probe = subprocess.Popen([probe], env=environment, stdout=subprocess.PIPE)
        self.incoming, _ = self.listener.accept()
        self.incoming.settimeout(PATIENCE)
        self.outgoing = self.connect()

    @staticmethod
    def free_offset():
        for attempt in range(1000):
            offset = 9000 + (os.getpid() + attempt) % 2000 * 10
            try:
                for port in (MAIN_PORT, TITLER_PORT):
                    socket.create_server(("127.0.0.1", port + offset)).close()
                return offset
            except OSError:
                continue
        raise RuntimeError("no free ports")

    def connect(self):
        while self.probe.poll() is None:
            try:
                return socket.create_connection(("127.0.0.1", TITLER_PORT + self.offset), PATIENCE)
            except ConnectionRefusedError:
                continue
        raise RuntimeError("the probe ended")

    def exchange(self, method, payload):
        """What the probe read, as JSON, and the payload that it sent back."""
        self.outgoing.sendall(frame(method, payload))
        assert read_exactly(self.outgoing, 3) == ACKNOWLEDGEMENT
        description = json.loads(self.probe.stdout.readline())
        answer = read_exactly(self.incoming, FRAME_SIZE)
        self.incoming.sendall(ACKNOWLEDGEMENT)
        receiver, target, answered, _, callback, size, remote = HEADER.unpack_from(answer)
        assert (receiver, target, answered, callback, remote) == (TITLER_RECEIVER, ECHO_ADAPTER, method, 1, 1)
        assert answer[33:40] == bytes(7) and answer[49:56] == bytes(7)
        assert 0 < size <= FRAME_SIZE - HEADER.size
        assert answer[HEADER.size + size:] == bytes(FRAME_SIZE - HEADER.size - size), "the rest is not zero"
        # Acknowledgements of pieces that arrived on their own.
        self.outgoing.setblocking(False)
        try:
            self.outgoing.recv(4096)
        except BlockingIOError:
            pass
        self.outgoing.settimeout(PATIENCE)
        return description, answer[HEADER.size:HEADER.size + size]

    def end(self):
        self.outgoing.sendall(frame(0, bytes(4)))
        return self.probe.wait(PATIENCE)


def check_records(peer, rng):
    for method, name, description in RECORDS:
        for _ in range(12):
            record = random_record(description, rng)
            payload = pack_record(description, record)
            if len(payload) > FRAME_SIZE - HEADER.size:
                continue
            read, answer = peer.exchange(method, payload)
            assert read == record, "%s: sent %r, the probe read %r" % (name, record, read)
            assert answer == payload, "%s: sent %s, got %s" % (name, payload.hex(), answer.hex())
            assert unpack_record(description, answer) == record, name


def check_session_result(peer):
    for paths in ([], ["/a/1.xml"], ["/資料/速報 1.xml", "/資料/속보 é.xml", ""]):
        data = b"".join(PACKERS["wide"](path) for path in paths)
        payload = (pack_int(7) + PACKERS["wide"]("/資料") + pack_raw(data) + pack_int(len(data)) + pack_int(len(paths)))
        read, answer = peer.exchange(SESSION_RESULT, payload)
        assert read == {"type": 7, "path": "/資料", "size": len(data), "count": len(paths), "paths": paths}, read
        assert answer == payload


def check_any_form_is_read(peer):
    """Readers take every form of a number, whichever the writer chose."""
    for value, packed in ((5, "05"), (5, "cc05"), (5, "cd0005"), (5, "ce00000005"), (5, "cf0000000000000005"),
                          (5, "d005"), (5, "d10005"), (5, "d200000005"), (5, "d30000000000000005"),
                          (-5, "fb"), (-5, "d0fb"), (-5, "d3fffffffffffffffb"), (1, "c3"), (0, "c2"), (0, "c0")):
        read, answer = peer.exchange(22, bytes.fromhex(packed))
        assert read == {"value": value}, (packed, read)
        assert answer == pack_int(value)


def check_damage(peer):
    """What cannot be read is zero."""
    read, _ = peer.exchange(4, bytes.fromhex("07c1c1c1"))
    assert read == {"clientId": 7, "closeType": 0, "messageId": 0}, read
    read, _ = peer.exchange(23, b"\xdb\xff\xff\xff\xffabc")
    assert read == {"value": ""}, read
    read, _ = peer.exchange(23, b"\xa3abc")
    assert read == {"value": "abc"}, read


def main():
    peer = Peer(sys.argv[1])
    rng = SeededRandom(20261112)
    check_records(peer, rng)
    check_session_result(peer)
    check_any_form_is_read(peer)
    check_damage(peer)
    assert peer.end() == 0
    print("records of %d kinds went both ways" % (len(RECORDS) + 1))


if __name__ == "__main__":
    main()

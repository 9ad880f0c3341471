"""A peer that sends what no sibling would: the titler drops it, keeps its files and goes on serving the others."""
import unittest

import harness
import wire
from seededrandom import SeededRandom

BAD_SIZES = (0, -1, -2 ** 31, -2 ** 63, wire.MAX_PAYLOAD + 1, wire.FRAME_SIZE, 2 ** 31, 2 ** 32, 2 ** 62, 2 ** 63 - 1)
STRANGE_IDS = (-2 ** 63, -2 ** 31, -1, 0, 2 ** 31, 2 ** 32, 2 ** 32 + 117, 2 ** 62, 2 ** 63 - 1)
PROJECT_LOADED = 1
# A frame is 20 KB; what is held of a flood, with glyph caches and heap that the titler's own work may take.
MEMORY_ALLOWANCE = 24 * 1024


class HostilePeer(harness.TitlerTest):
    def setUp(self):
        super().setUp()
        self.rng = SeededRandom(20261121)
        self.connections = []
        self.addCleanup(lambda: [connection.close() for connection in self.connections])
        self.title = self.titles(self.folder())[0]
        # One session first: the settings exist and what a first window needs is in memory.
        self.open_title(self.title)
        self.close_window()
        self.before = self.content()
        self.memory = wire.resident(self.titler.pid)
        notify = self.wait_call("ProjectDataManager", "registerNotifyCallBack", 0)
        self.project_adapter = notify["adapterId"]
        self.power_adapter = self.wait_call("PowerManager", "registerNotify", 0)["adapterId"]

    def content(self):
        """Everything in the data path but the remembered choices."""
        return {path: digest for path, digest in wire.snapshot(self.base).items() if "Setting" not in path}

    def noise(self, size):
        """Random bytes that name no folder that exists: a peer may have any of those opened, "/" among them."""
        return self.rng.randbytes(size).translate(bytes.maketrans(b"./", b"xx"))

    def connect(self):
        connection = wire.Connection(self.offset)
        self.connections.append(connection)
        return connection

    def wait_handled(self, connection):
        """Waits until the titler has handled all that was sent on a connection, by a call that it answers."""
        start = self.appliance.mark()
        connection.call(1, wire.pack_int(PROJECT_LOADED), target=self.project_adapter, callback=1)
        self.wait_call("SystemSetupManager", "getLanguageInfo", start, 60 * harness.SLOW)

    def hide(self):
        """Ends the session that a request may have begun."""
        if not self.window():
            return
        self.display.wait_until_still(30 * harness.SLOW)
        # A request without a path has the folder picker before the window, and without it nothing is hit.
        self.click_picker("Cancel")
        if self.window():
            self.close_window()

    def assert_unharmed(self):
        """The titler answers, shows a title as before, and has neither changed files nor taken memory."""
        self.hide()
        self.titler.check()
        self.assertEqual(self.content(), self.before)
        self.open_title(self.title)
        self.assert_canvas_shows(self.title, mean=1.0, visible=0.01)
        self.close_window()
        self.assertEqual(self.content(), self.before)
        if harness.SLOW == 1:
            self.assertLess(wire.resident(self.titler.pid), self.memory + MEMORY_ALLOWANCE)

    def test_frames_of_impossible_sizes_and_unknown_ids(self):
        connection = self.connect()
        edit = wire.pack_int(0) + wire.pack_wide(self.title.path)
        for size in BAD_SIZES:
            for method in range(1, 6):
                connection.call(method, edit, size=size)
            connection.call(1, edit, size=size, target=self.project_adapter, callback=1)
        for value in STRANGE_IDS:
            connection.call(wire.SHOW_EDIT, edit, receiver=value)
            connection.call(wire.SHOW_EDIT, edit, target=value)
            connection.call(value, edit)
            for callback in (1, 2, 255):
                connection.call(1, edit, target=value, callback=callback)
                connection.call(value, edit, target=self.project_adapter, callback=callback)
        self.wait_handled(connection)
        self.assertIsNone(self.window(), "none of these is a request")
        # The same connection still carries good calls.
        connection.call(wire.SHOW_EDIT, edit)
        self.wait_shown()
        self.assert_unharmed()

    def test_cut_and_random_payloads_of_every_method(self):
        connection = self.connect()
        path = wire.pack_wide(self.folder("gone") + "/gone.xml")
        # A record cut anywhere, and one that promises more text than any frame has.
        for whole in (wire.pack_int(70000) + path, wire.pack_int32(7) + b"\xdb\x7f\xff\xff\xff" + path,
                      wire.pack_int(1) + b"\xda\xff\xff" + path):
            for end in range(1, len(whole) + 1):
                connection.call(wire.SHOW_EDIT, whole[:end])
        for end in range(1, 11):
            # A peer that nobody can connect back to.
            connection.call(wire.REGISTER, (wire.pack_int32(3) + wire.pack_int32(64000))[:end])
        for method in (wire.SHOW_EDIT, wire.DIALOG_MASK, wire.MESSAGE_MASK, wire.REGISTER, 0, 6):
            for _ in range(60):
                connection.call(method, self.noise(self.rng.choice((1, 2, 3, 5, 9, 30, 300))))
            connection.call(method, self.noise(wire.MAX_PAYLOAD))
        self.wait_handled(connection)
        self.assert_unharmed()

    def test_any_payload_of_a_create_request_opens_the_folder_picker_and_nothing_else(self):
        connection = self.connect()
        for payload in (b"\xd3", b"\xc1", self.rng.randbytes(wire.MAX_PAYLOAD), b"\xdb\xff\xff\xff\xff"):
            connection.call(wire.SHOW_CREATE, payload)
        self.wait_shown()
        self.wait_handled(connection)
        self.hide()
        self.assert_unharmed()

    def test_texts_without_an_end(self):
        connection = self.connect()
        for text in (b"", b"\xff\xfe\xfd", b"\xed\xa0\x80", b"\xf8\x88\x80\x80\x80", b"\xf4\x90\x80\x80", b"\xc3",
                     self.folder("gone").encode() + b"/gone.xml", b"\x01\x02/../\n", b"x" * 20000):
            connection.call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_raw(text))
        self.wait_handled(connection)
        self.hide()
        # Where the text ends with its bytes, it is still a text.
        connection.call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_raw(self.title.path.encode()))
        self.wait_shown()
        self.assert_canvas_shows(self.title, mean=1.0, visible=0.01)
        self.assert_unharmed()

    def callback_payloads(self):
        text = wire.pack_wide("速報")
        whole = wire.pack_int32(6) + wire.pack_int32(65) + wire.pack_int32(0) + text + b"\0" + wire.pack_int32(30)
        yield b"\0\0\0\0"
        yield self.rng.randbytes(self.rng.randrange(1, 40))
        yield self.rng.randbytes(self.rng.randrange(40, 4000))
        yield whole[:self.rng.randrange(1, len(whole))]
        yield wire.pack_raw(self.rng.randbytes(self.rng.randrange(200)))
        yield b"\xdb\xff\xff\xff\xff" + text
        yield wire.pack_int(2 ** 31) * 20

    def flood_callbacks(self, connection):
        for target in range(21):
            for method in range(9):
                if (target, method) == (self.power_adapter, 1):
                    continue  # this one is a real order to end
                for payload in self.callback_payloads():
                    connection.call(method, payload, target=target, callback=1)

    def test_callbacks_with_cut_and_random_payloads(self):
        connection = self.connect()
        self.flood_callbacks(connection)
        self.wait_handled(connection)
        self.command("language 1 7")
        self.hide()
        # Again beside an open title with a text that is being edited: keys and strings may land in it.
        self.open_title(self.title)
        start = self.appliance.mark()
        self.click_tool("New Text")
        self.wait_keyboard(start)
        self.flood_callbacks(connection)
        self.wait_handled(connection)
        self.command("language 1 7")
        self.close_window()
        self.assertEqual(wire.broken_files(self.folder()), {})
        self.wait_no_leftovers(self.folder())
        # Client ids were overwritten by noise; who asks for the titler is answered all the same.
        self.open_title(self.title)
        self.close_window()
        self.assertEqual(connection.acknowledged % 3, 0)
        # The order to end is obeyed whatever its payload says.
        connection.call(1, self.rng.randbytes(100), target=self.power_adapter, callback=1)
        self.assertEqual(self.titler.wait(30 * harness.SLOW), 0)

    def test_silent_and_dying_peers(self):
        silent = [self.connect() for _ in range(3)]
        part = wire.frame(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_wide(self.title.path))
        for length in (1, 7, 8, 55, 56, 57, 4096, wire.FRAME_SIZE - 1):
            dying = self.connect()
            dying.send(part[:length])
            dying.wait_acknowledgement()
            dying.close()
        # One that sends and closes at once, and one that stays in the middle of a frame.
        sudden = self.connect()
        sudden.send(part[:30])
        sudden.close()
        waiting = self.connect()
        waiting.send(part[:10000])
        waiting.wait_acknowledgement()
        self.assertIsNone(self.window(), "a part of a request is no request")
        self.assert_unharmed()
        # The rest of the frame is still welcome, however late, and so is what the silent ones have to say.
        waiting.send(part[10000:])
        self.wait_shown()
        self.hide()
        silent[1].call(wire.SHOW_EDIT, wire.pack_int(0) + wire.pack_wide(self.title.path))
        self.wait_shown()
        self.assert_unharmed()

    def test_forty_connections_at_once(self):
        # At most two are accepted a second, and ten wait; who is not let in tries again.
        for _ in range(40):
            connection = self.connect()
            connection.send(wire.frame(wire.SHOW_EDIT, self.rng.randbytes(500))[:self.rng.randrange(1, 20480)])
        # The appliance's own connection is served meanwhile.
        self.open_title(self.title)
        self.close_window()
        last = self.connections[-1]
        last.timeout = 60 * harness.SLOW
        last.wait_acknowledgement()
        for connection in self.connections:
            connection.close()
        self.connections.clear()
        fresh = self.connect()
        self.wait_handled(fresh)
        self.assert_unharmed()

    def test_a_flood_is_held_up_and_not_kept(self):
        connection = self.connect()
        connection.timeout = 120 * harness.SLOW
        noise = wire.frame(wire.DIALOG_MASK, self.rng.randbytes(wire.MAX_PAYLOAD))
        largest = 0
        for _ in range(60):
            for _ in range(100):
                connection.send(noise)
            largest = max(largest, wire.resident(self.titler.pid))
        self.wait_handled(connection)
        if harness.SLOW == 1:
            self.assertLess(largest, self.memory + MEMORY_ALLOWANCE)
        self.assert_unharmed()


if __name__ == "__main__":
    unittest.main()

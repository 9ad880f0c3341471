"""The whole of an operator's session in the title library, by finger: what the asker is answered, what the file manager
is told, and everything that lies on disk afterwards."""
import os
import unittest
import xml.etree.ElementTree

import harness
import librarysession
import wire
from librarysession import COPY, FIRST_TEXT, FOLDER, SECOND_TEXT, LibrarySession

RESULT = 1  # finishTitlerCreateCallback
SAVED, LEFT, ADDED, TEMPLATE_ADDED = 1, 2, 4, 5
SHOWN, HIDDEN = 1, 2
# Where a new text begins on the canvas, and how far the hand may be off.
NEW_TEXT, HAND = (590.5, 323.5), 12
TEMPLATE_ORDER = "resources/TitlerTemplates/.order.xml"
SETTINGS = {"settings/TitlerLastPathSetting.xml", "resources/Templates/templates_en/TitlerLastPathSetting.xml",
            "resources/TitlerTemplates/TitlerLastPathSetting.xml"}


class Library(LibrarySession):
    def service_calls(self, service):
        return [(event["method"], event["args"]) for event in self.appliance.since(0)
                if event.get("event") == "call" and event.get("service") == service]

    def renamed(self, path, old, new):
        """The elements of a title file, as they would be under another name."""
        with open(path, encoding="utf-8") as stream:
            return xml.etree.ElementTree.canonicalize(stream.read().replace(old, new), strip_text=True)

    def assert_same_title(self, path, other):
        """Two title files differ in their names only."""
        names = [os.path.basename(name)[:-len(".xml")] for name in (path, other)]
        self.assertEqual(self.renamed(path, *names), self.renamed(other, names[1], names[1]))

    def assert_answer(self, data, names):
        header = wire.peer.HEADER.unpack(data[:wire.HEADER_SIZE])
        packed = b"".join(wire.pack_wide(name) for name in names)
        wanted = (wire.pack_int(librarysession.CALL_TYPE) + wire.pack_wide(self.folder(FOLDER)) + wire.pack_raw(packed) +
                  wire.pack_int(len(packed)) + wire.pack_int(len(names)))
        receiver, target, method, _, callback, size, remote = header
        self.assertEqual((receiver, target, method, callback, size, remote),
                         (wire.Asker.RECEIVER, wire.Asker.ADAPTER, RESULT, 1, len(wanted), 1))
        self.assertEqual(data[wire.HEADER_SIZE:], wanted.ljust(wire.MAX_PAYLOAD, b"\0"))

    def assert_notices(self, first, pasted, added):
        """What the file manager was told; when a title's pictures are done is up to the machine."""
        folder, copy = self.folder(FOLDER), self.folder(COPY)
        template = os.path.dirname(self.user_templates()[0].path)
        told = [(method, args.get("changeType"), args["path"])
                for method, args in self.service_calls("FileManagerController") if "path" in args]
        status = "updateTitlerStatus"
        self.assertEqual([notice for notice in told if notice[1] != SAVED], [
            (status, ADDED, folder),
            ("titlerEditStatus", None, folder),
            (status, ADDED, first),
            (status, ADDED, pasted),
            (status, ADDED, added),
            ("updateTitlerOrder", None, folder),
            (status, LEFT, pasted),
            (status, ADDED, pasted),
            (status, TEMPLATE_ADDED, template),
            ("titlerEditEndStatus", None, folder),
            (status, ADDED, copy),
            ("titlerEditStatus", None, copy),
            ("titlerEditEndStatus", None, copy),
        ])
        self.assertEqual({notice for notice in told if notice[1] == SAVED},
                         {(status, SAVED, path) for path in (first, pasted, added)})
        self.assertEqual([args["topWindow"] for method, args in self.service_calls("MessageCenter")
                          if method == "setTopWindow"], [SHOWN, HIDDEN, SHOWN, HIDDEN])
        self.assertEqual(self.posted_messages(0), [])

    def assert_texts(self, title):
        template = self.preset_templates()[librarysession.LOWER_THIRD]
        contents, designed = (list(found.root().iter("content")) for found in (title, template))
        self.assertEqual(title.texts(), template.texts() + [FIRST_TEXT, SECOND_TEXT])
        for content, wanted in zip(contents, designed):
            # The canvas fits the blur to the letters, whether there is a shadow or not.
            self.assertEqual(dict(content.attrib, **{"shadow-blur-radius": None}),
                             dict(wanted.attrib, **{"shadow-blur-radius": None}))
            self.assertEqual([item.attrib for item in content], [item.attrib for item in wanted])
        self.assertEqual([content.get("id") for content in contents], ["1", "2", "3", "4"])
        places = [(float(content.get("position-X")), float(content.get("position-Y"))) for content in contents[2:]]
        way = [end - start for start, end in zip(librarysession.ON_NEW_TEXT, librarysession.UPPER_PLACE)]
        for place, start, distance in zip(places[0], NEW_TEXT, way):
            self.assertAlmostEqual(place, start + distance, delta=HAND)
        self.assertEqual(places[1], NEW_TEXT)

    def assert_tree(self, before, names):
        """Everything under the data path: what was there is as it was, and what is new is known by name."""
        after = {path: digest for path, digest in wire.snapshot(self.base).items() if path not in SETTINGS}
        self.assertEqual([path for path in before if after.get(path) != before[path]], [TEMPLATE_ORDER])
        pictures = tuple(harness.PICTURES)
        files = {".order.xml"} | {name[:-len(".xml")] + suffix for name in names for suffix in (".xml",) + pictures}
        template = "resources/TitlerTemplates/UserTemplate_001"
        made = {f"resources/Titles/{folder}" for folder in (FOLDER, COPY)}
        made |= {f"resources/Titles/{folder}/{name}" for folder in (FOLDER, COPY) for name in files}
        made |= {template} | {f"{template}/Titler{suffix}"
                              for suffix in (".xml", "_240.png", "_source_1280.png", "_source_1920.png")}
        self.assertEqual(set(after) - set(before), made)
        for name in files:
            self.assertEqual(after[f"resources/Titles/{COPY}/{name}"], after[f"resources/Titles/{FOLDER}/{name}"], name)
        self.assertEqual(wire.broken_files(self.base), {})

    def assert_template(self, title):
        saved = self.user_templates()
        self.assertEqual([found.path for found in saved],
                         [os.path.join(self.base, "resources/TitlerTemplates/UserTemplate_001/Titler.xml")])
        self.assertEqual(saved[0].texts(), title.texts())
        self.assertEqual(list(map(xml.etree.ElementTree.tostring, saved[0].root().iter("content"))),
                         list(map(xml.etree.ElementTree.tostring, title.root().iter("content"))))
        background = saved[0].root().find("meta-bg")
        source = title.root().find("meta-bg")
        for attribute, name in (("resource", "Titler_source_1280.png"), ("resource-big", "Titler_source_1920.png")):
            self.assertEqual(background.get(attribute), name)
            self.assert_same_file(os.path.join(os.path.dirname(saved[0].path), name), source.get(attribute))
        self.assert_same_file(saved[0].picture("_240.png"), title.picture("_240.png"))

    def assert_same_file(self, path, other):
        with open(path, "rb") as stream, open(other, "rb") as wanted:
            self.assertTrue(stream.read() == wanted.read(), f"{path} is not {other}")

    def test_a_session(self):
        before = {path: digest for path, digest in wire.snapshot(self.base).items() if path not in SETTINGS}
        for number, step in enumerate(self.STEPS):
            step(self)
            self.screenshot(f"{number}-{step.__name__}.png")
            if step is LibrarySession.type_texts:
                typed = self.canvas()
        pasted, added, first = self.new_titles()
        self.assertLess(first.path, pasted.path)
        self.assertLess(pasted.path, added.path)
        names = [os.path.basename(title.path) for title in (pasted, added, first)]
        self.assert_answer(self.asker.answer(), names)
        self.assert_notices(first.path, pasted.path, added.path)
        self.assert_tree(before, names)

        self.assert_texts(first)
        self.assert_same_title(pasted.path, first.path)
        plate = self.preset_templates()[librarysession.NAME_PLATE]
        self.assert_same_title(added.path, plate.path)
        for suffix in harness.PICTURES:
            for title, other in ((pasted, first), (added, plate)):
                answer = harness.pngdiff("pictures", title.picture(suffix), other.picture(suffix),
                                         os.path.join(self.keep, "difference.png"))
                self.assertLessEqual(answer["mean"], 0.25, (title.path, suffix, answer))
        self.assert_template(first)

        # Opened again it looks as it did, and looking at it changes nothing.
        after = wire.snapshot(self.folder(FOLDER))
        self.open_title(first)
        self.assertTrue(self.canvas() == typed, "another picture on the canvas")
        self.close_window()
        self.assertEqual(wire.snapshot(self.folder(FOLDER)), after)


if __name__ == "__main__":
    unittest.main()

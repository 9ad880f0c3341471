"""A whole session by finger in the real window: a text is typed on the keyboard service in two scripts, a word of it is
selected by its handles, everything in the property panel is used on it, and what lies on disk afterwards is compared
attribute by attribute, and pixel by pixel with a picture that the titler had no part in."""
import copy
import os
import subprocess
import unittest
import xml.etree.ElementTree

import harness
from panelhands import ON_THE_TEXT, RED, TEXT, WORD, PanelTest

# What a character has that nobody styled.
PLAIN = {"font": "KST", "size": "96", "color": "#FFFFFF", "bold": "0", "text-kerning": "100", "text-italic": "0",
         "text-edge": "0", "default-font": "KST", "edge-width": "2", "edge-color": "#000000"}
STYLED = dict(PLAIN, size="150", color=RED, bold="1", **{"text-edge": "1", "edge-width": "5"})

# How far the titler's picture may be from the reference: mean in levels of 0 to 255 over all that is drawn, and the
# share of pixels that differ visibly.
MEAN, VISIBLE = 0.5, 0.001


class StyleSession(PanelTest):
    def style_object(self):
        self.tap(ON_THE_TEXT)
        self.screenshot("object.png")
        for name in ("KerningLarger", "ShadowRightDown", "AlignCenter", "TenPixels", "MoveRight", "MoveDown"):
            self.use(name)
        self.screenshot("moved.png")
        for name in ("Undo", "Undo", "Redo"):
            self.tool(name)
        self.screenshot("undone.png")

    # Answers

    def assert_letters(self, content, plain, styled):
        items = content.findall("text-item")
        self.assertEqual([item.get("text") for item in items], list(TEXT))
        word = range(TEXT.index(WORD), TEXT.index(WORD) + len(WORD))
        for position, item in enumerate(items):
            with self.subTest(position=position):
                wanted = dict(styled if position in word else plain, text=TEXT[position])
                self.assertEqual(item.attrib, wanted)

    def reference(self, root, name):
        path = os.path.join(self.keep, name)
        xml.etree.ElementTree.ElementTree(root).write(path + ".xml", encoding="utf-8", xml_declaration=True)
        subprocess.run([os.path.join(harness.BUILD, "tests", "titler_reference"), path + ".xml", path + ".png"],
                       env=dict(self.environment, QT_QPA_PLATFORM="offscreen"), check=True)
        return path + ".png"

    def distance(self, root, name):
        return harness.pngdiff("pictures", self.title.picture("_1920.png"), self.reference(root, name),
                               os.path.join(self.keep, name + "-difference.png"))

    def assert_picture(self, root):
        """The picture is the one that this record means, and no other one."""
        answer = self.distance(root, "wanted")
        self.assertLessEqual(answer["mean"], MEAN, answer)
        self.assertLessEqual(answer["visible"], VISIBLE, answer)
        last = root.findall("meta-text/content")[-1]
        word = TEXT.index(WORD)
        changes = [(-1, "position-X", float(last.get("position-X")) + 2), (-1, "text-align", -1),
                   (-1, "shadow-direction-x", 0), (word, "size", 144), (word, "color", "#C83030"), (word, "bold", 0),
                   (word, "text-edge", 0), (word, "edge-width", 4), (word, "edge-color", "#303030"),
                   (0, "text-kerning", 100), (0, "text-italic", 1), (0, "font", "KST Japanese Pro")]
        for item, attribute, value in changes:
            with self.subTest(item=item, attribute=attribute):
                other = copy.deepcopy(root)
                content = other.findall("meta-text/content")[-1]
                element = content if item < 0 else content.findall("text-item")[item]
                self.assertNotEqual(element.get(attribute), str(value))
                element.set(attribute, str(value))
                answer = self.distance(other, f"other-{item}-{attribute}")
                self.assertTrue(answer["mean"] > MEAN or answer["visible"] > VISIBLE, answer)

    def test_a_session(self):
        self.type_new_text()
        self.select_word()
        self.style_word()
        content = self.new_content()
        self.assert_letters(content, PLAIN, STYLED)
        place = float(content.get("position-X")), float(content.get("position-Y"))

        self.style_object()
        start = self.appliance.mark()
        self.tool("Close")
        self.wait_closed(start)

        wider = {"text-kerning": "110"}
        self.assert_letters(self.new_content(), dict(PLAIN, **wider), dict(STYLED, **wider))
        # The move down was undone, the one to the right was undone and redone. The smallest letter has 96 pixels, two
        # and some of which make a step of the shadow: three steps.
        wanted = {"text": TEXT, "id": "2", "position-X": f"{place[0] + 10:g}", "position-Y": f"{place[1]:g}",
                  "position-Z": "2", "text-align": "0", "text-shadow": "1", "shadow-color": "#000000",
                  "shadow-direction-x": "12", "shadow-direction-y": "12", "shadow-blur-radius": "48",
                  "item-count": str(len(TEXT))}
        self.assertEqual(self.new_content().attrib, wanted)
        root = self.title.root()
        self.assertEqual(root.find("meta-text").attrib, {"content-count": "2"})
        self.assertEqual(root.attrib, self.before.attrib)
        self.assertEqual(root.find("meta-bg").attrib, self.before.find("meta-bg").attrib)
        self.assert_pictures_have_their_sizes(self.title)
        self.assert_picture(root)

        # And that is what the canvas shows. A last line stands three pixels higher in either raster, so it is a pixel
        # of the canvas off; around letters on nothing there is nothing else to compare.
        self.open_title(self.title)
        self.assert_canvas_shows(self.title, mean=8.0, visible=0.1)


if __name__ == "__main__":
    unittest.main()

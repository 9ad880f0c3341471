"""What the tests of the property panel share: where things are, and hands that use them on a touch screen."""
import harness
import session
import touchscreen

FIRST_LINE = "Breaking"
WORD = "快讯"
REST = " now"
TEXT = FIRST_LINE + "\n" + WORD + REST

# Where things of the panel are in the window, in its own pixels.
PANEL = {
    "Color": (955, 885), "SizeField": (728, 956), "SizeDown": (882, 956), "SizeUp": (956, 956), "Bold": (739, 1027),
    "EdgeOn": (1254, 885), "EdgeWidth": (1320, 885), "ShadowRightDown": (1262, 956), "KerningLarger": (1254, 1027),
    "AlignCenter": (1364, 1027), "TenPixels": (1516, 1028), "MoveRight": (1850, 956), "MoveDown": (1749, 992),
}
PALETTE = (640, 350)
PALETTE_BLUE = (PALETTE[0] + 411, PALETTE[1] + 158)
PALETTE_RED = (PALETTE[0] + 45, PALETTE[1] + 158)
PALETTE_CANCEL = (PALETTE[0] + 410, PALETTE[1] + 299)
PALETTE_OK = (PALETTE[0] + 230, PALETTE[1] + 299)
RED = "#C80000"
# The edge slider: its handle at two pixels, and the place for five.
SLIDER_AT_TWO, SLIDER_AT_FIVE = (1363, 940), (1439, 940)
BESIDE_EVERYTHING = (300, 900)
CORNER_OF_CANVAS = (640, 780)
# In the new text: within its first Asian letter, the handle behind that, and behind the word.
IN_THE_WORD = (1420, 470)
HANDLE, HANDLE_AT_END = (1439, 508), (1505, 508)
ON_THE_TEXT = (1480, 380)


class PanelTest(harness.TitlerTest):
    """A test case with a title of one text open, to which a second text can be typed."""

    display_class = touchscreen.TouchDisplay

    def setUp(self):
        super().setUp()
        self.title = self.titles(self.folder())[3]  # one text on nothing
        self.before = self.title.root()
        self.open_title(self.title)

    # Hands

    def tap(self, place):
        self.display.tap(*place)
        self.display.wait_until_still()

    def use(self, name):
        self.tap(PANEL[name])

    def open(self, name, place):
        """Taps a button and waits until what it opens can be seen at a place."""
        before = self.pixel(*place)
        self.use(name)
        session.wait_until(lambda: self.pixel(*place) != before, 20 * harness.SLOW, f"what {name} opens")
        self.display.wait_until_still()

    def tool(self, name):
        self.tap(harness.TOOL_POINTS[name])

    def drag(self, *places):
        """As a hand does: each move is seen before the next one comes."""
        self.display.down(*places[0])
        for start, end in zip(places, places[1:]):
            for step in range(1, 5):
                self.display.move(start[0] + (end[0] - start[0]) * step / 4, start[1] + (end[1] - start[1]) * step / 4)
                self.display.wait_until_still(quiet=0.15)
        self.display.up(*places[-1])
        self.display.wait_until_still()

    def handle_shows(self):
        """A handle is blue, darker or lighter; the title has no other blue."""
        red, _, blue = self.pixel(*HANDLE)
        return blue - red > 60

    def hold_until(self, place, condition, what):
        self.display.down(*place)
        session.wait_until(condition, 20 * harness.SLOW, what)
        self.display.up(*place)
        self.display.wait_until_still()

    # Stages

    def type_new_text(self):
        start = self.appliance.mark()
        self.tool("New Text")
        self.wait_keyboard(start)
        self.command(f"string {FIRST_LINE}")
        self.command("key Return")
        self.command(f"string {WORD}{REST}")
        self.display.wait_until_still()
        self.screenshot("typed.png")

    def select_word(self):
        self.hold_until(IN_THE_WORD, self.handle_shows, "the handles of a selected letter")
        self.drag(HANDLE, HANDLE_AT_END)
        self.screenshot("selected.png")

    def style_word(self):
        self.open("Color", PALETTE_BLUE)
        self.tap(PALETTE_BLUE)
        self.tap(PALETTE_RED)
        self.screenshot("palette.png")
        self.tap(PALETTE_OK)
        start = self.appliance.mark()
        self.use("SizeField")
        self.wait_keyboard(start)
        self.command("string-enter 150")
        self.command("key Return")
        self.display.wait_until_still()
        self.use("Bold")
        self.use("EdgeOn")
        self.open("EdgeWidth", SLIDER_AT_TWO)
        self.drag(SLIDER_AT_TWO, SLIDER_AT_FIVE)
        self.screenshot("slider.png")
        self.tap(BESIDE_EVERYTHING)
        self.screenshot("styled.png")
        # Beside all objects: leaves the text, which saves it.
        self.tap(CORNER_OF_CANVAS)
        self.wait_text(self.title, TEXT)

    # Answers

    def new_content(self):
        return self.title.root().findall("meta-text/content")[-1]

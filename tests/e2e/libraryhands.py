"""What the tests of the title library share: hands that use the list, the folder picker and the keyboard service on a
touch screen."""
import harness
import touchscreen

ORDER_NOTICE = ("FileManagerController", "updateTitlerOrder")
# The middle of the handle of the first title in move mode, and the Move button, in pixels of the screen.
HANDLE = (540, 133)
MOVE = (520, 36)
BESIDE_LIST = (566, 70, 590, 230)
# From the middle of a folder's row in the picker to what opens it.
EXPANDER = (-95, 0)


class LibraryTest(harness.TitlerTest):
    """A test case whose clicks are taps. Rows are numbered as they are on the screen, from 0, with nothing scrolled."""

    display_class = touchscreen.TouchDisplay

    def setUp(self):
        super().setUp()
        # The folders as the picker shows them: what is made while it is open comes behind those that were there.
        self.rows = self.folders()

    def click(self, x, y, button=1):
        left, top, _, _ = self.display.geometry(self.window())
        self.display.tap(left + x, top + y)

    def part(self, left, top, right, bottom):
        """The pixels of a part of the screen."""
        return self.display.part(left, top, right - left, bottom - top)

    # The list

    @staticmethod
    def list_point(row):
        return harness.LIST_POINT[0], harness.LIST_POINT[1] + row * harness.LIST_ROW

    def hold(self, x, y):
        """A finger that stays until the menu covers what is two titles further down."""
        def below():
            return self.part(x - 50, y + 200, x + 50, y + 240)

        before = below()
        self.display.down(x, y)
        harness.session.wait_until(lambda: below() != before, 20 * harness.SLOW, "the menu")
        self.display.wait_until_still()
        self.display.up(x, y)

    def choose_in_list_menu(self, row, entry):
        """Holds the title in this row, one of the upper ones, until the menu is there, and chooses."""
        x, y = self.list_point(row)
        self.hold(x, y)
        self.display.tap(x, y + harness.LIST_MENU_TOP + harness.LIST_MENU_ENTRIES.index(entry) * harness.LIST_MENU_ROW)
        self.display.wait_until_still()

    def tap_move(self):
        self.display.tap(*MOVE)
        self.display.wait_until_still()

    def lift(self):
        """In move mode, puts a finger on the handle of the first title until it is lifted."""
        def beside():
            """What is on the right of the list, where only a lifted title reaches."""
            return self.part(*BESIDE_LIST)

        before = beside()
        self.display.down(*HANDLE)
        harness.session.wait_until(lambda: beside() != before, 20 * harness.SLOW, "the lifted title")

    def carry_to(self, y):
        for place in range(HANDLE[1], y, 15):
            self.display.move(HANDLE[0], place)
        self.display.move(HANDLE[0], y)
        self.display.wait_until_still()

    def drop(self, y):
        start = self.appliance.mark()
        self.display.up(HANDLE[0], y)
        self.wait_call(*ORDER_NOTICE, start)
        self.display.wait_until_still()

    # The folder picker

    def row_point(self, name):
        x, y = harness.PICKER_ROW
        return x, y + harness.PICKER_ROW_HEIGHT * self.rows.index(name)

    def tap_row(self, name):
        self.click(*self.row_point(name))
        self.display.wait_until_still()

    def tap_title_row(self, name, number):
        """Opens a folder's row and taps one of the titles under it."""
        x, y = self.row_point(name)
        self.click(x + EXPANDER[0], y + EXPANDER[1])
        self.display.wait_until_still()
        self.click(x, y + harness.PICKER_ROW_HEIGHT * (number + 1))
        self.display.wait_until_still()

    def open_picker_from_the_sub_panel(self):
        self.command("sub")
        self.wait_shown()
        self.wait_picker()

    def type_name(self, name):
        """As the keyboard does: the whole text, then its Enter key."""
        self.command(f"string-enter {name}")
        self.command("key Enter")
        self.display.wait_until_still()

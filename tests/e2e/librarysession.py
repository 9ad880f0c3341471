"""A whole session of an operator, from a sibling's request for new titles to a copied folder, in steps."""
import os

import harness
import wire
from libraryhands import HANDLE, LibraryTest

CALL_TYPE = 7
FOLDER, COPY = "Abend 速報 1", "Abend 속보 2"
# Of the preset templates: both have two texts.
LOWER_THIRD, NAME_PLATE = 0, 1
FIRST_TEXT, SECOND_TEXT = "Élections 2026", "开票 선거 投票"
# On the letters of a new text, and where a finger carries it from there.
ON_NEW_TEXT, UPPER_PLACE = (1400, 490), (1100, 240)
CORNER_OF_CANVAS = (640, 780)


class LibrarySession(LibraryTest):
    """The steps of the session. What was saved at the end of each is in saved: the texts of each title in each folder."""

    def setUp(self):
        super().setUp()
        self.asker = None
        self.saved = {}

    # What is on disk

    def new_titles(self):
        return self.titles(self.folder(FOLDER))

    def found(self):
        """The texts of each title in each folder, as the order files name them."""
        return {name: {os.path.basename(title.stem): title.texts() for title in self.titles(self.folder(name))}
                for name in self.folders() if os.path.exists(os.path.join(self.folder(name), ".order.xml"))}

    def note_saved(self):
        """Keeps what is on disk now, which nothing may take away any more but the operator."""
        self.saved = self.found()

    def user_templates(self):
        return self.titles(os.path.join(self.base, "resources", "TitlerTemplates"))

    # Steps, in their order

    def ask_for_titles(self):
        if self.asker:
            self.asker.close()
        self.asker = wire.Asker(self.offset)
        self.addCleanup(self.asker.close)
        self.asker.ask(CALL_TYPE)
        self.wait_shown()
        self.wait_picker()

    def make_folder(self):
        start = self.appliance.mark()
        # Folders can be made once one has been chosen.
        self.tap_row("Welcome")
        self.click_picker("New Folder")
        self.wait_keyboard(start)
        self.rows.append(FOLDER)
        self.type_name(FOLDER)
        self.click_picker("Open")

    def begin_title(self):
        self.choose_template(LOWER_THIRD)
        self.wait_titles(self.folder(FOLDER), 1)
        self.display.wait_until_still()

    def type_texts(self):
        for text in (FIRST_TEXT, SECOND_TEXT):
            start = self.appliance.mark()
            self.click_tool("New Text")
            self.wait_keyboard(start)
            self.command(f"string {text}")
            self.display.wait_until_still()
            self.click(*CORNER_OF_CANVAS)
            self.wait_text(self.new_titles()[0], text)
            self.display.wait_until_still()
            if text == FIRST_TEXT:
                # Only a selected object follows a finger.
                self.click(*ON_NEW_TEXT)
                self.display.wait_until_still()
                self.display.drag(ON_NEW_TEXT, UPPER_PLACE)
                self.display.wait_until_still()
        self.click(*CORNER_OF_CANVAS)
        self.display.wait_until_still()

    def paste(self):
        self.choose_in_list_menu(0, "Copy")
        self.choose_in_list_menu(0, "Paste")
        self.wait_titles(self.folder(FOLDER), 2)
        self.display.wait_until_still()

    def add_title(self):
        self.choose_in_list_menu(1, "Create New")
        self.choose_template(NAME_PLATE)
        self.wait_titles(self.folder(FOLDER), 3)
        self.display.wait_until_still()

    def carry_first_to_end(self):
        self.tap_move()
        self.lift()
        self.carry_to(HANDLE[1] + 2 * harness.LIST_ROW)
        self.drop(HANDLE[1] + 2 * harness.LIST_ROW)
        self.tap_move()

    def delete_and_undo(self):
        self.choose_in_list_menu(0, "Delete")
        self.wait_titles(self.folder(FOLDER), 2)
        self.click_tool("Undo")
        self.wait_titles(self.folder(FOLDER), 3)
        self.display.wait_until_still()

    def save_as_template(self):
        count = len(self.user_templates())
        self.choose_in_list_menu(2, "Save as Template")
        harness.session.wait_until(lambda: len(self.user_templates()) > count, 20 * harness.SLOW, "the template")
        self.display.wait_until_still()
        self.screenshot("template.png")
        self.leave_templates("Cancel")

    def end(self):
        self.close_window()

    def duplicate_folder(self):
        self.rows = self.folders()
        self.open_picker_from_the_sub_panel()
        start = self.appliance.mark()
        self.tap_row(FOLDER)
        self.click_picker("Duplicate")
        self.rows.insert(self.rows.index(FOLDER) + 1, COPY)
        self.wait_keyboard(start)
        self.type_name(COPY)
        self.wait_titles(self.folder(COPY), 3)
        self.display.wait_until_still()

    def open_by_name(self):
        start = self.appliance.mark()
        self.tap_title_row(COPY, 1)
        self.screenshot("picker.png")
        self.click_picker("Open")
        self.wait_call("FileManagerController", "titlerEditStatus", start)
        self.display.wait_until_still()

    STEPS = (ask_for_titles, make_folder, begin_title, type_texts, paste, add_title, carry_first_to_end, delete_and_undo,
             save_as_template, end, duplicate_folder, open_by_name, end)

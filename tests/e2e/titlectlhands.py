"""What the tests of titlectl share: running it, and looking at the folders that it has worked on."""
import csv
import io
import json
import os
import re
import shutil
import subprocess
import tempfile
import unittest
import xml.sax.saxutils
import zipfile

import harness
import samples

TITLECTL = os.path.join(harness.BUILD, "bin", "titlectl")
DONE, FINDINGS, WRONG_USE = 0, 1, 2
XML_HEAD = '<?xml version="1.0" encoding="UTF-8" standalone="yes"?>\n'
MAIN = "http://schemas.openxmlformats.org/spreadsheetml/2006/main"
LINKS = "http://schemas.openxmlformats.org/officeDocument/2006/relationships"
PACKAGE_LINKS = "http://schemas.openxmlformats.org/package/2006/relationships"


class TitlectlHands:
    """Mixed into a test case that has an environment and a work folder."""

    def titlectl_environment(self):
        """The environment of the test without a display."""
        environment = dict(self.environment)
        for name in ("DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"):
            environment.pop(name, None)
        return environment

    def run_titlectl(self, *arguments, code=DONE):
        done = subprocess.run([TITLECTL, *arguments], env=self.titlectl_environment(), capture_output=True, text=True,
                              check=False, timeout=120 * harness.SLOW, cwd=self.work)
        self.assertEqual(done.returncode, code, done.stdout + done.stderr)
        self.assertIsNone(harness.SANITIZER_REPORT.search(done.stderr), done.stderr)
        return done

    def json(self, *arguments, code=DONE):
        return json.loads(self.run_titlectl(*arguments, "--json", code=code).stdout)

    @staticmethod
    def pictures(folder):
        """The bytes of the four pictures of each title below the folder, by path."""
        found = {}
        for parent, _, names in os.walk(folder):
            for name in names:
                if name.endswith(tuple(harness.PICTURES)) and "_source_" not in name:
                    with open(os.path.join(parent, name), "rb") as stream:
                        found[os.path.relpath(os.path.join(parent, name), folder)] = stream.read()
        return found

    @staticmethod
    def order(folder):
        """The names of the title files in the order of the folder."""
        with open(os.path.join(folder, ".order.xml"), encoding="utf-8") as stream:
            return re.findall(r'file-path="([^"]*)"', stream.read())

    def texts(self, folder):
        """The texts of each title of the folder, in its order, by id."""
        return [{str(text["id"]): text["text"] for text in title["texts"]} for title in self.json("show", folder)]

    def write(self, name, text):
        """Writes a file of the work folder and returns its path."""
        path = os.path.join(self.work, name)
        with open(path, "w", encoding="utf-8", newline="") as stream:
            stream.write(text)
        return path


class TitlectlTest(TitlectlHands, unittest.TestCase):
    """A test case with the sample titles and nothing that runs."""

    made = None

    @classmethod
    def setUpClass(cls):
        cls.made = os.environ.get("TITLER_SAMPLES")
        if cls.made is None:
            cls.made = tempfile.mkdtemp(prefix="titler-")
            cls.addClassCleanup(shutil.rmtree, cls.made, ignore_errors=True)
            samples.make(harness.BUILD, cls.made)

    def setUp(self):
        self.work = tempfile.mkdtemp(prefix="titler-")
        self.addCleanup(shutil.rmtree, self.work, ignore_errors=True)
        data = os.path.join(self.work, "d")
        samples.copy(self.made, data)
        self.environment = harness.session.program_environment(harness.BUILD, K2SYS_AC_DATA=data, K2SYS_AC_ROOT="",
                                                               K2SYS_LOG_DIR=self.work)
        self.root = os.path.join(data, "defaultuser", "resources", "Titles")
        self.folder = os.path.join(self.root, "Welcome")

    def first_title(self):
        return os.path.join(self.folder, self.order(self.folder)[0])


# Lists as files: rows of cells, the first one with the names of the columns.

def csv_text(rows, separator=","):
    text = io.StringIO()
    csv.writer(text, delimiter=separator, lineterminator="\r\n").writerows(rows)
    return text.getvalue()


def json_text(rows):
    return json.dumps([dict(zip(rows[0], row)) for row in rows[1:]], ensure_ascii=False, indent=1)


def write_workbook(path, rows):
    """Numbers as numbers, every other text shared, the rest in its cell."""
    shared = []

    def cell(reference, value, row):
        if value.isdigit():
            return f'<c r="{reference}"><v>{value}</v></c>'
        text = xml.sax.saxutils.escape(value)
        if row % 2:
            return f'<c r="{reference}" t="inlineStr"><is><t xml:space="preserve">{text}</t></is></c>'
        shared.append(text)
        return f'<c r="{reference}" t="s"><v>{len(shared) - 1}</v></c>'

    def line(number, row):
        cells = "".join(cell(f"{chr(ord('A') + column)}{number}", value, number) for column, value in enumerate(row))
        return f'<row r="{number}">{cells}</row>'

    sheet = "".join(line(number, row) for number, row in enumerate(rows, 1))

    def link(number, kind, target):
        return f'<Relationship Id="r{number}" Type="{LINKS}/{kind}" Target="{target}"/>'

    parts = {
        "_rels/.rels": f'<Relationships xmlns="{PACKAGE_LINKS}">{link(1, "officeDocument", "xl/workbook.xml")}'
                       "</Relationships>",
        "xl/workbook.xml": f'<workbook xmlns="{MAIN}" xmlns:r="{LINKS}"><sheets><sheet name="List" sheetId="1" r:id="r1"/>'
                           "</sheets></workbook>",
        "xl/_rels/workbook.xml.rels": f'<Relationships xmlns="{PACKAGE_LINKS}">'
                                      f'{link(1, "worksheet", "worksheets/sheet1.xml")}'
                                      f'{link(2, "sharedStrings", "sharedStrings.xml")}</Relationships>',
        "xl/worksheets/sheet1.xml": f'<worksheet xmlns="{MAIN}"><sheetData>{sheet}</sheetData></worksheet>',
        "xl/sharedStrings.xml": f'<sst xmlns="{MAIN}">' + "".join(f"<si><t>{text}</t></si>" for text in shared) + "</sst>"}
    with zipfile.ZipFile(path, "w", zipfile.ZIP_DEFLATED) as archive:
        for name, body in parts.items():
            archive.writestr(name, XML_HEAD + body)

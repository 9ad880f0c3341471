"""Runs an operator's session whose file operations fail, or that is killed in one, and says what is wrong afterwards.

What must hold: every title is the old one or the new one and whole, none is lost, and where less is on the disk than the
operator saw, a message was shown.
"""
import hashlib
import json
import os
import shutil
import signal
import subprocess
import sys
import tempfile
import xml.etree.ElementTree

HERE = os.path.dirname(os.path.abspath(__file__))
ROOT = os.path.dirname(os.path.dirname(HERE))
sys.path.insert(0, os.path.join(ROOT, "tests", "e2e"))

import wire  # noqa: E402  pylint: disable=wrong-import-position

BUILD = os.environ.get("TITLER_BUILD", os.path.join(ROOT, "build"))
PROGRAM = os.path.join(BUILD, "tests", "titler_fault_session")
SHIM = os.path.join(BUILD, "lib", "libtitler_faults.so")
ERRORS = ("ENOSPC", "EIO", "EROFS")
PICTURES = ("_1920.png", "_960.png", "_240.png", "_240S.png")
FIRST_FOLDER = "news"
DELETED = "c"
RENAMING = "duplicate and rename folders"
OLD_NAME, NEW_NAME = "sport", "sports"
PATIENCE = 60


class Run:
    """What one process said and how it ended."""

    def __init__(self, done, timed_out):
        self.code = done.returncode
        self.timed_out = timed_out
        self.errors = done.stderr
        self.lines = [json.loads(line) for line in done.stdout.splitlines() if line.startswith("{") and line.endswith("}")]

    def last(self, *keys):
        return next((line for line in reversed(self.lines) if any(key in line for key in keys)), {})

    @property
    def told(self):
        """The messages until the session was played to its end."""
        return next((line["told"] for line in reversed(self.lines) if "told" in line), [])

    @property
    def count(self):
        return int(max((line.get("count", 0) for line in self.lines), default=0))

    @property
    def hit(self):
        return next((line["hit"] for line in reversed(self.lines) if line.get("hit")), "")


class Ground:
    """A folder in memory with the data that each session begins with."""

    def __init__(self):
        memory = "/dev/shm"
        self.folder = tempfile.mkdtemp(prefix="titler-faults-", dir=memory if os.access(memory, os.W_OK) else None)
        self.data = os.path.join(self.folder, "d")
        self.seed = os.path.join(self.folder, "seed")
        os.makedirs(self.data)
        self.check(self.start("make"))
        self.check(self.start("pictures"))
        os.rename(self.data, self.seed)
        self.pictures = {}

    def close(self):
        shutil.rmtree(self.folder, ignore_errors=True)

    @staticmethod
    def check(run):
        if run.code != 0:
            raise RuntimeError(f"ended with {run.code}: {run.errors}")

    @property
    def base(self):
        return os.path.join(self.data, "defaultuser")

    @property
    def titles(self):
        return os.path.join(self.base, "titles")

    def fresh(self):
        shutil.rmtree(self.data, ignore_errors=True)
        shutil.copytree(self.seed, self.data)

    def environment(self, **changes):
        environment = dict(os.environ, QT_QPA_PLATFORM="offscreen", LC_ALL="C.UTF-8", TMPDIR=self.folder, **changes)
        environment.setdefault("K2SYS_LOG_DIR", self.folder)
        return environment

    def start(self, command, at=0, error="EIO", how="once"):
        environment = self.environment(LD_PRELOAD=SHIM, FAULTS_ROOT=self.data, FAULTS_AT=str(at), FAULTS_ERROR=error,
                                       FAULTS_HOW=how)
        arguments = [PROGRAM, command, self.data]
        try:
            done = subprocess.run(arguments, env=environment, capture_output=True, text=True, check=False, timeout=PATIENCE)
            return Run(done, False)
        except subprocess.TimeoutExpired as late:
            output = (late.stdout or b"").decode(errors="replace")
            return Run(subprocess.CompletedProcess(arguments, -signal.SIGALRM, output, ""), True)

    # What is on the disk

    def order(self, folder):
        path = os.path.join(self.titles, folder, ".order.xml")
        try:
            rows = xml.etree.ElementTree.parse(path).getroot().iter("index")
            return [os.path.splitext(row.get("file-path", ""))[0] for row in rows]
        except (OSError, xml.etree.ElementTree.ParseError):
            return []

    def title(self, folder, stem):
        try:
            return xml.etree.ElementTree.parse(os.path.join(self.titles, folder, stem + ".xml")).getroot()
        except (OSError, xml.etree.ElementTree.ParseError):
            return None

    def texts(self, folder, stem):
        root = self.title(folder, stem)
        return None if root is None else [content.get("text") for content in root.iter("content")]

    def templates(self):
        root = os.path.join(self.base, "usertemplates")
        return sorted(name for name in os.listdir(root) if os.path.exists(os.path.join(root, name, "Titler.xml")))

    def picture_key(self, folder, stem):
        """What a title's pictures show: its file without the names in it."""
        root = self.title(folder, stem)
        for element in root.iter():
            for name in list(element.attrib):
                if name.startswith(("thumbnail", "resource")):
                    del element.attrib[name]
        background = os.path.exists(os.path.join(self.titles, folder, stem + "_source_1920.png"))
        return xml.etree.ElementTree.tostring(root), background

    def digests(self, folder, stem):
        found = []
        for suffix in PICTURES:
            try:
                with open(os.path.join(self.titles, folder, stem + suffix), "rb") as stream:
                    found.append(hashlib.sha256(stream.read()).hexdigest())
            except OSError:
                found.append(None)
        return found

    def learn_pictures(self):
        """Takes the pictures of a session in which nothing failed for right."""
        for folder in os.listdir(self.titles):
            for stem in self.order(folder):
                self.pictures[self.picture_key(folder, stem)] = self.digests(folder, stem)

    def leftovers(self):
        return [os.path.relpath(os.path.join(place, name), self.base) for place, _, names in os.walk(self.base)
                for name in names if name.startswith(".") and name != ".order.xml"]

    # What is wrong

    def problems_of_files(self):
        return [f"torn: {os.path.relpath(path, self.base)} ({why})" for path, why in wire.broken_files(self.base).items()]

    def problems_of_pictures(self, excused):
        wrong = []
        for folder in sorted(os.listdir(self.titles)):
            for stem in self.order(folder):
                if self.title(folder, stem) is None:
                    continue
                digests = self.digests(folder, stem)
                missing = [suffix for suffix, digest in zip(PICTURES, digests) if digest is None]
                right = self.pictures.get(self.picture_key(folder, stem))
                if missing:
                    wrong.append(f"no picture: {folder}/{stem} {' '.join(missing)}")
                elif right and right != digests and not excused:
                    other = [suffix for suffix, digest, wanted in zip(PICTURES, digests, right) if digest != wanted]
                    wrong.append(f"pictures of something else: {folder}/{stem} {' '.join(other)}")
        return wrong

    def problems_of_titles(self, believed, history, excused):
        """believed: what the operator saw last; history: what each title has said at some time. excused: the disk takes
        nothing, and the operator was told."""
        wrong = []
        for folder, titles in believed.items():
            order = self.order(folder)
            seen = [title["stem"] for title in titles]
            for title in titles:
                stem, texts = title["stem"], self.texts(folder, title["stem"])
                is_old = folder == FIRST_FOLDER and len(stem) == 1
                if texts is None or stem not in order:
                    if is_old or not excused:
                        state = "lost" if texts is None else "no more in its folder"
                        wrong.append(f"{state}: {folder}/{stem}")
                elif texts not in history.get((folder, stem), [title["texts"]]):
                    wrong.append(f"neither old nor new: {folder}/{stem} {texts}")
                elif texts != title["texts"] and not excused:
                    wrong.append(f"not saved: {folder}/{stem} {texts} for {title['texts']}")
            if not excused and order != seen and set(order) == set(seen):
                wrong.append(f"in another order: {folder} {order} for {seen}")
        return wrong


def history_of(run):
    history = {}
    for line in run.lines:
        for folder, titles in line.get("folders", {}).items():
            for title in titles:
                history.setdefault((folder, title["stem"]), []).append(title["texts"])
    return history


def check_end(run):
    wrong = [line["wrong"] for line in run.lines if "wrong" in line]
    if run.timed_out:
        wrong.append(f"has not ended after {PATIENCE} s")
    elif run.code != 0:
        wrong.append(f"ended with {run.code}: {run.errors.strip()[-300:]}")
    return wrong


def check_failed(ground, run, wanted, how="once", reads_failed=False):
    """After a session in which operations failed; wanted is what the same session gave when none did. reads_failed: reading
    failed, too, and pictures are made without a background that cannot be read just then."""
    wrong = check_end(run) + ground.problems_of_files()
    done = [line for line in run.lines if "done" in line]
    if not done or not run.last("looked"):
        return wrong + ["the session broke off"]
    told = bool(run.told)
    # Where the disk was well again at the end, what was refused before has been saved by then: a message is no excuse.
    excused = told and how == "on"
    believed = done[-1]["folders"]
    wrong += ground.problems_of_titles(believed, history_of(run), excused)
    for folder in wanted["folders"]:
        if folder not in believed and not told:
            wrong.append(f"no folder {folder}, nobody was told")
        elif not told and len(believed[folder]) != len(wanted["folders"][folder]):
            wrong.append(f"{len(believed[folder])} titles in {folder} for {len(wanted['folders'][folder])}, nobody was told")
    if len(ground.templates()) != wanted["templates"] and not told:
        wrong.append(f"templates {ground.templates()}, nobody was told")
    return wrong + ground.problems_of_pictures(excused or reads_failed)


def check_killed(ground, run, looked):
    """After a session that was killed, and a process after it that has looked at everything."""
    wrong = check_end(looked) + ground.problems_of_files()
    before = next((line for line in reversed(run.lines) if "done" in line), None)
    now = run.lines[-1] if run.lines and "begin" in run.lines[-1] else None
    if before is None or now is None:
        return wrong
    for folder, titles in before["folders"].items():
        foreseen = {title["stem"]: title["texts"] for title in now["folders"].get(folder, [])}
        place = folder
        if now["begin"] == RENAMING and folder == OLD_NAME and not os.path.isdir(os.path.join(ground.titles, folder)):
            place = NEW_NAME
        order = ground.order(place)
        for title in titles:
            stem, texts = title["stem"], ground.texts(place, title["stem"])
            if texts is None or stem not in order:
                if stem in foreseen:
                    wrong.append(f"{'lost' if texts is None else 'no more in its folder'}: {place}/{stem}")
            elif texts not in (title["texts"], foreseen.get(stem)):
                wrong.append(f"neither old nor new: {place}/{stem} {texts}")
    wrong += [f"left over: {name}" for name in ground.leftovers()]
    return wrong + ground.problems_of_pictures(False)

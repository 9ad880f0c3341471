"""The sample data of the end-to-end tests: samples.py FOLDER makes it there, once for a run of the suite.

What titler_provision writes takes seconds of a processor to make. Templates name their backgrounds by full paths, which
have to lie below the data path; in the samples a mark stands for it.
"""
import os
import shutil
import subprocess
import sys
import tempfile

sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "scripts"))
import session  # noqa: E402  pylint: disable=wrong-import-position

DATA_PATH_MARK = "@DATA PATH@"


def make(build, folder):
    """Fills the folder, which is emptied before."""
    shutil.rmtree(folder, ignore_errors=True)
    os.makedirs(folder)
    # The platform's buffers for paths are short, so the data path is, too.
    with tempfile.TemporaryDirectory(prefix="titler-") as work:
        data = os.path.join(work, "d")
        environment = session.program_environment(build, K2SYS_AC_ROOT="", K2SYS_AC_DATA=data, K2SYS_LOG_DIR=work)
        subprocess.run([os.path.join(build, "bin", "titler_provision")], env=environment, check=True,
                       stdout=subprocess.DEVNULL)
        _rewrite_paths(data, data, DATA_PATH_MARK)
        shutil.copytree(data, os.path.join(folder, "d"))


def copy(folder, data):
    """Copies the samples of the folder to a data path."""
    shutil.copytree(os.path.join(folder, "d"), data)
    _rewrite_paths(data, DATA_PATH_MARK, data)


def _rewrite_paths(folder, before, after):
    for parent, _, names in os.walk(folder):
        for name in names:
            if not name.endswith(".xml"):
                continue
            path = os.path.join(parent, name)
            with open(path, "r+", encoding="utf-8") as stream:
                text = stream.read()
                if before in text:
                    stream.seek(0)
                    stream.write(text.replace(before, after))
                    stream.truncate()


if __name__ == "__main__":
    make(os.environ["TITLER_BUILD"], sys.argv[1])

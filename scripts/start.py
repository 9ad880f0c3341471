#!/usr/bin/env python3
"""Starts the appliance and the titler of the build, fills the data path where that is needed, and asks for a title.

With a display the window opens there and the programs run until one of them or this script is ended. Without one they
run on an Xvfb; a screenshot is left in build/run/ and all ends, unless --keep is given.
Lines typed on standard input go to the appliance as commands (see README.md).
"""
import argparse
import os
import shutil
import signal
import subprocess
import sys
import threading

import session

UNPRIVILEGED_OFFSET = 20000


def parse(arguments):
    parser = argparse.ArgumentParser(prog="scripts/run", description=__doc__,
                                     formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--keep", action="store_true", help="stay up without a display, too")
    parser.add_argument("--build", default=os.path.join(session.ROOT, "build"), help="the build tree")
    parser.add_argument("--title",
                        help="the title file or folder to open, below the titles of the data path; a sample by default")
    return parser.parse_args(arguments)


def environment_of(build, folder):
    changes = {}
    if not os.environ.get("K2SYS_LOG_DIR"):
        changes["K2SYS_LOG_DIR"] = folder
    if not os.environ.get("K2SYS_PORT_OFFSET") and not session.may_bind_low_ports():
        changes["K2SYS_PORT_OFFSET"] = UNPRIVILEGED_OFFSET
        print(f"Ports below 1024 need root here: all ports are moved by {UNPRIVILEGED_OFFSET}.")
    return session.program_environment(build, **changes)


def provision(build, environment):
    """Fills the data path and returns the base path."""
    done = subprocess.run([os.path.join(build, "bin", "titler_provision")], env=environment, capture_output=True,
                          text=True, check=False)
    sys.stderr.write(done.stderr)
    if done.returncode != 0:
        raise session.SessionError("the data path could not be filled")
    return done.stdout.splitlines()[-1]


def sample_title(base):
    """The first title of the first folder that has one; else an empty folder, in which a title is begun."""
    titles = os.path.join(base, "resources", "Titles")
    welcome = os.path.join(titles, "Welcome")
    os.makedirs(welcome, exist_ok=True)
    for folder in ["Welcome", *sorted(os.listdir(titles))]:
        path = os.path.join(titles, folder)
        if os.path.isdir(path):
            names = sorted(name for name in os.listdir(path) if name.endswith(".xml") and not name.startswith("."))
            if names:
                return os.path.join(path, names[0])
    return welcome


def forward_input(appliance):
    for line in sys.stdin:
        try:
            appliance.command(line.rstrip("\n"))
        except session.SessionError:
            return


def start(build, folder, environment, title, display):
    """Brings both programs up with the title on show and returns them."""
    offset = session.port_offset(environment)
    appliance = session.Appliance(build, os.path.join(folder, "appliance.log"), environment)
    session.wait_listening(appliance, session.MAIN_PORT + offset)
    session.wait_listening(appliance, session.SUB_PANEL_PORT + offset)
    titler = session.start_titler(build, os.path.join(folder, "titler.log"), environment)
    session.wait_listening(titler, session.TITLER_PORT + offset)
    appliance.command("wait-titler")
    appliance.command(f'edit "{title}"')
    if display:
        def shown():
            titler.check()
            return display.find_window("Titler")

        display.watch(appliance)
        display.watch(titler)
        session.wait_until(shown, 30, "the titler's window")
        display.wait_until_still()
    return appliance, titler


def main(arguments):
    options = parse(arguments)
    folder = os.path.join(options.build, "run")
    shutil.rmtree(folder, ignore_errors=True)
    os.makedirs(folder)
    environment = environment_of(options.build, folder)
    display = None
    try:
        base = provision(options.build, environment)
        print(f"Data path: {base}")
        title = os.path.abspath(options.title) if options.title else sample_title(base)
        if not environment.get("DISPLAY"):
            display = session.Display(os.path.join(folder, "display"), environment)
            environment = display.environment
            print(f"No display: running on Xvfb {display.name}.")
        appliance, titler = start(options.build, folder, environment, title, display)
        print(f"The titler shows {title}.")
        if display:
            screenshot = os.path.join(folder, "screenshot.png")
            display.screenshot(screenshot)
            print(f"Screenshot: {screenshot}")
        if not display or options.keep:
            print("Commands for the appliance go to standard input; end with Control-C or power-off.", flush=True)
            threading.Thread(target=forward_input, args=(appliance,), daemon=True).start()
            titler.popen.wait()
        elif titler.stop(30) != 0:
            raise session.SessionError(f"the titler ended with {titler.popen.returncode}, see {titler.log}")
        appliance.stop()
    except session.SessionError as error:
        print(f"scripts/run: {error}", file=sys.stderr)
        return 1
    except KeyboardInterrupt:
        return 0
    finally:
        if display:
            display.stop()
    return 0


if __name__ == "__main__":
    signal.signal(signal.SIGTERM, lambda *_: sys.exit(0))
    sys.exit(main(sys.argv[1:]))

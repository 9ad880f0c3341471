"""What titlectl takes for a title, beside other programs that draw text into a picture, where they are installed.

Makes a list of titles with one outlined text each, then draws them: titlectl on one and on two processors all four files, the
others (melt with a title clip, rsvg-convert, ImageMagick) the picture of 1920 pixels only. Prints milliseconds of wall and
processor time for each title, the median of some runs, and the memory of titlectl for the first ten and for all titles.
"""
import argparse
import csv
import json
import os
import shutil
import statistics
import subprocess
import sys
import tempfile
import time
from xml.sax.saxutils import escape

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
sys.path.insert(0, os.path.join(ROOT, "scripts"))

import session  # noqa: E402  pylint: disable=wrong-import-position

FIRST = 10
TO_RASTER = 1.5
PEER_TITLES = 20  # the others are slower
WIDTH, HEIGHT = 1920, 1080
SAMPLE = "20240101090000004"  # of the sample titles: without a background
AIM = 0.25  # of the time of melt
OURS = {1: "titlectl on one, four files", 2: "titlectl on two, four files"}


class Cost:
    """What one run of a command took."""

    def __init__(self, command, environment, limit=None):
        began = time.monotonic()
        used = sorted(os.sched_getaffinity(0))[:limit]
        process = subprocess.Popen(["taskset", "-c", ",".join(map(str, used)), *command], env=environment,
                                   stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        _, status, usage = os.wait4(process.pid, 0)
        process.returncode = os.waitstatus_to_exitcode(status)
        self.wall = time.monotonic() - began
        self.processor = usage.ru_utime + usage.ru_stime
        self.memory = usage.ru_maxrss / 1024  # MB
        if process.returncode != 0:
            raise SystemExit(f"{command[0]} ended with {process.returncode}")


def median_cost(commands, environment, runs, titles, limit=None):
    """Milliseconds of wall and of processor time for each title; limit is the number of processors to use."""
    walls, processors = [], []
    for _ in range(runs):
        costs = [Cost(command, environment, limit) for command in commands]
        walls.append(sum(cost.wall for cost in costs) * 1000 / titles)
        processors.append(sum(cost.processor for cost in costs) * 1000 / titles)
    return statistics.median(walls), statistics.median(processors)


def make_titles(program, environment, data, count):
    """Returns the folder of a sample title with as many names."""
    titles = os.path.join(data, "defaultuser", "resources", "Titles")
    names = os.path.join(data, "names.csv")
    with open(names, "w", encoding="utf-8", newline="") as stream:
        csv.writer(stream).writerows([["1"]] + [[f"Anna Berg {number}"] for number in range(count)])
    folder = os.path.join(titles, "Names")
    subprocess.run([program, "make", os.path.join(titles, "Welcome", SAMPLE + ".xml"), names, folder], env=environment,
                   check=True, stdout=subprocess.DEVNULL)
    return folder


def write_peers(folder, title):
    """The title as a clip for melt and as SVG; returns their paths."""
    text = title["texts"][0]
    run = text["runs"][0]
    x, y, size, edge = text["x"] * TO_RASTER, text["y"] * TO_RASTER, run["size"], run["outline"]["width"]
    stem = os.path.join(folder, os.path.basename(title["file"]).removesuffix(".xml"))
    with open(stem + ".kdenlivetitle", "w", encoding="utf-8") as stream:
        stream.write(
            f'<kdenlivetitle duration="1" LC_NUMERIC="C" width="{WIDTH}" height="{HEIGHT}" out="0">'
            f'<item type="QGraphicsTextItem" z-index="1"><position x="{x}" y="{y}"><transform>1,0,0,0,1,0,0,0,1</transform>'
            f'</position><content font="{run["font"]}" font-pixel-size="{size}" font-color="255,255,255,255" font-weight="50" '
            f'font-italic="0" font-underline="0" font-outline="{edge}" font-outline-color="0,0,0,255" letter-spacing="0" '
            f'line-spacing="0" box-width="1400" box-height="200" alignment="1" shadow="1;#ff000000;4;4;4">'
            f'{escape(text["text"])}</content></item><startviewport rect="0,0,{WIDTH},{HEIGHT}"/>'
            f'<endviewport rect="0,0,{WIDTH},{HEIGHT}"/><background color="0,0,0,0"/></kdenlivetitle>')
    with open(stem + ".svg", "w", encoding="utf-8") as stream:
        stream.write(
            f'<svg xmlns="http://www.w3.org/2000/svg" width="{WIDTH}" height="{HEIGHT}"><text x="{x}" y="{y + size}" '
            f'font-family="{run["font"]}" font-size="{size}" fill="#fff" stroke="#000" stroke-width="{edge}" '
            f'paint-order="stroke">{escape(text["text"])}</text></svg>')
    return stem


def peer_commands(folder, stems, titles):
    """The commands of each of the other programs that is installed; melt does all titles in one run."""
    commands = {
        "melt": [["melt", "-silent", "-profile", "atsc_1080p_25"]
                 + [word for stem in stems for word in (stem + ".kdenlivetitle", "out=0")]
                 + ["-consumer", f"avformat:{folder}/clip_%d.png", "vcodec=png", "pix_fmt=rgba", "mlt_image_format=rgba",
                    "an=1", "real_time=-1"]],
        "rsvg-convert": [["rsvg-convert", stem + ".svg", "-o", stem + "_svg.png"] for stem in stems],
        "convert": [["convert", "-size", f"{WIDTH}x{HEIGHT}", "xc:none", "-pointsize", str(title["texts"][0]["runs"][0]["size"]),
                     "-fill", "white", "-stroke", "black", "-strokewidth", "4", "-annotate", "+450+500",
                     title["texts"][0]["text"], stem + "_convert.png"] for stem, title in zip(stems, titles)]}
    found = {}
    for name, lines in commands.items():
        path = next((path for path in ("/usr/bin/" + name, shutil.which(name)) if path and os.path.exists(path)), None)
        if path:
            found[name] = [[path] + line[1:] for line in lines]
        else:
            print(f"{name} is not installed")
    return found


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("--build", default=os.path.join(ROOT, "build"))
    parser.add_argument("--titles", type=int, default=998)
    parser.add_argument("--runs", type=int, default=3)
    arguments = parser.parse_args()
    program = os.path.join(arguments.build, "bin", "titlectl")
    with tempfile.TemporaryDirectory(prefix="titler-") as data:
        # melt draws texts only where it sees the name of a display, but does not connect to it.
        environment = session.program_environment(arguments.build, K2SYS_AC_DATA=data, K2SYS_AC_ROOT="", K2SYS_LOG_DIR=data,
                                                  DISPLAY=":none", QT_QPA_PLATFORM="offscreen")
        subprocess.run([os.path.join(arguments.build, "bin", "titler_provision")], env=environment, check=True,
                       stdout=subprocess.DEVNULL)
        folder = make_titles(program, environment, data, arguments.titles)
        shown = json.loads(subprocess.run([program, "show", "--json", folder], env=environment, check=True,
                                          stdout=subprocess.PIPE).stdout)
        rows = {}
        for number in (1, 2):
            rows[OURS[number]] = median_cost([[program, "render", "--jobs", str(number), folder]], environment, arguments.runs,
                                             arguments.titles, number)
        files = [title["file"] for title in shown]
        first, all_titles = (Cost([program, "render", "--jobs", "1", *files[:count]], environment).memory
                             for count in (FIRST, arguments.titles))
        titles = shown[:PEER_TITLES]
        stems = [write_peers(data, title) for title in titles]
        for name, commands in peer_commands(data, stems, titles).items():
            rows[f"{name}, one file"] = median_cost(commands, environment, arguments.runs, len(titles))
    print(f"{'Milliseconds for each title':32} {'wall':>8} {'processor':>10}")
    for name, (wall, processor) in rows.items():
        print(f"{name:32} {wall:8.1f} {processor:10.1f}")
    print(f"Two processors: {rows[OURS[1]][0] / rows[OURS[2]][0]:.2f} times the titles of one (aim 1.8)")
    print(f"Memory: {first:.0f} MB for {FIRST} titles, {all_titles:.0f} MB for {arguments.titles}: "
          f"{all_titles / first:.2f} (aim 1.3)")
    if "melt, one file" in rows:
        print(f"Processor time for four files, as a part of melt's for one: "
              f"{rows[OURS[1]][1] / rows['melt, one file'][1]:.2f} (aim {AIM})")


if __name__ == "__main__":
    main()

"""Makes title folders that are far longer than an operator can make them."""
import os

from harness import session

TITLE = """<?xml version="1.0" encoding="utf-8" ?>
<manifest type="archive" version="1.0" thumbnail-small="{stem}_240.png" thumbnail-black="{stem}_240S.png" \
thumbnail-big="{stem}_1920.png" thumbnail-mid="{stem}_960.png" clip="0" gain="0" density="100">
    <meta-bg resource="" resource-big="" position-X="0" position-Y="0" position-Z="-1" />
    <meta-text content-count="1">
        <content text="{text}" id="1" position-X="60" position-Y="60" position-Z="1" text-align="-1" text-shadow="0" \
shadow-color="#123123" shadow-direction-x="0" shadow-direction-y="0" shadow-blur-radius="18" item-count="{count}">
{items}
        </content>
    </meta-text>
</manifest>
"""
ITEM = """            <text-item text="{text}" font="KST" size="96" color="#FFFFFF" bold="1" text-kerning="100" \
text-italic="0" text-edge="0" default-font="KST" edge-width="3" edge-color="#000000" />"""
PICTURE_SIZE = (240, 135)
PICTURE_COLOUR = (30, 140, 60)


def stem_of(number):
    return f"20260101090{number:06}"


def write_title(folder, stem, text):
    items = "\n".join(ITEM.format(text=character) for character in text)
    with open(os.path.join(folder, stem + ".xml"), "w", encoding="utf-8") as stream:
        stream.write(TITLE.format(stem=stem, text=text, count=len(text), items=items))


def write_order(folder, stems):
    rows = "\n".join(f'    <index value="{number}" file-path="{stem}.xml" />' for number, stem in enumerate(stems))
    with open(os.path.join(folder, ".order.xml"), "w", encoding="utf-8") as stream:
        stream.write(f'<?xml version="1.0" encoding="utf-8" ?>\n<manifest type="order" index-count="{len(stems)}">\n'
                     f"{rows}\n</manifest>\n")


def make(folder, count):
    """A folder of count titles, each with its number as text and a plain small picture; returns their stems."""
    os.makedirs(folder)
    stems = [stem_of(number) for number in range(count)]
    width, height = PICTURE_SIZE
    picture = os.path.join(folder, "picture.png")
    session.write_png(picture, width, height, bytes(PICTURE_COLOUR) * (width * height))
    for number, stem in enumerate(stems):
        write_title(folder, stem, f"Title {number}")
        os.link(picture, os.path.join(folder, stem + "_240.png"))
    os.remove(picture)
    write_order(folder, stems)
    return stems

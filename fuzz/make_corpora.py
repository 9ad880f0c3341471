#!/usr/bin/env python3
"""Writes the seed corpora of the fuzz targets: make_corpora.py FOLDER

Each target gets a folder of small files that reach its code: whole ones, and ones that are cut, doubled, deep or wrong
in a way of their own. The same files come out each time.
"""
import base64
import io
import os
import struct
import sys
import zipfile
import zlib

HEAD = '<?xml version="1.0" encoding="UTF-8" ?>\n'
SCRIPTS = ["Breaking", "快讯", "속보", "速報", "Élections e\u0301", "😀", "a&amp;b &lt;c&gt; &quot;d&apos;", "a&#10;b"]


def text_item(text="a", size=40, family="KST", extra=""):
    return (f'<text-item text="{text}" font="{family}" size="{size}" color="#ffffff" bold="0" text-kerning="0" '
            f'text-italic="0" text-edge="1" default-font="" edge-width="2" edge-color="#000000"{extra}/>')


def content(number=1, text="ab", items=None, align=1, shadow=1):
    items = [text_item(sign) for sign in text] if items is None else items
    return (f'<content text="{text}" id="{number}" position-X="100.5" position-Y="-20" position-Z="{number}" '
            f'text-align="{align}" text-shadow="{shadow}" shadow-color="#000000" shadow-direction-x="3" '
            f'shadow-direction-y="3" shadow-blur-radius="2" item-count="{len(items)}">{"".join(items)}</content>')


def title(contents, background="", extra=""):
    return (f'{HEAD}<manifest type="archive" version="1.0" thumbnail-small="a_240.png" thumbnail-black="a_240S.png" '
            f'thumbnail-big="a_1920.png" thumbnail-mid="a_960.png" clip="0" gain="0" density="0"{extra}>'
            f'<meta-bg resource="{background}" resource-big="{background}" position-X="0" position-Y="0" position-Z="0"/>'
            f'<meta-text content-count="{len(contents)}">{"".join(contents)}</meta-text></manifest>\n')


def titles():
    yield title([])
    yield title([content()])
    yield title([content(number, script) for number, script in enumerate(SCRIPTS[:4], 1)])
    for script in SCRIPTS:
        yield title([content(1, script, [text_item(script)])])
    yield title([content(number) for number in range(1, 8)])
    yield title([content(1), content(1)], "../../etc/passwd")
    yield title([content(1, "", [])], "a_source_1280.png")
    yield title([content(-1, "x" * 500)])
    yield title([content()], extra=' type="again"')
    yield title([content()])[:-40]
    yield title([content()]).replace("UTF-8", "UTF-16")
    yield "\ufeff" + title([content()]).replace("\n", "\r\n")
    yield HEAD + "<manifest>" * 70 + "</manifest>" * 70
    yield "<manifest/>"
    yield ""


def order(names):
    rows = "".join(f'<index value="{number}" file-path="{name}"/>' for number, name in enumerate(names))
    return f'{HEAD}<manifest type="order" index-count="{len(names)}">{rows}</manifest>\n'


def orders():
    yield order(["a.xml", "b.xml", "c.xml"])
    yield order([])
    yield order(["a.xml"] * 20)
    yield order(["../../a.xml", "/etc/passwd", ".", "", "x", "é.xml", "速報.xml"])
    yield order([f"UserTemplate_{number:03}/Titler.xml" for number in (1, 2, 4, 999, 1000)])
    yield order(["a.xml"]).replace('value="0"', 'value="none"')
    yield order(["a.xml", "b.xml"])[:-30]
    yield order(["a.xml"]).replace("index ", "row ")
    yield ""


def settings():
    for size, family in ((40, "KST"), (0, ""), (-1, "快讯"), (2147483648, "a&amp;b")):
        yield (f'{HEAD}<manifest type="setting"><font-style family="{family}" size="{size}" color="#ff0000" bold="1" '
               f'italic="0" kerning="-1" align="1" shadow="1" shadow-color="#000000" shadow-direction-x="1.5" '
               f'shadow-direction-y="1" shadow-blur-radius="2" edge="1" edge-width="1e9" edge-color=""/></manifest>')
    yield (f'{HEAD}<manifest type="last-setting"><last-archive path="/titles/a/b.xml"/><last-folder path="/titles/a"/>'
           f'</manifest>')
    yield f"{HEAD}<manifest><font-style/></manifest>"
    yield f"{HEAD}<manifest><!-- nothing --></manifest>"
    yield "<font-style/>"


def paths():
    names = ("TitleResource", "SystemSetting", "TitlerTemplate", "Template", "Font", "Title", "Tmp", "Data", "Resource")
    yield HEAD + "<PathInfo>" + "".join(f'<{name} path="{name.lower()}"/>' for name in names) + "</PathInfo>"
    yield HEAD + "<PathInfo>" + "".join(f'<{name} path="/etc/./{name}/快"/>' for name in names) + "</PathInfo>"
    yield HEAD + "<PathInfo>" + "".join(f"<{name}/>" for name in names) + "</PathInfo>"
    yield HEAD + "<PathInfo>" + "".join(f'<{name} path="{"x/" * 3000}"/>' for name in names[:2]) + "</PathInfo>"
    yield HEAD + "<PathInfo><TitleResource path=''><SystemSetting path='a'/></TitleResource></PathInfo>"
    yield "<PathInfo>"


def piece(number, data):
    return struct.pack("<BH", number, len(data)) + data


def templates():
    whole = title([content()], "Titler_source_1280.png").encode()
    rows = order(["UserTemplate_001/Titler.xml", "UserTemplate_002/Titler.xml"]).encode()
    presets = order(["a.xml", "b.xml"]).encode()
    yield piece(0, rows) + piece(1, whole) + piece(2, whole) + piece(4, presets) + piece(5, whole) + piece(6, whole)
    yield piece(0, rows) + piece(1, b"") + piece(2, whole[:300])
    yield piece(1, whole) + piece(2, whole) + piece(3, rows)
    yield piece(0, order(["..", "UserTemplate_001", "x/y/z.xml"]).encode()) + piece(1, whole)
    yield piece(4, order(["x", "a.xml"]).encode()) + piece(5, whole)
    yield piece(7, HEAD.encode() + b'<manifest><last-template path="a.xml"/></manifest>') + piece(5, whole)


def pack_int(value):
    if value >= 0:
        for limit, tag, form in ((0x80, b"", "B"), (0x100, b"\xcc", "B"), (0x10000, b"\xcd", ">H"), (1 << 32, b"\xce", ">I")):
            if value < limit:
                return tag + struct.pack(form, value)
    return b"\xd2" + struct.pack(">i", value) if value < -32 else struct.pack("b", value)


def pack_wide(text):
    data = text.encode() + b"\0"
    return (bytes([0xA0 | len(data)]) if len(data) < 32 else b"\xda" + struct.pack(">H", len(data))) + data


PAYLOADS = [b"", b"\0\0\0\0", pack_int(5), pack_int(-70000), b"\xc3", b"\xd2\0\0\0\x09\xd2\0\0\x03\xe9",
            pack_wide("快讯"), pack_int(4) + pack_wide("/titles/news"), pack_int(3) + pack_int(2) + pack_int(117),
            pack_int(1) + pack_int(2) + b"\xc3" + pack_int(3), b"\xdb\xff\xff\xff\xff", b"\xda\xff\xffabc", b"\xbfabc",
            b"\xcb" + struct.pack(">d", 1.5), b"\xcf" + b"\xff" * 8, b"".join(map(pack_int, range(20))),
            pack_int(6) + pack_int(65) + pack_int(0) + pack_wide("A") + b"\xc2" + pack_int(65),
            pack_int(1) + pack_wide("a" * 300) * 4]


def records():
    for number in range(24):
        for payload in PAYLOADS:
            yield bytes([number]) + payload


def call(object_number, method, flags, payload, receiver=0):
    return struct.pack("<BBBBH", receiver, object_number, method, flags, len(payload)) + payload


def frames():
    for object_number in range(14):
        yield b"".join(call(object_number, method, 3, payload) for method in range(1, 7) for payload in PAYLOADS[1:3])
    for method in range(1, 6):
        yield b"".join(call(0, method, 2, payload) for payload in PAYLOADS)
    yield call(0, 5, 2, PAYLOADS[5]) + call(0, 5, 2, PAYLOADS[5]) + call(0, 1, 2, pack_int(7))
    yield call(0, 5, 0, struct.pack("<i", 9)) + call(0, 5, 0, b"a")
    yield call(0, 1, 2 | 4, b"abc") + call(0, 1, 2 | 4 | 16, b"abc") + call(0, 1, 2 | 8, b"abc")
    yield call(20, 1, 3, b"abc", receiver=7)


def sockets():
    def header(receiver, target, method, callback, size):
        return struct.pack("<qqqqB7xqB7x", receiver, target, method, 0, callback, size, 1)

    for payload in PAYLOADS:
        yield piece(1, header(4, 117, 2, 0, len(payload)) + payload)
    yield piece(1, header(4, 117, 1, 0, 1) + b"\x07") * 5
    yield piece(0, header(4, 117, 1, 0, 1)[:20]) + piece(1, header(4, 117, 1, 0, 1)[20:] + b"\x07")
    yield piece(0, header(4, 117, 1, 0, 1) + b"\x07")
    for size in (0, -1, 20424, 20425, 1 << 62, -(1 << 63)):
        yield piece(1, header(4, 117, 2, 0, size) + b"abc")
    for receiver, target, callback in ((5, 117, 0), (4, 118, 0), (4, 3, 1), (-1, -1, 255)):
        yield piece(1, header(receiver, target, 1, callback, 4) + b"\0\0\0\0")


def png(width, height, depth=8, colour=2, rows=None, before=b"", interlace=0):
    def chunk(kind, body):
        return struct.pack(">I", len(body)) + kind + body + struct.pack(">I", zlib.crc32(kind + body))

    channels = {0: 1, 2: 3, 3: 1, 4: 2, 6: 4}[colour]
    line = b"\0" + b"\x55" * ((width * channels * depth + 7) // 8)
    rows = line * height if rows is None else rows
    return (b"\x89PNG\r\n\x1a\n" + chunk(b"IHDR", struct.pack(">IIBBBBB", width, height, depth, colour, 0, 0, interlace)) +
            before + chunk(b"IDAT", zlib.compress(rows, 9)) + chunk(b"IEND", b""))


def bmp(width, height, bits=24):
    data = b"\x33" * (abs(height) * ((abs(width) * bits + 31) // 32 * 4)) if abs(width * height) < 100000 else b"\x33" * 64
    return (b"BM" + struct.pack("<IHHI", 54 + len(data), 0, 0, 54) +
            struct.pack("<IiiHHIIiiII", 40, width, height, 1, bits, 0, len(data), 0, 0, 0, 0) + data)


# 8 x 8 pixels, grey.
JPEG = base64.b64decode(
    "/9j/4AAQSkZJRgABAQEASABIAAD/2wBDAP//////////////////////////////////////////////////////////////////////////////////////"
    "wAALCAAIAAgBAREA/8QAFAABAAAAAAAAAAAAAAAAAAAAA//EABQQAQAAAAAAAAAAAAAAAAAAAAD/2gAIAQEAAD8AN//Z")
GIF = b"GIF89a\x02\0\x02\0\x80\0\0\xff\xff\xff\0\0\0,\0\0\0\0\x02\0\x02\0\0\x02\x02\x84\x51\0;"


def pictures():
    png_name, bmp_name, jpg_name, gif_name, jpe_name, tif_name, xpm_name, svg_name = (bytes([n]) for n in range(8))
    for colour, depth in ((0, 1), (0, 16), (2, 8), (2, 16), (3, 8), (4, 8), (6, 8), (6, 16)):
        yield png_name + png(16, 12, depth, colour)
    yield png_name + png(960, 540, 8, 0)
    yield png_name + png(64, 64, 8, 6, interlace=1)
    yield png_name + png(16, 12)[:-20]
    yield png_name + png(20000, 20000, 8, 2, b"\0" * 100)
    yield png_name + png(8192, 8193, 8, 0, b"\0" * 100)
    yield png_name + png(1, 1 << 30, 16, 6, b"\0" * 100)
    yield png_name + png(16, 12, before=struct.pack(">I", 0x7fffffff) + b"zTXt" + b"\0" * 20)
    for width, height, bits in ((16, 12, 24), (16, -12, 32), (20000, 20000, 1), (-5, 3, 24), (3, 3, 16)):
        yield bmp_name + bmp(width, height, bits)
    yield jpg_name + JPEG
    yield jpg_name + JPEG[:-10]
    yield jpg_name + JPEG.replace(b"\0\x08\0\x08", b"\xff\xff\xff\xff", 1)
    yield jpe_name + JPEG
    yield gif_name + GIF
    yield gif_name + GIF.replace(b"a\x02\0\x02\0", b"a\xff\xff\xff\xff", 1)
    yield tif_name + b"II*\0\x08\0\0\0\x02\0\0\x01\x04\0\x01\0\0\0\xff\xff\0\0\x01\x01\x04\0\x01\0\0\0\xff\xff\0\0\0\0\0\0"
    yield xpm_name + b'/* XPM */\nstatic char*x[]={"2 2 2 1","a c #ff0000","b c None","ab","ba"};'
    yield svg_name + b'<svg xmlns="http://www.w3.org/2000/svg" width="20000" height="20000"/>'
    yield bmp_name + b"P5 20000 20000 255 "
    yield png_name + GIF


def csvs():
    yield "Name,Role\n" + "".join(f'"{script}",x\r\n' for script in SCRIPTS)
    yield "\ufeffName;Role\r\n\"a\"\"b\r\nc\";d\r\n\"not closed;x\r\ne;f\r\n"
    yield "a\tb\n1\t2\t3\n\"x\"y\t2\n\n1\t2"
    yield "\ufeffName\tRole\n快讯\t😀\n".encode("utf-16-le")
    yield "a,A\n1,2\n"
    yield b"a,b\nM\xfcller,x\ny,\xc3"
    yield "a" + ",b" * 300
    yield "a\n" + "x" * 60000
    yield ""


def json_lists():
    yield '[{"Name": "Anna", "Role": "a\\nb"}, {"name": null, "Number": 12, "Share": 1e-7, "On": true}]'
    yield '\ufeff[\n {"Name": "}]{[,\\\\"},\n 5, "x", [1], {"a": {}}, {"a": 1, "A": 2}, {"": 1}, {}\n]\n'
    yield '[{"a": "\\ud83d"}, {"a": "\\ud83d\\ude00"}, {"a": "x},\n{"a": "y"}]'
    yield "[" * 3000
    yield '[{"a": 1}] x'
    yield "[]"
    yield "{}"


SHEET = ('<worksheet><sheetData><row r="1"><c r="A1" t="s"><v>0</v></c><c r="B1" t="inlineStr"><is><t>b</t></is></c></row>'
         '<row r="3"><c r="A3"><v>1.1000000000000001</v></c><c t="b"><v>1</v></c></row>'
         '<row><c t="e"><v>#N/A</v></c></row><row><c t="str"><f>A1</f><v>x</v></c></row></sheetData></worksheet>')
STRINGS = '<sst><si><t>Name</t></si><si><r><t>a</t></r><rPh><t>b</t></rPh><r><t>_x000D_</t></r></si></sst>'


def workbooks():
    yield f"{STRINGS}\n{SHEET}"
    yield f"{STRINGS}\n<!DOCTYPE a [<!ENTITY b 'c'>]>{SHEET}"
    yield f"<sst>{'<si/>' * 100}</sst>\n{SHEET.replace('<v>0</v>', '<v>99</v>')}"
    yield f"{STRINGS}\n{SHEET.replace('B1', 'ZZ1')}"
    yield f"{STRINGS}\n" + "<a>" * 100
    yield f"{STRINGS}\n<a " + "".join(f'a{number}="" ' for number in range(500)) + "/>"
    whole = zip_file({"_rels/.rels": '<a><Relationship Id="a" Type="x/officeDocument" Target="/b.xml"/></a>',
                      "b.xml": '<b xmlns:r="r"><sheet r:id="a"/></b>',
                      "_rels/b.xml.rels": '<a><Relationship Id="a" Type="x/worksheet" Target="s.xml"/></a>', "s.xml": SHEET})
    yield whole
    yield whole[:-10]
    yield b"PK\5\6" + b"\0" * 18


def zip_file(parts):
    result = io.BytesIO()
    with zipfile.ZipFile(result, "w", zipfile.ZIP_DEFLATED) as stream:
        for name, text in parts.items():
            stream.writestr(zipfile.ZipInfo(name), text, zipfile.ZIP_DEFLATED)
    return result.getvalue()


def fields():
    yield ('{"fields": {"1": {"name": "Name", "fit": {"width": 600, "smallest": 24}}, "2": {"name": "快讯"}}, '
           '"picture": "Photo"}')
    yield '{"fields": {"3": {"fit": {"width": 1280}}}}'
    yield '{"fields": {"5": {"name": "{a}", "fit": 5}}, "more": 1}'
    yield "{}"
    yield "[]"


def encoded():
    white, shade, clear = b"\xff\xff\xff\xff", b"\x30\x20\x10\x80", b"\0\0\0\0"
    above = b"\0\0\0\0\0"  # the rest of the line as in the line above
    for form in range(3):
        yield struct.pack("4B", 0, 0, 0, form) + b"\1" + white
        yield struct.pack("4B", 63, 0, 3, form) + (b"\x14" + clear + b"\x05" + white + above) * 9
        yield struct.pack("4B", 130, 1, 200, form) + (b"\xff" + shade + b"\x02" + white) * 40
        yield struct.pack("4B", 15, 119, 1, form) + (b"\xff" + clear + b"\x01" + shade + above) * 5
        yield struct.pack("4B", 99, 0, 9, form) + bytes(i * i * 7 % 251 for i in range(5000))


TARGETS = {"title": titles, "order": orders, "settings": settings, "paths": paths, "templates": templates,
           "records": records, "frames": frames, "socket": sockets, "pictures": pictures, "encoder": encoded, "csv": csvs,
           "jsonlist": json_lists, "xlsx": workbooks, "fields": fields}
WORDS = ["manifest", "meta-bg", "meta-text", "content", "text-item", "index", "font-style", "last-archive", "PathInfo",
         "file-path", "value=\\\"", "type=\\\"order\\\"", "position-X", "text-align", "item-count", "size=\\\"", "&#x", "&amp;",
         "sheetData", "inlineStr", "sharedStrings", "rPh", "fields", "smallest",
         "<![CDATA[", "<!--", "-->", "<?xml", "encoding=\\\"UTF-8\\\"", "IHDR", "IDAT", "PLTE", "tRNS", "iCCP", "zTXt", "IEND"]


def main(folder):
    for target, make in TARGETS.items():
        place = os.path.join(folder, target)
        os.makedirs(place, exist_ok=True)
        for number, seed in enumerate(make()):
            with open(os.path.join(place, f"seed{number:04}"), "wb") as stream:
                stream.write(seed if isinstance(seed, bytes) else seed.encode())
    with open(os.path.join(folder, "words.dict"), "w", encoding="ascii") as stream:
        stream.writelines(f'"{word}"\n' for word in WORDS)


if __name__ == "__main__":
    main(sys.argv[1])

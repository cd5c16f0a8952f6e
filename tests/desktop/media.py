"""Something to play, made on the spot: tracks, a film, a disc with a menu, slides and photos."""
import fcntl
import os
import shutil
import subprocess
import tempfile

# What slides, photos, titles of the disc and its menu are told apart by.
COLOURS = {1: (255, 0, 0), 2: (0, 255, 0), 3: (0, 0, 255)}

# The menu's two buttons go to the disc's two titles. The first title has chapters of 20 s.
SPUMUX = """<subpictures format="PAL"><stream><spu force="yes" start="00:00:00.00"
  highlight="highlight.png" select="highlight.png">
  <button name="one" x0="600" y0="100" x1="700" y1="200" down="two"/>
  <button name="two" x0="600" y0="300" x1="700" y1="400" up="one"/></spu></stream></subpictures>"""
DVDAUTHOR = """<dvdauthor dest="disc"><vmgm><menus><video format="pal"/><pgc entry="title">
  <vob file="buttons.mpg" pause="inf"/>
  <button name="one">jump title 1;</button><button name="two">jump title 2;</button></pgc></menus></vmgm>
  <titleset><menus><video format="pal"/><pgc entry="root"><pre>jump vmgm menu;</pre></pgc></menus>
  <titles><video format="pal"/>
  <pgc><vob file="title1.mpg" chapters="0,0:20,0:40"/><post>call vmgm menu;</post></pgc>
  <pgc><vob file="title2.mpg"/><post>call vmgm menu;</post></pgc></titles></titleset></dvdauthor>"""

ODF = "urn:oasis:names:tc:opendocument:xmlns"
SLIDES = f"""<?xml version="1.0" encoding="UTF-8"?>
<office:document office:version="1.2" office:mimetype="application/vnd.oasis.opendocument.presentation"
  xmlns:office="{ODF}:office:1.0" xmlns:draw="{ODF}:drawing:1.0" xmlns:style="{ODF}:style:1.0">
  <office:automatic-styles>%s</office:automatic-styles>
  <office:body><office:presentation>%s</office:presentation></office:body></office:document>"""
SLIDE_STYLE = """<style:style style:name="s%d" style:family="drawing-page"><style:drawing-page-properties
  draw:fill="solid" draw:fill-color="#%02x%02x%02x"/></style:style>"""
SLIDE = '<draw:page draw:name="%d" draw:style-name="s%d"/>'

PDF = """%%PDF-1.4
1 0 obj <</Type /Catalog /Pages 2 0 R>> endobj
2 0 obj <</Type /Pages /Count 3 /Kids [11 0 R 12 0 R 13 0 R]>> endobj
%strailer <</Root 1 0 R>>
"""
PDF_PAGE = """1%d 0 obj <</Type /Page /Parent 2 0 R /MediaBox [0 0 640 360] /Contents 2%d 0 R>> endobj
2%d 0 obj <</Length %d>> stream\n%s\nendstream endobj
"""


def ffmpeg(*arguments):
    subprocess.run(["ffmpeg", "-nostdin", "-v", "error", *arguments], check=True)


def sound(seconds, hertz=440):
    return ["-f", "lavfi", "-i", f"sine={hertz}:duration={seconds}"]


def picture(seconds, colour, size, rate=10):
    return ["-f", "lavfi", "-i", "color=0x%02x%02x%02x:s=%s:r=%d:d=%d" % (*colour, size, rate, seconds)]


def write(name, text):
    with open(name, "w", encoding="utf-8") as file:
        file.write(text)


def music():
    os.mkdir("music")
    for number in COLOURS:
        ffmpeg(*sound(300, 220 * number), "-metadata", f"title=Track {number}", f"music/{number}.ogg")
    write("music/all.m3u", "".join(f"{number}.ogg\n" for number in COLOURS))


def film():
    ffmpeg(*picture(300, (90, 90, 90), "320x240"), *sound(300), "-c:v", "mpeg4", "-g", "10", "film.mkv")


def disc():
    for name, seconds, number in (("title1", 60, 1), ("title2", 60, 2), ("menu", 2, 3)):
        ffmpeg(*picture(seconds, COLOURS[number], "720x576", 25), *sound(seconds), "-target", "pal-dvd",
               f"{name}.mpg")
    ffmpeg(*picture(1, (255, 255, 255), "720x576"), "-frames:v", "1", "-vf",
           "format=rgba,geq=r=255:g=255:b=255:"
           "a='255*between(X,600,699)*(between(Y,100,199)+between(Y,300,399))'",
           "highlight.png")
    write("spumux.xml", SPUMUX)
    write("dvdauthor.xml", DVDAUTHOR)
    for command in ("spumux spumux.xml < menu.mpg > buttons.mpg", "dvdauthor -x dvdauthor.xml",
                    "genisoimage -quiet -dvd-video -o disc.iso disc"):
        subprocess.run(command, shell=True, check=True, capture_output=True,
                       env={**os.environ, "VIDEO_FORMAT": "PAL"})


def slides():
    styles = "".join(SLIDE_STYLE % (number, *colour) for number, colour in COLOURS.items())
    write("slides.fodp", SLIDES % (styles, "".join(SLIDE % (number, number) for number in COLOURS)))
    pages = ""
    for number, (red, green, blue) in COLOURS.items():
        fill = f"{red / 255} {green / 255} {blue / 255} rg 0 0 640 360 re f"
        pages += PDF_PAGE % (number, number, number, len(fill), fill)
    write("slides.pdf", PDF % pages)


def photos():
    os.mkdir("photos")
    for number, colour in COLOURS.items():
        ffmpeg(*picture(1, colour, "640x360"), "-frames:v", "1", f"photos/{number}.png")


def make(directory):
    """Fills the directory once; of several that want it at the same time one makes it."""
    with open(directory + ".lock", "w", encoding="utf-8") as lock:
        fcntl.flock(lock, fcntl.LOCK_EX)
        if os.path.exists(directory) and os.path.getmtime(directory) > os.path.getmtime(__file__):
            return
        shutil.rmtree(directory, ignore_errors=True)
        with tempfile.TemporaryDirectory(dir=os.path.dirname(directory)) as work:
            os.chdir(work)
            for thing in (music, film, disc, slides, photos):
                thing()
            os.mkdir(directory)
            for name in ("music", "film.mkv", "disc.iso", "slides.fodp", "slides.pdf", "photos"):
                os.rename(name, os.path.join(directory, name))

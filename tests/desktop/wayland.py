"""Compositors that tell of windows, and let keys through to the one in front."""
import os
import tempfile

from desktop import stays, wait
from programs import Mpv, Program

SHOW, RIGHT = "s\x1b[23~", "\x1b[C"


class Terminal(Program):
    """In the place of another program: writes down what is typed into it."""

    def __init__(self, desktop, name, *options, takes="cat"):
        self.typed = tempfile.mktemp(dir=desktop.home)
        super().__init__(desktop, name, "foot", "-a", name, "-T", name, *options, "sh", "-c",
                         f'stty raw -echo; {takes} >"$0"', self.typed)
        wait(lambda: os.path.exists(self.typed), f"{name} takes keys")

    def keys(self):
        with open(self.typed, encoding="utf-8") as typed:
            return typed.read()


def one_in_front_plays(desktop):
    named = "--pause", "--title=${media-title}"
    older = Mpv(desktop, "--force-media-title=older", *named)
    newer = Mpv(desktop, "--force-media-title=newer", *named, bus_name="mpv.instance{pid}")
    wait(lambda: len(desktop.windows()) == 2, "both have windows")
    desktop.start_kvd()
    for title, film, other in (("older", older, newer), ("newer", newer, older), ("older", older, newer)):
        desktop.bring_to_front(title)
        film.follow(("play", {"pause": False}))
        other.become(pause=True)
    desktop.rests()


def show_is_stepped_in_front(desktop):
    """Play starts it, or pauses it where a window covers the screen."""
    photos = Terminal(desktop, "darktable")
    desktop.start_kvd()
    photos.follow(("playpause", {"keys": SHOW}), ("right", {"keys": SHOW + RIGHT}))
    stays(lambda: photos.keys() == SHOW + RIGHT, "the key was released", seconds=1.5)
    photos.end()
    photos = Terminal(desktop, "darktable", "--fullscreen")
    photos.become(full_screen=["darktable"])
    photos.follow(("playpause", {"keys": " "}))


def window_closes_under_a_key(desktop):
    """The release is owed all the same, or whoever comes to the front is typed into for ever."""
    below = Terminal(desktop, "below")
    desktop.start_kvd()
    photos = Terminal(desktop, "darktable", takes="head -c1")
    desktop.press("right")
    wait(lambda: photos.process.poll() is not None, "the key closes the window")
    below.become(front="below")
    stays(lambda: below.keys() == "", "nobody holds a key down")
    desktop.rests()


def compositor_restarts(desktop):
    desktop.start_kvd()
    Terminal(desktop, "darktable").follow(("right", {"keys": RIGHT}))
    desktop.server.kill()
    desktop.server.wait()
    desktop.press("right")
    desktop.rests()
    os.remove(desktop.env["WAYLAND_DISPLAY"])
    desktop.start_windows()
    Terminal(desktop, "darktable").follow(("right", {"keys": RIGHT}))


def full_screen_is_captured(desktop):
    """The arrow then raises the volume; no key can be relied on for it."""
    desktop.start_kvd()
    photos = Terminal(desktop, "darktable")
    desktop.volume(50)
    desktop.press("up")
    stays(lambda: desktop.volume() == 50, "nothing covers the screen")
    photos.end()
    Terminal(desktop, "darktable", "--fullscreen").become(full_screen=["darktable"])
    desktop.press("up")
    wait(lambda: desktop.volume() > 50, "the arrow raises the volume")
    desktop.rests()

"""The extension in GNOME Shell, and what is left without it."""
import shutil

from desktop import stays, wait
from programs import Eog, Evince


def extension_runs_unless_switched_off(desktop):
    desktop.enable("judge@test")
    desktop.restart_windows()
    desktop.start_kvd()
    wait(desktop.extension_runs, "kvd has switched it on")
    desktop.shell("call", "org.gnome.Shell.Extensions", "DisableExtension", "s", desktop.extension)
    desktop.restart_windows()
    desktop.press("right")
    stays(lambda: not desktop.extension_runs(), "what a person has switched off stays off", seconds=2)


def program_in_front_by_accessibility(desktop):
    del desktop.env["NO_AT_BRIDGE"]
    shutil.rmtree(f"{desktop.extensions}/{desktop.extension}")
    desktop.restart_windows()
    photos = Eog(desktop)
    desktop.start_kvd()
    photos.follow(("play", {"full_screen": ["1.png"]}))
    slides = Evince(desktop)
    slides.follow(("play", {"full_screen": ["1.png", "slides.pdf"]}))
    desktop.bring_to_front("1.png")
    photos.follow(("right", {"colour": 2}))
    desktop.rests()

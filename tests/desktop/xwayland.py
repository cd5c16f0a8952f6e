"""An X server beside a compositor: each tells of some windows, and both of others."""
import json

from desktop import Failed, wait
from programs import Evince, Mpv
from shows import SLIDES


def programs_on_either_server(desktop):
    named = "--pause", "--title=${media-title}"
    older = Mpv(desktop, "--vo=x11", "--force-media-title=older", *named)
    newer = Mpv(desktop, "--force-media-title=newer", *named, bus_name="mpv.instance{pid}")
    wait(lambda: len(desktop.windows()) == 2, "both have windows")
    desktop.start_kvd()
    for title, film, other in (("older", older, newer), ("newer", newer, older)):
        desktop.bring_to_front(title)
        film.follow(("play", {"pause": False}))
        other.become(pause=True)
    told = json.loads(desktop.read("./kvd-report", "--json"))
    if [len(each["windows"]) for each in told["programs"]] != [1, 1] or len(told["outputs"]) != 1:
        raise Failed(f"kvd sees something twice: {told}")
    older.process.kill()
    newer.end()
    desktop.env["GDK_BACKEND"] = "x11"
    Evince(desktop).follow(("play", {"colour": 1, "full_screen": ["slides.pdf"]}), *SLIDES)

"""The programs that play roles, each with something to play, and what they tell of themselves."""
import glob
import json
import socket
import time

from desktop import Failed, lasts, wait


class Program:
    """A program whose window comes to the front; started here unless without a command."""

    def __init__(self, desktop, window_class, *command):
        self.desktop, self.window_class, self.pressed = desktop, window_class, "its start"
        if command:
            self.process = desktop.start(*command)
        wait(lambda: desktop.front() == window_class, f"{window_class} comes to the front")

    def get(self, name):
        """What a question of its own, or else one to the desktop, is answered with."""
        return (getattr(self, name, None) or getattr(self.desktop, name))()

    def become(self, **wanted):
        """Waits until everything is as wanted, such as PlaybackStatus="Playing"."""
        seen = {}

        def same():
            seen.update((name, self.get(name)) for name in wanted)
            return seen == wanted
        wait(same, lambda: f"{type(self).__name__} after {self.pressed} with {wanted}; it has {seen}")

    def follow(self, *steps):
        """Presses a button and waits for what becomes of it, step by step."""
        for self.pressed, wanted in steps:
            self.desktop.press(*self.pressed.split())
            self.become(**wanted)

    def end(self):
        self.process.kill()
        self.process.wait()
        wait(lambda: self.desktop.front() != self.window_class, f"{self.window_class} leaves the front")


class Player(Program):
    """A program on the bus, whose properties there begin with a capital."""

    def __init__(self, desktop, window_class, bus_name, *command):
        self.bus_name = f"org.mpris.MediaPlayer2.{bus_name}"
        super().__init__(desktop, window_class, *command)
        wait(lambda: self.get("PlaybackStatus"), f"{bus_name} comes to the bus")

    def ask(self, verb, *words):
        """What busctl says; nothing when the player does not answer."""
        name = self.bus_name.format(pid=self.process.pid)
        told = self.desktop.read("busctl", "--user", "--json=short", "--timeout=2", verb, name,
                                 "/org/mpris/MediaPlayer2", "org.mpris.MediaPlayer2.Player", *words)
        return json.loads(told)["data"] if told else None

    def get(self, name):
        return self.ask("get-property", name) if name[0].isupper() else super().get(name)

    def title(self):
        return (self.get("Metadata") or {}).get("xesam:title", {}).get("data")

    def position(self):
        """Seconds; 0 when it does not tell. Strawberry also tells 0 in the midst of a seek."""
        return (self.get("Position") or 0) / 1e6

    def plays_on(self, beyond):
        """Waits until it goes on at about the normal speed, which must be beyond a position."""
        def at_ease():
            start, began = self.position(), time.monotonic()
            time.sleep(1)
            return 0.3 < (self.position() - start) / (time.monotonic() - began) < 3
        wait(at_ease, "it goes on at the normal speed")
        if (reached := wait(self.position, "it tells its position")) < beyond:
            raise Failed(f"it goes on at {reached} s")

    def under_way(self):
        """Some players lose what they are told while they load, and in the first moments after it."""
        return self.position() > 0.5


class Strawberry(Player):
    def __init__(self, desktop):
        old = desktop.read("strawberry", "--version") < "Strawberry 1.2"
        # Left to buffer, it sometimes stands still and says that it plays.
        desktop.write(".config/strawberry/strawberry.conf", "[Backend]\nbufferduration=0\n")
        tracks = sorted(glob.glob(f"{desktop.media}/music/*.ogg"))
        super().__init__(desktop, "strawberry", "strawberry", "strawberry", *(tracks if old else []))
        if not old:
            self.open(f"{desktop.media}/music/all.m3u")
        self.become(CanGoNext=True, settled=True)

    def open(self, path):
        """Version 1.2 takes no files when it is started. What it is told to open it plays."""
        self.ask("call", "OpenUri", "s", f"file://{path}")
        self.become(CanGoNext=True, under_way=True)
        self.ask("call", "Stop")
        self.become(PlaybackStatus="Stopped")


class Mpv(Player):
    def __init__(self, desktop, *options, bus_name="mpv"):
        self.channel = f"{desktop.runtime}/{bus_name}"
        super().__init__(desktop, "mpv", bus_name, "mpv", f"--vo={desktop.video}",
                         f"--input-ipc-server={self.channel}",
                         *options, f"{desktop.media}/film.mkv")
        wait(lambda: self.get("PlaybackStatus") != "Stopped", "mpv has loaded the film")

    def get(self, name):
        """Properties of mpv's own are those that nobody else has."""
        if name[0].isupper() or hasattr(self, name) or hasattr(self.desktop, name):
            return super().get(name)
        with socket.socket(socket.AF_UNIX) as channel:
            channel.settimeout(20)
            channel.connect(self.channel)
            channel.sendall(json.dumps({"command": ["get_property", name]}).encode() + b"\n")
            answers = (json.loads(line) for line in channel.makefile())
            return next(answer.get("data") for answer in answers if "error" in answer)


class Celluloid(Player):
    def __init__(self, desktop):
        name = "io.github.celluloid_player.Celluloid"
        super().__init__(desktop, name.lower(), name + ".instance-1", "celluloid")
        # Given the film when it is started, it sometimes leaves it paused.
        self.ask("call", "OpenUri", "s", f"file://{desktop.media}/film.mkv")
        self.become(PlaybackStatus="Playing", under_way=True, prompt=True)

    def prompt(self):
        """Whether it answers at once for a while. Its first drawing holds it up for longer than kvd waits."""
        def at_once():
            began = time.monotonic()
            return self.position() and time.monotonic() - began < 0.3
        return lasts(at_once, 2)


class Vlc(Player):
    """Shows blue while the disc's menu does, red in title 1, green in title 2."""

    def __init__(self, desktop):
        super().__init__(desktop, "vlc", "vlc", "vlc", "--no-qt-privacy-ask", "--no-metadata-network-access",
                         "--vout=xcb_x11", "--extraintf=oldrc", f"--rc-unix={desktop.runtime}/vlc",
                         "--rc-fake-tty", f"dvd://{desktop.media}/disc.iso")
        self.become(colour=3)


class Show(Program):
    """Shows the first slide or photo from the start."""

    def __init__(self, desktop, window_class, *command):
        super().__init__(desktop, window_class, *command)
        self.become(colour=1)


class Impress(Show):
    def __init__(self, desktop):
        super().__init__(desktop, "libreoffice-impress", "soffice", "--norestore", "--nologo",
                         "--nofirststartwizard", "--impress", f"{desktop.media}/slides.fodp")

    def become(self, **wanted):
        """While it still draws it loses keys."""
        super().become(**wanted, settled=True)


class Evince(Show):
    def __init__(self, desktop):
        super().__init__(desktop, "evince", "evince", f"{desktop.media}/slides.pdf")


class Eog(Show):
    def __init__(self, desktop):
        # The show goes on by itself only after every scene's end.
        desktop.write(".config/glib-2.0/settings/keyfile", "[org/gnome/eog/fullscreen]\nseconds=600\n")
        super().__init__(desktop, "eog", "eog", f"{desktop.media}/photos/1.png")

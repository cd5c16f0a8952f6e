"""Desktops without any X server: a class a compositor."""
import glob
import json
import subprocess

from desktop import Desktop, nearest, wait


class Wayland(Desktop):
    """What they share. Each tells of windows by its own word, as windows() and focus()."""
    video = "wlshm"
    command = ()

    def start_windows(self):
        self.server = self.start(*self.command)
        self.env["WAYLAND_DISPLAY"] = wait(lambda: glob.glob(f"{self.runtime}/wayland-[0-9]"), "a compositor")[0]

    def windows(self, *state):
        """Application id and title of those with a state, in wlrctl's words."""
        raise NotImplementedError

    def focus(self, title):
        """Asks for a window to be in front."""
        raise NotImplementedError

    def bring_to_front(self, title):
        self.focus(title)
        wait(lambda: [name for _, name in self.windows("state:active")] == [title], f"{title} is in front")

    def front(self):
        """Without the domain that GTK programs have in their names."""
        return "".join(name for name, _ in self.windows("state:active")).rpartition(".")[2].lower()

    def full_screen(self):
        return [title for _, title in self.windows("state:fullscreen")]


class Wlroots(Wayland):
    def __init__(self):
        super().__init__()
        self.env.update(WLR_BACKENDS="headless", WLR_LIBINPUT_NO_DEVICES="1", WLR_RENDERER="pixman")

    def start_windows(self):
        super().start_windows()
        # A person has a keyboard; without one, programs learn of kvd's own too late for its first key.
        self.start("wtype", "-s", "3600000")

    def colour(self, x=500, y=250):
        shot = subprocess.run(("grim", "-t", "ppm", "-g", f"{x},{y} 1x1", "-"), env=self.env, timeout=20,
                              capture_output=True, check=False).stdout
        return nearest(shot[-3:])


class Sway(Wlroots):
    command = ("sway",)

    def __init__(self):
        super().__init__()
        self.write(".config/sway/config", "xwayland disable\n")

    def sway(self, *words):
        sockets = glob.glob(f"{self.runtime}/sway-ipc.*.{self.server.pid}.sock")
        return json.loads(self.read("swaymsg", "-s", "".join(sockets), "-r", *words) or "null")

    def windows(self, *state):
        def below(node):
            has = {"state:active": node["focused"], "state:fullscreen": node.get("fullscreen_mode") == 1}
            own = [[node["app_id"], node["name"]]] if "pid" in node and all(map(has.get, state)) else []
            return sum(map(below, node["nodes"]), own)
        return below(self.sway("-t", "get_tree") or {"focused": False, "nodes": []})

    def focus(self, title):
        self.sway(f'[title="{title}"] focus')


class Labwc(Wlroots):
    command = ("labwc",)

    def windows(self, *state):
        told = self.read("wlrctl", "toplevel", "list", *state)
        return [line.split(": ", 1) for line in told.splitlines()]

    def focus(self, title):
        self.read("wlrctl", "toplevel", "focus", f"title:{title}")


COMPOSITORS = {
    "sway": Sway,
    "labwc": Labwc,
}

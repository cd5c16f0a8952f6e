"""Desktops without any X server: a class a compositor."""
import glob
import json
import os
import re
import shutil
import subprocess

from desktop import Desktop, nearest, wait

ENTRY = os.path.join(os.path.dirname(os.path.realpath(__file__)), "../../packaging/applications/kvd.desktop.in")


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
        # Again and again: a window that has just opened may come to the front after the first time.
        wait(lambda: self.focus(title) or [name for _, name in self.windows("state:active")] == [title],
             f"{title} is in front")

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
            name = node.get("app_id") or node.get("window_properties", {}).get("class")
            own = [[name, node["name"]]] if "pid" in node and all(map(has.get, state)) else []
            return sum(map(below, node["nodes"]), own)
        return below(self.sway("-t", "get_tree") or {"focused": False, "nodes": []})

    def focus(self, title):
        self.sway(f'[title="{title}"] focus')


class SwayWithX(Sway):
    """Starts an X server for programs that want one."""

    def __init__(self):
        super().__init__()
        self.write(".config/sway/config", "xwayland enable\nexec echo $DISPLAY >$XDG_RUNTIME_DIR/display\n")

    def start_windows(self):
        super().start_windows()
        self.env["DISPLAY"] = wait(lambda: self.read("cat", f"{self.runtime}/display"), "an X server's name")


class Labwc(Wlroots):
    command = ("labwc",)

    def windows(self, *state):
        told = self.read("wlrctl", "toplevel", "list", *state)
        return [line.split(": ", 1) for line in told.splitlines()]

    def focus(self, title):
        self.read("wlrctl", "toplevel", "focus", f"title:{title}")


class Gnome(Wayland):
    """An extension of its own lets it look into the shell, plugs in a keyboard, and brings new windows to the front,
    as the shell does for those that a person opens."""
    command = ("gnome-shell", "--headless", "--wayland", "--no-x11", "--virtual-monitor", "1280x720",
               "--wayland-display", "wayland-1")
    judge = """
        const {Clutter} = imports.gi;
        class Judge {
            enable() {
                global.context.unsafe_mode = true;
                const seat = Clutter.get_default_backend().get_default_seat();
                this.keyboard = seat.create_virtual_device(Clutter.InputDeviceType.KEYBOARD_DEVICE);
                this.keyboard.notify_key(0, 42, 1);
                this.keyboard.notify_key(0, 42, 0);
                global.display.connect('window-created', (_, window) => window.get_compositor_private()
                    .connect('first-frame', () => window.activate(global.get_current_time())));
            }
            disable() {}
        }
        """

    def __init__(self):
        super().__init__()
        told = subprocess.run(("gnome-shell", "--version"), capture_output=True, text=True, check=True).stdout
        self.version = told.split()[2].partition(".")[0]
        end = "export default Judge" if int(self.version) > 44 else "function init() { return new Judge(); }"
        self.extensions, self.extension = ".local/share/gnome-shell/extensions", "kvd@tarn.com"
        judge = f"{self.extensions}/judge@test"
        self.write(f"{judge}/extension.js", self.judge + end)
        self.write(f"{judge}/metadata.json", json.dumps(
            {"uuid": "judge@test", "name": "judge", "description": "-", "shell-version": [self.version]}))
        # Programs write settings of their own.
        self.settings = {"XDG_CONFIG_HOME": f"{self.home}/shell"}
        self.enable("judge@test", self.extension)
        self.env.update(LIBGL_ALWAYS_SOFTWARE="1", DBUS_SYSTEM_BUS_ADDRESS=f"unix:path={self.runtime}/system")

    def bring(self, directory, media=None, programs="kv*"):
        shutil.copytree(os.path.join(os.path.dirname(directory), "gnome-shell", self.extension),
                        f"{self.home}/{self.extensions}/{self.extension}")
        super().bring(directory, media, programs)

    def enable(self, *extensions):
        """Those that are on when a shell starts; all others are as new."""
        self.write("shell/glib-2.0/settings/keyfile", f"[org/gnome/shell]\nenabled-extensions={list(extensions)}\n"
                   f"welcome-dialog-last-shown-version='{self.version}.99'\n")

    def extension_runs(self):
        told = self.shell("call", "org.gnome.Shell.Extensions", "GetExtensionInfo", "s", self.extension)
        return bool(told) and json.loads(told)["data"][0].get("state", {}).get("data") == 1

    def set_up(self):
        self.start_bus()
        self.start("dbus-daemon", "--session", "--nofork", "--nopidfile",
                   "--address=" + self.env["DBUS_SYSTEM_BUS_ADDRESS"])
        wait(lambda: os.path.exists(f"{self.runtime}/system"), "a system bus")
        self.start("/usr/bin/python3", "-m", "dbusmock", "--system", "--template", "logind")
        wait(lambda: "login1" in self.read("busctl", "--address=" + self.env["DBUS_SYSTEM_BUS_ADDRESS"], "list"),
             "a login manager")
        self.start_windows()
        self.start_sound()

    def start_windows(self):
        self.server = self.start(*self.command, env={**self.env, **self.settings})
        self.env["WAYLAND_DISPLAY"] = f"{self.runtime}/wayland-1"
        wait(lambda: self.eval("Main.layoutManager._startingUp") is False, "a shell that can be looked into")
        wait(lambda: self.eval("Main.overview.hide(), Main.overview.visible") is False, "no overview")

    def start_kvd(self, **changes):
        super().start_kvd(**self.settings, **changes)

    def restart_windows(self):
        self.server.kill()
        self.server.wait()
        self.start_windows()

    def shell(self, verb, *words):
        return self.read("busctl", "--user", "--json=short", verb, "org.gnome.Shell", "/org/gnome/Shell", *words)

    def eval(self, script):
        """What a script in the shell comes to; nothing where none can be run."""
        told = json.loads(self.shell("call", "org.gnome.Shell", "Eval", "s", script) or "null")
        return json.loads(told["data"][1] or "null") if told and told["data"][0] else None

    def windows(self, *state):
        told = self.eval("global.get_window_actors().map(({meta_window: w}) => [w.get_wm_class(), w.get_title(),"
                         "{'state:active': w.has_focus(), 'state:fullscreen': w.is_fullscreen()}])") or []
        return [[name, title] for name, title, has in told if all(map(has.get, state))]

    def focus(self, title):
        self.eval("global.get_window_actors().map(actor => actor.meta_window)"
                  f".find(w => w.get_title() === '{title}')?.activate(0)")

    def colour(self, x=500, y=250):
        shot = f"{self.home}/shot.png"
        self.read("busctl", "--user", "call", "org.gnome.Shell.Screenshot", "/org/gnome/Shell/Screenshot",
                  "org.gnome.Shell.Screenshot", "ScreenshotArea", "iiiibs", str(x), str(y), "1", "1", "false", shot)
        pixel = subprocess.run(("ffmpeg", "-v", "quiet", "-i", shot, "-f", "rawvideo", "-pix_fmt", "rgb24", "-"),
                               env=self.env, timeout=20, capture_output=True, check=False).stdout
        return nearest(pixel[:3]) if pixel else None


class KWin(Wayland):
    """What it tells to programs that have a desktop entry, kvd asks for; the scenes ask by scripts of their own."""
    command = ("kwin_wayland", "--virtual", "--no-lockscreen", "--width", "1280", "--height", "720",
               "--socket", "wayland-0")
    scripts = 0

    def __init__(self):
        super().__init__()
        self.env["XDG_CONFIG_DIRS"] = os.path.join(self.home, "xdg")
        # Without a menu there are no programs.
        self.write("xdg/menus/applications.menu", "<Menu><Name>All</Name><DefaultAppDirs/><Include><All/></Include></Menu>")
        self.let_in()

    def let_in(self):
        with open(ENTRY, encoding="utf-8") as entry:
            self.write(".local/share/applications/kvd.desktop", entry.read().replace("@KVD_PROGRAM@", f"{self.home}/kvd"))

    def set_up(self):
        self.start_bus()
        self.start_windows()
        self.start_sound()

    def start_windows(self):
        super().start_windows()
        wait(lambda: "org.kde.KWin" in self.names(), "KWin takes scripts")

    def ask(self, script):
        """What a script returns that KWin runs: it writes that to its log."""
        self.scripts += 1
        name = f"script-{self.scripts}"
        self.write(name, f"console.error('{name}', JSON.stringify((() => {{ {script} }})()))")
        for call in (("loadScript", "ss", os.path.join(self.home, name), name), ("start",)):
            self.read("busctl", "--user", "call", "org.kde.KWin", "/Scripting", "org.kde.kwin.Scripting", *call)

        def answer():
            with open(os.path.join(self.home, "log"), encoding="utf-8", errors="replace") as log:
                return re.findall(f"{name} (.*)", log.read())
        return json.loads(wait(answer, "a script's answer")[0])

    def windows(self, *state):
        is_state = {"state:active": "w.active", "state:fullscreen": "w.fullScreen"}
        return self.ask("return workspace.windowList().filter(w => w.normalWindow"
                        + "".join(f" && {is_state[each]}" for each in state)
                        + ").map(w => [w.desktopFileName || w.resourceClass, w.caption])")

    def focus(self, title):
        self.ask(f"workspace.activeWindow = workspace.windowList().find(w => w.caption === '{title}');"
                 "return true")


class StrictKWin(KWin):
    """Lets nobody ask."""
    def let_in(self):
        pass


COMPOSITORS = {
    "gnome": Gnome,
    "sway": Sway,
    "sway-with-x": SwayWithX,
    "labwc": Labwc,
    "kwin": KWin,
    "strict-kwin": StrictKWin,
}

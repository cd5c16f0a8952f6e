"""A desktop of its own in a temporary home: X server, session bus, window manager, sound server, and kvd.

All that it starts, and whatever those start in turn, are descendants of this process and are ended with it.
"""
import ctypes
import glob
import json
import os
import pwd
import re
import shutil
import signal
import struct
import subprocess
import tempfile
import time

from media import COLOURS

PR_SET_PDEATHSIG, PR_SET_CHILD_SUBREAPER = 1, 36
prctl = ctypes.CDLL(None).prctl


class Failed(Exception):
    """Something that a scene expected did not come about."""


def wait(condition, what, seconds=60):
    """Asks until the answer is true, and returns it. The limit is far beyond what a busy machine takes."""
    end = time.monotonic() + seconds
    while not (answer := condition()):
        if time.monotonic() > end:
            raise Failed(f"waited {seconds} s in vain: {what() if callable(what) else what}")
        time.sleep(0.02)
    return answer


def lasts(condition, seconds=0.7):
    """Asks for a while whether every answer is true."""
    end = time.monotonic() + seconds
    while time.monotonic() < end:
        if not condition():
            return False
        time.sleep(0.02)
    return True


def stays(condition, what, seconds=0.7):
    """Asks for a while; every answer must be true."""
    if not lasts(condition, seconds):
        raise Failed(f"no longer so: {what}")


def stat_fields(pid):
    """/proc/PID/stat from the state on; nothing when the process is gone."""
    try:
        with open(f"/proc/{pid}/stat", encoding="utf-8") as stat:
            return stat.read().rpartition(")")[2].split()
    except (FileNotFoundError, ProcessLookupError):
        return []


def ticks(pid):
    """The processor time that a process has used."""
    return sum(map(int, stat_fields(pid)[11:13]))


def idle(pid, seconds):
    """Whether a process lives, uses next to no processor time for so long, and does not queue for it."""
    before = ticks(pid)
    time.sleep(seconds)
    return stat_fields(pid)[:1] == ["S"] and ticks(pid) - before <= 5 * seconds


def die_with_parent():
    prctl(PR_SET_PDEATHSIG, signal.SIGKILL)


def nearest(seen):
    """The number of the media's colour that a pixel has; nothing for any other."""
    near = [number for number, colour in COLOURS.items()
            if all(abs(a - b) < 40 for a, b in zip(colour, seen))]
    return near[0] if near else None


class Desktop:
    video = "x11"

    def __init__(self):
        self.home = tempfile.mkdtemp(prefix="kvd-desktop-")
        self.runtime, self.media = (os.path.join(self.home, name) for name in ("run", "media"))
        self.env = {
            "HOME": self.home, "XDG_RUNTIME_DIR": self.runtime, "PATH": "/usr/bin:/bin", "TMPDIR": self.home,
            "LANG": "C.UTF-8", "DBUS_SESSION_BUS_ADDRESS": f"unix:path={self.runtime}/bus",
            "GSETTINGS_BACKEND": "keyfile", "NO_AT_BRIDGE": "1", "SAL_USE_VCLPLUGIN": "gen",
            # Strawberry would add it while another of its threads reads the environment, and sometimes crash.
            "SOUP_FORCE_HTTP1": "1",
            # Its music goes nowhere: after many seeks a stream to the sound server may stand still for ever.
            "GST_PLUGIN_FEATURE_RANK": "pulsesink:NONE,alsasink:NONE"}
        prctl(PR_SET_CHILD_SUBREAPER, 1)

    def bring(self, directory, media=None, programs="kv*"):
        """Copies what is needed into the home, and becomes another user, who may not reach the originals."""
        os.mkdir(self.runtime, 0o700)
        for program in glob.glob(os.path.join(directory, programs)):
            shutil.copy(program, self.home)
        if media:
            shutil.copytree(media, self.media)
        if os.getuid() == 0:
            self.become(pwd.getpwnam("nobody"))
        os.chdir(self.home)

    def become(self, user):
        """Some players refuse to run as root, and root may not join another user's bus."""
        for directory, _, files in os.walk(self.home):
            for name in ["", *files]:
                os.chown(os.path.join(directory, name), user.pw_uid, user.pw_gid)
        os.setgroups([])
        os.setgid(user.pw_gid)
        os.setuid(user.pw_uid)

    def __enter__(self):
        return self

    def __exit__(self, *_):
        """Killing a process makes its children ours, so nobody escapes; the stopped ones die as well."""
        def children():
            return [pid for pid in map(int, filter(str.isdigit, os.listdir("/proc")))
                    if stat_fields(pid)[1:2] == [str(os.getpid())]]
        while pids := children():
            for pid in pids:
                os.kill(pid, signal.SIGKILL)
                os.waitpid(pid, 0)
        # Qt's shared memory outlives killed programs. Its keys (ftok) come from inodes, which are used again.
        for path in glob.glob(f"{self.home}/qipc_*"):
            key = ord("Q") << 24 | (os.stat(path).st_dev & 0xFF) << 16 | os.stat(path).st_ino & 0xFFFF
            subprocess.call(["ipcrm", "-M" if "sharedmemory" in path else "-S", str(key)])
        shutil.rmtree(self.home, ignore_errors=True)

    def write(self, name, text):
        """A file in the home directory."""
        os.makedirs(os.path.dirname(os.path.join(self.home, name)), exist_ok=True)
        with open(os.path.join(self.home, name), "w", encoding="utf-8") as file:
            file.write(text)
        os.chmod(os.path.join(self.home, name), 0o755)

    def start(self, *command, **options):
        """In a session of its own, which has its own share of the processor: Strawberry has a thread that
        runs, and ends, only when nothing else of its session wants to."""
        with open(os.path.join(self.home, "log"), "ab") as log:
            options = {"env": self.env, "stdin": subprocess.DEVNULL, "stdout": log, "stderr": log, **options}
            return subprocess.Popen(command, preexec_fn=die_with_parent, start_new_session=True, **options)

    def read(self, *command):
        """What a command writes; nothing when it fails or takes too long."""
        try:
            return subprocess.run(command, env=self.env, stdin=subprocess.DEVNULL, capture_output=True,
                                  text=True, check=True, timeout=20).stdout.strip()
        except (subprocess.CalledProcessError, subprocess.TimeoutExpired):
            return ""

    def set_up(self):
        self.start_windows()
        self.start_bus()
        self.start_sound()

    def start_windows(self):
        reading, writing = os.pipe()
        self.x = self.start("Xvfb", "-displayfd", str(writing), "-screen", "0", "1280x720x24",
                            "-nolisten", "tcp", "-noreset", "-fbdir", self.home, pass_fds=[writing])
        os.close(writing)
        with os.fdopen(reading) as display:
            self.env["DISPLAY"] = ":" + display.readline().strip()
        self.start("openbox", "--sm-disable")
        wait(lambda: "window id" in self.property("-root", "_NET_SUPPORTING_WM_CHECK"), "a window manager")

    def start_bus(self):
        self.bus = self.start("dbus-daemon", "--session", "--nofork", "--nopidfile",
                              "--address=" + self.env["DBUS_SESSION_BUS_ADDRESS"])
        wait(self.names, "a session bus")

    def start_sound(self):
        self.sound = self.start("pulseaudio", "-n", "--daemonize=no", "--exit-idle-time=-1",
                                "--use-pid-file=0", "-L", "module-null-sink sink_name=test",
                                "-L", "module-native-protocol-unix auth-anonymous=1")
        wait(lambda: self.read("pactl", "get-default-sink") == "test", "a sound server")

    def start_kvd(self, **changes):
        """Starts the program under test, with some environment variables changed, or absent when None."""
        env = {name: value for name, value in {**self.env, **changes}.items() if value is not None}
        self.kvd = self.start("./kvd", env=env, stderr=None)
        wait(lambda: self.kvd.poll() is not None or self.remote("lock", "off") == 0, "kvd listens")

    def quit_kvd(self):
        self.press("quit")
        wait(lambda: self.kvd.poll() is not None, "kvd ends when told to")
        if self.kvd.returncode != 0:
            raise Failed(f"kvd ended with status {self.kvd.returncode}")

    def remote(self, *arguments):
        return subprocess.call(["./kvremote", *arguments], env=self.env, stderr=subprocess.DEVNULL)

    def press(self, *arguments):
        if (status := self.remote(*arguments)) != 0:
            raise Failed(f"kvremote {' '.join(arguments)} ended with status {status}")

    def rests(self):
        """Makes sure that kvd lives and does not run in circles."""
        wait(lambda: idle(self.kvd.pid, 1), "kvd lives and rests")

    def last_words(self):
        """The windows, and the end of what the programs wrote."""
        with open(os.path.join(self.home, "log"), encoding="utf-8", errors="replace") as log:
            lines = [line for line in log if "system_bus_socket" not in line]
        return self.read("xwininfo", "-root", "-tree") + "\n" + "".join(lines[-40:])

    def names(self):
        """The names that are owned on the session bus."""
        listed = json.loads(self.read("busctl", "--user", "--json=short", "list", "--acquired") or "[]")
        return [entry["name"] for entry in listed]

    def property(self, window, *names):
        return self.read("xprop", *(["-root"] if window == "-root" else ["-id", window]), *names)

    def of_front(self, *names):
        window = self.property("-root", "_NET_ACTIVE_WINDOW").rpartition(" ")[2]
        return self.property(window, *names)

    def front(self):
        """The class of the window in front; nothing when there is none."""
        return "".join(re.findall(r'"([^"]*)"$', self.of_front("WM_CLASS"))).lower()

    def settled(self):
        """Whether the program in front has nothing left to do."""
        pid = self.of_front("_NET_WM_PID").rpartition(" ")[2]
        return pid.isdigit() and idle(pid, 0.3)

    def full_screen(self):
        """The names of the full-screen windows."""
        windows = re.findall("0x[0-9a-f]+", self.property("-root", "_NET_CLIENT_LIST"))
        told = [self.property(window, "WM_NAME", "_NET_WM_STATE") for window in windows]
        return [text.split('"')[1] for text in told if "_NET_WM_STATE_FULLSCREEN" in text]

    def colour(self, x=500, y=250):
        """Which of the media's colours is seen there (next to the middle); nothing for any other."""
        with open(os.path.join(self.home, "Xvfb_screen0"), "rb") as screen:
            header = struct.unpack(">20I", screen.read(80))  # an X window dump: size, line length, colour map
            screen.seek(header[0] + header[19] * 12 + y * header[12] + x * 4)
            return nearest(screen.read(3)[::-1])

    def corner(self):
        return self.colour(5, 5)

    def channels(self, *percent):
        """The volumes of the sound server's channels, in percent; sets them first when given."""
        if percent:
            self.read("pactl", "set-sink-volume", "@DEFAULT_SINK@", *(f"{part}%" for part in percent))
        told = self.read("pactl", "get-sink-volume", "@DEFAULT_SINK@")
        return [int(part) for part in re.findall(r"(\d+)%", told)]

    def volume(self, *percent):
        """That of the loudest channel; -1 without a sound server."""
        return max(self.channels(*percent), default=-1)

    def muted(self):
        return self.read("pactl", "get-sink-mute", "@DEFAULT_SINK@") == "Mute: yes"

#!/usr/bin/env python3
"""service_test.py --bin PROGRAMS: kvd under a real service manager of a user.

Installs the build that PROGRAMS (its directory of built programs) belongs to, enables the socket unit as a person
would, and looks at the sound server for what the buttons did. The service manager gets a mount namespace and a control
group of its own; it takes root to make them (exit status 77: skipped) and ends everything that was started with them.
"""
import os
import pwd
import shutil
import subprocess
import sys
import tempfile
import time

GROUPS = "/sys/fs/cgroup"

# The bus as desktops run it: the service manager joins it, and starts programs for those that ask.
UNITS = {"dbus.socket": "[Socket]\nListenStream=%t/bus\n",
         "dbus.service": "[Service]\nExecStart=dbus-daemon --session --address=systemd: --nofork --nopidfile\n"}
JUKEBOX = ("[Desktop Entry]\nType=Application\nName=Jukebox\nExec=sh -c 'echo \"$0\" >words; exec sleep 1000' ${HOME}100%% %U\n"
           "X-Kvd-Application=com.tarn.Lyrabox\n")


class Failed(Exception):
    """Something expected did not come about."""


def wait(condition, what, seconds=20):
    """Asks until the answer is true."""
    end = time.monotonic() + seconds
    while not condition():
        if time.monotonic() > end:
            raise Failed(f"waited {seconds} s in vain: {what}")
        time.sleep(0.02)


def read(path):
    with open(path, encoding="utf-8") as file:
        return file.read()


def write(path, text):
    with open(path, "w", encoding="utf-8") as file:
        file.write(text)


class Session:
    """A user's session without a screen: service manager, bus and sound server."""

    def __init__(self, build):
        self.user = pwd.getpwnam("nobody")
        self.home = tempfile.mkdtemp(prefix="kvd-service-")
        self.group = os.path.join(GROUPS, os.path.basename(self.home))
        self.runtime = os.path.join(self.home, "run")
        self.programs = os.path.join(self.home, ".local/bin")
        # The leak checker of a sanitized build traces its process, which the service's confinement forbids.
        self.env = {"HOME": self.home, "XDG_RUNTIME_DIR": self.runtime, "PATH": self.programs + ":/usr/bin:/bin",
                    "DBUS_SESSION_BUS_ADDRESS": f"unix:path={self.runtime}/bus", "ASAN_OPTIONS": "detect_leaks=0"}
        subprocess.run(["cmake", "--install", build, "--prefix", os.path.join(self.home, ".local")],
                       check=True, stdout=subprocess.DEVNULL)
        os.mkdir(self.runtime, 0o700)
        for name, text in UNITS.items():
            self.write(f".config/systemd/user/{name}", text)
        self.write(".local/share/applications/jukebox.desktop", JUKEBOX)
        self.write(".config/mimeapps.list", "[Default Applications]\naudio/mpeg=jukebox.desktop\n")
        for directory, _, files in os.walk(self.home):
            for name in ["", *files]:
                os.chown(os.path.join(directory, name), self.user.pw_uid, self.user.pw_gid)

    def write(self, path, text):
        path = os.path.join(self.home, path)
        os.makedirs(os.path.dirname(path), exist_ok=True)
        write(path, text)

    def __enter__(self):
        return self

    def set_up(self):
        # No services that this machine starts in every session; the sign that there is a service manager; the one
        # hierarchy that it keeps its services in.
        for directory in ("/etc/systemd/user", "/run/systemd", "/run/user"):
            os.makedirs(directory, exist_ok=True)
            subprocess.run(["mount", "-t", "tmpfs", "tmpfs", directory], check=True)
        os.mkdir("/run/systemd/system")
        os.mkdir("/run/systemd/seats")
        write("/run/systemd/seats/seat0", f"ACTIVE=1\nACTIVE_UID={self.user.pw_uid}\n")
        os.symlink(self.runtime, f"/run/user/{self.user.pw_uid}")
        subprocess.run(["mount", "-t", "cgroup2", "cgroup2", GROUPS], check=True)
        for name in ["", "user"]:
            os.mkdir(os.path.join(self.group, name))
        for name in ["", "cgroup.procs", "cgroup.subtree_control", "cgroup.threads"]:
            os.chown(os.path.join(self.group, "user", name), self.user.pw_uid, self.user.pw_gid)
        self.start("pulseaudio", "-n", "--daemonize=no", "--exit-idle-time=-1", "--use-pid-file=0",
                   "-L", "module-null-sink", "-L", "module-native-protocol-unix auth-anonymous=1")
        wait(self.volume, "a sound server")
        self.start("/lib/systemd/systemd", "--user", "--unit=basic.target")
        wait(lambda: self.systemctl("is-active", "basic.target") == "active", "a service manager")
        self.systemctl("start", "dbus.socket", "dbus.service")
        wait(lambda: "org.freedesktop.systemd1" in self.run("busctl", "--user", "--acquired"), "it is on the bus")

    def __exit__(self, *_):
        if os.path.exists(self.group):
            write(self.group + "/cgroup.kill", "1")
            wait(lambda: "populated 0" in read(self.group + "/cgroup.events"), "an end of it all")
        for directory, _, _ in os.walk(self.group, topdown=False):
            os.rmdir(directory)
        shutil.rmtree(self.home)

    def options(self):
        """How a program becomes the user's and the session's."""
        return {"env": self.env, "user": self.user.pw_uid, "group": self.user.pw_gid, "extra_groups": [],
                "cwd": self.home, "stdin": subprocess.DEVNULL, "stderr": subprocess.DEVNULL}

    def start(self, *command):
        process = subprocess.Popen(["sh", "-c", 'kill -STOP $$; exec "$@"', "sh", *command], **self.options())
        os.waitpid(process.pid, os.WUNTRACED)
        write(self.group + "/user/cgroup.procs", str(process.pid))
        process.send_signal(18)  # SIGCONT

    def run(self, *command):
        """What a command writes."""
        return subprocess.run(command, stdout=subprocess.PIPE, text=True, check=False, **self.options()).stdout.strip()

    def systemctl(self, *arguments):
        return self.run("systemctl", "--user", *arguments)

    def show(self, unit, name):
        return self.systemctl("show", "--value", "--property", name, unit)

    def volume(self):
        """Of the sound server, in percent."""
        return self.run("pactl", "get-sink-volume", "@DEFAULT_SINK@").partition("/")[2].partition("/")[0].strip()

    def jukeboxes(self):
        return self.systemctl("list-units", "--plain", "--no-legend", "app-kvd-jukebox-*").splitlines()


def play(session):
    session.set_up()
    session.systemctl("enable", "--now", "kvd.socket")
    assert session.show("kvd.socket", "SubState") == "listening"
    assert oct(os.stat(session.runtime + "/com.tarn.kvd").st_mode & 0o777) == "0o600"
    assert session.show("kvd.service", "MainPID") == "0"

    print("the first button starts kvd, which reaches the sound server from its confinement")
    session.run("kvremote", "volume-down")
    wait(lambda: session.volume() == "95%", "the volume went down")
    first = session.show("kvd.service", "MainPID")
    status = read(f"/proc/{first}/status")
    assert "NoNewPrivs:\t1" in status and "Seccomp:\t2" in status, status

    print("a player that it starts is not its child, is started once, and outlives it")
    session.run("kvremote", "play")
    wait(session.jukeboxes, "a music player was started")
    words = os.path.join(session.home, "words")
    wait(lambda: os.path.exists(words) and read(words) == "${HOME}100%\n", "its words are as its entry has them")
    session.run("kvremote", "play")
    session.run("kvremote", "volume-down")
    wait(lambda: session.volume() == "90%", "the second press is over")
    assert read(f"/proc/{first}/task/{first}/children") == ""

    print("root, who has no session, reaches the user at the screen")
    subprocess.run([session.programs + "/kvremote", "volume-up"], env={}, check=True)
    wait(lambda: session.volume() == "95%", "the volume is back")

    print("it ends when told to, and the next button starts it again")
    session.run("kvremote", "quit")
    wait(lambda: session.show("kvd.service", "ActiveState") == "inactive", "kvd ended")
    assert session.show("kvd.service", "Result") == "success"
    assert len(session.jukeboxes()) == 1
    session.run("kvremote", "volume-down")
    wait(lambda: session.volume() == "90%", "the volume went down again")
    assert session.show("kvd.service", "MainPID") not in ("0", first)

    print("a start that fails leaves the message queued")
    session.run("kvremote", "quit")
    wait(lambda: session.show("kvd.service", "ActiveState") == "inactive", "kvd ended again")
    session.systemctl("set-environment", "DBUS_SESSION_BUS_ADDRESS=unix:path=/nowhere")
    session.run("kvremote", "volume-down")
    wait(lambda: session.show("kvd.service", "ExecMainStatus") == "1", "a start failed")
    assert session.volume() == "90%" and session.show("kvd.socket", "ActiveState") == "active"
    session.systemctl("unset-environment", "DBUS_SESSION_BUS_ADDRESS")
    wait(lambda: session.volume() == "85%", "the message was handled after all")

    print("the receiver reaches the bus from its confinement, and ends in peace")
    session.systemctl("enable", "--now", "kvd-receiver.service")
    wait(lambda: "kvd-receiver" in session.run("busctl", "--user", "--unique"), "it is on the bus")
    session.systemctl("stop", "kvd-receiver.service")
    assert session.show("kvd-receiver.service", "Result") == "success"


def main():
    missing = [name for name in ("busctl", "cmake", "dbus-daemon", "pactl", "pulseaudio", "systemctl", "unshare")
               if shutil.which(name) is None]
    if missing or os.geteuid() != 0:
        print("skipped: " + (f"not installed: {', '.join(missing)}" if missing else "it takes root"))
        return 77
    probe = ["unshare", "--mount", "--pid", "--fork", "mount", "-t", "cgroup2", "cgroup2", GROUPS]
    if subprocess.run(probe, stderr=subprocess.DEVNULL, check=False).returncode != 0:
        print("skipped: root may not mount its own control groups here")
        return 77
    if sys.argv[1] == "--bin":
        os.execvp("unshare", ["unshare", "--mount", "--pid", "--fork", "--kill-child", "--mount-proc",
                              sys.executable, __file__, "--inside", *sys.argv[2:]])
    with Session(os.path.dirname(os.path.abspath(sys.argv[2]))) as session:
        try:
            play(session)
        except (AssertionError, Failed):
            print(session.systemctl("status", "--no-pager", "kvd.socket", "kvd.service"))
            raise
    return 0


if __name__ == "__main__":
    sys.exit(main())

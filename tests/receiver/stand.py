"""A receiver between remotes and a service port of the test's, with buses and a login manager where they are asked for.
All that it starts ends with it."""
import glob
import os
import pwd
import re
import socket
import struct
import subprocess
import tempfile

import dbus
import dbus.bus
import dbus.lowlevel
from desktop import Failed, die_with_parent, lasts, wait
from devices import BED

LOGIN, LOGIN_PATH = "org.freedesktop.login1", "/org/freedesktop/login1"
USER, SESSION = f"{LOGIN_PATH}/user/{os.geteuid()}", f"{LOGIN_PATH}/session/c1"
THE_SESSION = dbus.Struct(("c1", dbus.ObjectPath(SESSION)), signature="so")
NONE = dbus.Struct(("", dbus.ObjectPath("/")), signature="so")


class Stand:
    def __init__(self, programs):
        self.programs, self.port, self.started = programs, None, []
        self.run = tempfile.mkdtemp(prefix="kvd-receiver-")
        self.address = {bus: f"unix:path={self.run}/{bus}" for bus in ("SYSTEM", "SESSION")}
        sanitizer = os.environ.get("ASAN_OPTIONS", "") + ":verify_asan_link_order=0"
        # Nobody tells of windows.
        os.environ.pop("WAYLAND_DISPLAY", None)
        os.environ.pop("DISPLAY", None)
        self.env = {**os.environ, "UMOCKDEV_DIR": BED.get_root_dir(), "XDG_RUNTIME_DIR": self.run,
                    "ASAN_OPTIONS": sanitizer,
                    **{f"DBUS_{bus}_BUS_ADDRESS": address for bus, address in self.address.items()}}
        table = re.findall(r"^(\S+) +(0x\w+) +(0x\w+)", self.ask("kvremote", "list").stdout, re.MULTILINE)
        self.buttons = {(int(page, 16), int(usage, 16)): name for name, page, usage in table}

    def __enter__(self):
        return self

    def __exit__(self, *_):
        for process in self.started:
            process.kill()
            process.wait()
        # Not under the preload library, which leads some versions astray here.
        subprocess.call(["/bin/rm", "-rf", self.run, f"{self.run}-screen", BED.get_root_dir()], env={})

    def ask(self, program, *words, prefix=(), **env):
        return subprocess.run([*prefix, f"{self.programs}/{program}", *words], env={**self.env, **env},
                              capture_output=True, text=True, check=False)

    def start(self, *command, **options):
        process = subprocess.Popen(command, preexec_fn=die_with_parent, **{"env": self.env, **options})
        self.started.append(process)
        return process

    def receive(self, *arguments, **env):
        self.seen = 0
        with open(f"{self.run}/log", "w", encoding="utf-8") as log:
            self.receiver = self.start(f"{self.programs}/kvd-receiver", "--monitor", f"--pass-through={self.run}/helper",
                                       *arguments, env={**self.env, **env}, stdout=log)

    def log(self):
        with open(f"{self.run}/log", encoding="utf-8") as log:
            return log.read()

    def shows(self, text):
        """Waits until the receiver shows a text, after those that were waited for before."""
        wait(lambda: text in self.log()[self.seen:], lambda: f"{text} in {self.log()}", 20)
        self.seen = self.log().index(text, self.seen) + len(text)

    def end(self, *messages):
        """Ends the receiver, which says these and no more."""
        self.receiver.terminate()
        if (status := self.receiver.wait()) != 0:
            raise Failed(f"the receiver ended with status {status}")
        self.says(*messages)
        self.port.setblocking(False)
        try:
            raise Failed(f"says {self.message()} at the end")
        except BlockingIOError:
            self.port.settimeout(20)

    def rests(self):
        """While nobody presses the receiver is not woken up."""
        def wake_ups():
            with open(f"/proc/{self.receiver.pid}/status", encoding="ascii") as status:
                return re.findall("voluntary.*", status.read())
        wait(lambda: (before := wake_ups()) and lasts(lambda: True) and wake_ups() == before, "the receiver rests")

    def listen(self):
        """Binds the service port, in the place of one that is there."""
        self.port = socket.socket(socket.AF_UNIX, socket.SOCK_DGRAM)
        self.port.settimeout(20)
        self.port.bind(f"{self.run}/new")
        os.rename(f"{self.run}/new", f"{self.run}/com.tarn.kvd")

    def stop_listening(self):
        os.unlink(f"{self.run}/com.tarn.kvd")
        self.port.close()

    def message(self):
        data = self.port.recv(100)
        kind = struct.unpack_from("i", data, 20)[0]
        if kind == 602:
            return "locked" if data[32] else "unlocked"
        page, usage, extra, value = struct.unpack("HxxHxxHxxi", data[32:])
        if kind != 601 or extra != 0 or value not in (0, 1):
            raise Failed(f"an odd message: {data.hex()}")
        return f"{self.buttons[page, usage]} {('up', 'down')[value]}"

    def says(self, *messages):
        """The next messages are these."""
        for expected in messages:
            try:
                told = self.message()
            except TimeoutError:
                told = "nothing"
            if told != expected:
                raise Failed(f"says {told}, not {expected}\n{self.log()}")

    def start_compositor(self):
        """Sway, which refuses to run as root; the path of its socket."""
        where = f"{self.run}-screen"
        os.mkdir(where, 0o700)
        user = pwd.getpwnam("nobody")
        self.as_user = ["setpriv", f"--reuid={user.pw_uid}", f"--regid={user.pw_gid}", "--clear-groups"] * (not os.geteuid())
        if self.as_user:
            os.chown(where, user.pw_uid, user.pw_gid)
        self.screen = {"PATH": "/usr/bin:/bin", "XDG_RUNTIME_DIR": where, "WLR_BACKENDS": "headless",
                       "WLR_LIBINPUT_NO_DEVICES": "1", "WLR_RENDERER": "pixman", "LANG": "C.UTF-8"}
        self.start(*self.as_user, "sway", "-c", "/dev/null", env=self.screen, stderr=subprocess.DEVNULL)
        self.screen["WAYLAND_DISPLAY"] = wait(lambda: glob.glob(f"{where}/wayland-[0-9]"), "a compositor")[0]
        return self.screen["WAYLAND_DISPLAY"]

    def show(self, name):
        """A window in front, by its application id."""
        return self.start(*self.as_user, "foot", "-a", name, "sleep", "3600", env=self.screen, stderr=subprocess.DEVNULL)

    def join(self, name):
        try:
            return dbus.bus.BusConnection(self.address[name])
        except dbus.DBusException:
            return None

    def start_bus(self, name):
        self.start("dbus-daemon", "--session", "--nofork", "--nopidfile", f"--address={self.address[name]}",
                   stderr=subprocess.DEVNULL)
        return wait(lambda: self.join(name), f"a {name} bus")

    def mock(self, bus, name, *arguments):
        """Whoever answers under that name, a program of its own."""
        process = self.start("/usr/bin/python3", "-m", "dbusmock", *arguments, stdout=subprocess.DEVNULL)
        wait(lambda: bus.name_has_owner(name), name)
        return process

    def log_in(self, property_of_session, value):
        """A login manager with one session on the user's screen."""
        if not (bus := self.join("SYSTEM")):
            bus = self.start_bus("SYSTEM")
        process = self.mock(bus, LOGIN, "--system", "--template", "logind")
        self.logind = lambda path, method, *values, interface="org.freedesktop.DBus.Mock": \
            bus.get_object(LOGIN, path).get_dbus_method(method, interface)(*values)
        # In some versions it fails on the number.
        self.logind(LOGIN_PATH, "AddMethod", f"{LOGIN}.Manager", "GetUser", "u", "o", f"ret = '{USER}'")
        self.logind(LOGIN_PATH, "AddSession", "c1", "seat0", dbus.UInt32(os.geteuid()), "somebody", True)
        self.set(property_of_session, value)
        self.set("Display", THE_SESSION, "User")
        self.logind(LOGIN_PATH, "EmitSignal", f"{LOGIN}.Manager", "UserNew", "uo", [os.geteuid(), USER])
        return process

    def set(self, name, value, whose="Session"):
        """A property of the session or user, of whose change the login manager tells."""
        self.logind(SESSION if whose == "Session" else USER, "Set", f"{LOGIN}.{whose}", name, value,
                    interface=dbus.PROPERTIES_IFACE)

    def signal(self, bus, path, interface, member, *arguments):
        """A signal that the receiver has dealt with: it has answered a ping that came after."""
        message = dbus.lowlevel.SignalMessage(path, interface, member)
        message.append(*arguments)
        bus.send_message(message)
        driver = dbus.BUS_DAEMON_NAME, dbus.BUS_DAEMON_PATH, dbus.BUS_DAEMON_IFACE
        for name in filter(lambda name: name.startswith(":"), bus.list_names()):
            if bus.call_blocking(*driver, "GetConnectionUnixProcessID", "s", (name,)) == self.receiver.pid:
                bus.call_blocking(name, "/", dbus.PEER_IFACE, "Ping", "", ())

#!/usr/bin/python3 -B
"""Plays one scene with the programs of a directory. A function that takes a stand is a scene."""
import os
import shutil
import socket
import struct
import subprocess
import sys

import dbus
from desktop import Failed, stays, wait
from devices import BED, BUS_BLUETOOTH, BUS_CEC, BUS_HOST, CODES, Device, add, add_cec_adapter
from stand import LOGIN, LOGIN_PATH, NONE, SESSION, THE_SESSION, Stand

KEYBOARD = "ESC 1 2 3 4 5 6 7 8 9 0 MINUS EQUAL BACKSPACE TAB Q W E R T Y U I O P LEFTBRACE RIGHTBRACE ENTER LEFTCTRL A S D"
IR, CEC, HEADSET = {"bus": BUS_HOST}, {"bus": BUS_CEC}, {"bus": BUS_BLUETOOTH, "unique": "00:00:5e:00:53:01"}
ALONE = "a remote: it has buttons, and no keyboard, mouse or sound card beside it"

# Parent, name, keys and more of each device; what is said of it; what is pressed, and what that says.
DEVICES = [
    ("rc0", "Infrared", "OK UP", IR, "a remote: an infrared receiver",
     [("OK", 1, 0xC00CD), ("OK", 2), ("OK", 2), ("OK", 0), ("UP", 1), ("UP", 2), ("UP", 0)],
     ["select down", "up down", "up up"]),
    ("rc1", "Television", "FORWARD BACK PREVIOUS VOLUMEUP UP", CEC, "a remote: an HDMI-CEC adapter",
     [("PREVIOUS", 1), ("FORWARD", 1), ("BACK", 1), ("UP", 1), ("VOLUMEUP", 1), ("VOLUMEUP", 0)],
     ["next down", "previous down", "menu-up down", "volume-up down", "volume-up up"]),
    ("misc", "Phone (AVRCP)", "PLAYCD", {}, "a remote: the buttons of a Bluetooth player (AVRCP)",
     [("PLAYCD", 1)], ["play down"]),
    # The kernel's key for the usage; one that somebody has put there; one without a usage.
    ("usb1", "Dongle", "MENU PLAY NEXTSONG", {}, ALONE,
     [("MENU", 1, 0xC0040), ("PLAY", 1, 0xC00B7), ("NEXTSONG", 1)], ["menu down", "play down", "next down"]),
    ("usb2", "Named", "PLAY", {}, "a remote: the command line says so (--device)", [("PLAY", 1)], ["play down"]),
    ("usb2", "Marked", "PLAY", {"ID_REMOTE_CONTROL": "1"}, "a remote: udev says so (ID_REMOTE_CONTROL=1)",
     [("PLAY", 1)], ["play down"]),
    ("usb3", "Volume", "VOLUMEUP", {}, ALONE, [], []),
    ("usb3", "Arrows", "UP", {}, ALONE, [("UP", 1)], ["menu-up down"]),
    ("usb2", "Keyboard", KEYBOARD, {}, "no remote: it is a keyboard", [], []),
    ("usb2", "Beside keyboard", "PLAY", {}, "no remote: its device is a keyboard too", [], []),
    ("usb4", "Mouse", "BACK", {"ID_INPUT_MOUSE": "1"}, "no remote: it is a mouse", [], []),
    ("usb4", "Beside mouse", "PLAY", {}, "no remote: its device is a mouse too", [], []),
    ("usb5", "Beside sound", "PLAY", {}, "no remote: its device is a sound card too", [], []),
    ("misc", "Of no device", "PLAY", {}, "no remote: it belongs to no USB or Bluetooth device", [], []),
    ("misc", "Headset", "PLAY", HEADSET, "no remote: its device is a keyboard too", [], []),
    ("misc", "Headset keyboard", KEYBOARD, HEADSET, "no remote: it is a keyboard", [], []),
]
BESIDE = [row for row in DEVICES if not row[5]]


def remotes(stand):
    """What remotes say, half of them plugged in later; keyboards, mice and what is beside them are left alone."""
    stand.listen()
    add("/devices/usb5/card1", "SUBSYSTEM", "sound")
    ours = [row for row in DEVICES if row[5]]
    plugged = [Device(*row[:3], **row[3]) for row in BESIDE + ours[:3]][len(BESIDE):]
    stand.receive("--device", "Named")
    stand.says("unlocked")
    stand.shows(f'"{ours[2][1]}" is read')
    plugged += [Device(*row[:3], **row[3]) for row in ours[3:]]
    for device, row in zip(plugged, ours):
        wait(lambda: device.grabbed, f"{device.name} is grabbed")
        device.send(*row[5])
        stand.says(*row[6])
    for row in DEVICES:
        if (f'"{row[1]}" is read' in stand.log()) != row[4].startswith("a remote"):
            raise Failed(f"{row[1]} in {stand.log()}")
    stand.end()


def listing(stand):
    """--list gives each device's reason, and what keeps a remote from working."""
    add("/devices/usb5/card1", "SUBSYSTEM", "sound")
    node = {row[1]: Device(*row[:3], **row[3]).node for row in DEVICES}
    expected = [(row[1], 1, row[4]) for row in DEVICES]
    for name, options, told in [("Taken", {"taken": True}, "somebody else has grabbed it"),
                                ("Closed", {}, "no permission: the rule 61-kvd-remotes.rules"),
                                ("Lost", {}, "lost while kvd has it: KEY_5, KEY_MUTE")]:
        node[name] = Device("rc2", name, "PLAY MUTE 5", **IR, **options).node
        expected.append((name, 2, told))
    expected.append(("Beside sound", 2, f"if it is a remote: --device {node['Beside sound']}"))
    os.chmod(BED.get_root_dir() + node["Closed"], 0)
    Device("usb6", "Lid", "A")
    for adapter, addresses in (0, 0), (1, 1):
        add_cec_adapter(adapter, addresses)
    # Root may do anything, but for this.
    drop = ["setpriv", "--bounding-set", "-dac_override,-dac_read_search"] if os.geteuid() == 0 else []
    told = stand.ask("kvd-receiver", "--list", "--device", node["Named"], prefix=drop).stdout
    lines = told.splitlines()
    for name, offset, text in expected:
        if not lines[lines.index(f'{node[name]} "{name}"') + offset].startswith(f"  {text}"):
            raise Failed(f"not told of {name}: {text}\n{told}")
    switch_on = "passes no keys on: cec-ctl --device=/dev/cec0 --playback"
    if "Lid" in told or told.count("cec-ctl") != 1 or switch_on not in told:
        raise Failed(told)
    for words in ["--nonsense"], ["event5"], ["--device"], ["--device="], ["--list", "--monitor"]:
        run = stand.ask("kvd-receiver", *words)
        if run.returncode != 2 or run.stdout or run.stderr.count("\n") != 1:
            raise Failed(f"{words}: {run}")


def holding(stand):
    """A hold ends once, whatever ends it; contacts bounce on USB alone; what comes too late is dropped."""
    stand.log_in("Active", True)
    stand.listen()
    infrared = Device("rc0", "Infrared", "VOLUMEUP", **IR)
    dongle = Device("usb1", "Dongle", "VOLUMEUP", clock=False)
    stand.receive()
    stand.says("unlocked")
    stand.shows('"Dongle" is read')
    for device, times in (infrared, 2), (dongle, 1):
        device.tap("VOLUMEUP", "VOLUMEUP")
        stand.says(*["volume-up down", "volume-up up"] * times)
    infrared.send(("VOLUMEUP", 1), ("VOLUMEUP", 0), age=3)
    stand.shows("dropped, it comes too late")
    # A clock that is not known tells nothing of an age.
    dongle.send(("VOLUMEUP", 1), ("VOLUMEUP", 0), age=3)
    stand.says("volume-up down", "volume-up up")

    def sleep():
        stand.logind(LOGIN_PATH, "EmitSignal", f"{LOGIN}.Manager", "PrepareForSleep", "b", [True])

    def switch_away():
        stand.set("Active", False)
        stand.shows('"Dongle" is no longer read')
        stand.set("Active", True)
        stand.shows('"Dongle" is read')

    for device, end in [(infrared, infrared.lose_events), (infrared, sleep), (dongle, switch_away),
                        (dongle, dongle.unplug), (infrared, infrared.hang_up)]:
        device.send(("VOLUMEUP", 1))
        stand.says("volume-up down")
        end()
        stand.says("volume-up up")
        if device.down:
            # The real release comes too late.
            device.send(("VOLUMEUP", 0))
    last = Device("rc1", "Last", "VOLUMEUP", **IR)
    stand.shows('"Last" is read')
    last.send(("VOLUMEUP", 1))
    stand.says("volume-up down")
    stand.end("volume-up up")


def session(stand):
    """Remotes are read while the user's session is the active one of its seat, or where no logind tells."""
    stand.listen()
    remote = Device("rc0", "Remote", "PLAY", **IR)
    stand.start_bus("SYSTEM")
    stand.receive()
    stand.shows('"Remote" is read')
    login = stand.log_in("Active", False)
    stand.shows('"Remote" is no longer read')
    for name, value, *whose in [("Active", True), ("Display", NONE, "User"), ("Display", THE_SESSION, "User"),
                                ("Seat", NONE)]:
        stand.set(name, value, *whose)
        stand.shows('"Remote" is no longer read' if value == NONE else '"Remote" is read')
    login.kill()
    login.wait()
    stand.log_in("Active", True)
    stand.shows('"Remote" is read')
    remote.tap("PLAY")
    stand.says("unlocked", "play down")
    stand.end()


def lock(stand):
    """The lock is said at the start, at each change, and to a daemon that does not know it."""
    stand.log_in("LockedHint", False)
    bus = stand.start_bus("SESSION")
    gnome = "org.gnome.ScreenSaver"
    stand.mock(bus, gnome, "--session", gnome, "/org/gnome/ScreenSaver", gnome)

    def answer(active):
        bus.get_object(gnome, "/org/gnome/ScreenSaver").AddMethod(
            gnome, "GetActive", "", "b", f"ret = {active}", dbus_interface="org.freedesktop.DBus.Mock")

    answer(True)
    stand.listen()
    remote = Device("rc0", "Remote", "PLAY", **IR)
    stand.receive()
    stand.shows('"Remote" is read')
    # The login manager may answer before the screen saver.
    while stand.message() != "locked":
        pass

    def saver(name, active):
        return lambda: stand.signal(bus, f"/org/{name}/ScreenSaver", f"org.{name}.ScreenSaver", "ActiveChanged", active)

    def posted(name):
        return lambda: stand.signal(bus, "/com/tarn/kvd", "com.tarn.kvd.Notifications", "Posted",
                                    f"com.tarn.kvd.{name}",
                                    "com.tarn.kvd", dbus.Dictionary({}, signature="sv"))

    def emit(member):
        return lambda: stand.logind(SESSION, "EmitSignal", f"{LOGIN}.Session", member, "", [])

    for change, *messages in [
            (saver("gnome", False), "unlocked"), (emit("Lock"), "locked"), (stand.listen, "locked"),
            (posted("started"), "locked"), (emit("Unlock"), "unlocked"),
            (saver("freedesktop", True), "locked"), (saver("gnome", True),), (saver("freedesktop", False),),
            (saver("gnome", False), "unlocked"), (lambda: stand.set("LockedHint", True), "locked"),
            (posted("terminated"),), (lambda: remote.tap("PLAY"), "locked", "play down"),
            (emit("Unlock"), "unlocked"), (posted("terminated"),), (posted("started"),), (emit("Lock"), "locked")]:
        change()
        stand.says(*messages)
    stand.end()
    answer(False)
    stand.receive()
    stand.says("locked")
    stand.end()


def port(stand):
    """Remotes are grabbed while somebody listens; buttons wait for whoever is being started, not for ever."""
    remote = Device("rc0", "Remote", "PLAY STOPCD MUTE 5", **IR)
    stand.receive()
    stand.shows('"Remote" is read')
    remote.tap("PLAY")
    remote.send(("5", 1))
    stand.shows("KEY_PLAY down: Play (0x0C 0xB0): left to the desktop, nobody listens")
    stand.shows("KEY_5 down: left to the desktop")
    stand.listen()
    stand.says("unlocked")
    stays(lambda: not remote.grabbed, "not grabbed while a key is down")
    remote.send(("5", 0))
    wait(lambda: remote.grabbed, "grabbed")
    remote.tap("MUTE", "PLAY")
    stand.shows("KEY_MUTE down: lost")
    stand.shows("sent: Play (0x0C 0xB0) pressed")
    stand.says("play down")
    stand.listen()
    remote.tap("STOPCD")
    stand.says("unlocked", "stop down")
    stand.stop_listening()
    remote.tap("PLAY")
    stand.shows("not sent, nobody listens: Play (0x0C 0xB0) pressed")
    stand.listen()
    stand.says("unlocked", "play down")
    stand.stop_listening()
    wait(lambda: not remote.grabbed, "no longer grabbed")
    remote.tap("PLAY")
    stand.shows("left to the desktop, nobody listens")
    stand.listen()
    stand.says("unlocked")
    wait(lambda: remote.grabbed, "grabbed again")
    stand.rests()
    stand.end()
    stand.receive("--no-grab")
    stand.shows('"Remote" is read')
    remote.tap("MUTE", "PLAY")
    stand.shows("KEY_MUTE down: left to the desktop")
    stand.says("unlocked", "play down")
    if remote.grabbed:
        raise Failed("grabbed in spite of --no-grab")
    stand.end()


def pass_through(stand):
    """A helper gets what kvd has no use for, with its releases, and nothing else."""
    helper = socket.socket(socket.AF_UNIX, socket.SOCK_SEQPACKET)
    helper.settimeout(20)
    helper.bind(f"{stand.run}/helper")
    helper.listen()
    stand.listen()
    remote = Device("rc0", "Remote", "PLAY MUTE 5 A POWER", **IR)
    stand.receive()
    connection, _ = helper.accept()
    connection.send(b"\1")

    def hands_on(*keys):
        for key, value in keys:
            if (got := struct.unpack("HH", connection.recv(100))) != (CODES[f"KEY_{key}"], value):
                raise Failed(f"hands on {got}, not {key} {value}")

    stand.says("unlocked")
    wait(lambda: remote.grabbed, "grabbed")
    remote.send(("MUTE", 1), ("MUTE", 2), ("MUTE", 0), ("PLAY", 1), ("PLAY", 0), ("A", 1), ("A", 0), ("5", 1))
    stand.says("play down")
    hands_on(("MUTE", 1), ("MUTE", 0), ("5", 1))
    # One that served and has ended is called again.
    connection.close()
    remote.tap("POWER")
    connection, _ = helper.accept()
    hands_on(("POWER", 1), ("POWER", 0))
    remote.send(("MUTE", 1))
    remote.unplug()
    hands_on(("MUTE", 1), ("MUTE", 0))
    stand.end()
    if connection.recv(100):
        raise Failed("hands on more")


def own_remote(stand):
    """A program that takes the remote itself has it while it is in front, and where nobody can tell, while it runs."""
    applications = f"{stand.run}/applications"
    os.mkdir(applications)
    with open(f"{applications}/television.desktop", "w", encoding="utf-8") as entry:
        entry.write("[Desktop Entry]\nType=Application\nName=TV\nExec=true\nX-Kvd-Application=own-remote\n")
    stand.listen()
    remote = Device("rc0", "Remote", "PLAY VOLUMEUP", **IR)
    display = stand.start_compositor()
    stand.show("film")
    stand.receive(WAYLAND_DISPLAY=display, XDG_DATA_HOME=stand.run)
    stand.says("unlocked")
    for name, taker in ("kodi", "Kodi"), ("television", "television"):
        wait(lambda: remote.grabbed, "grabbed")
        remote.send(("VOLUMEUP", 1))
        stand.says("volume-up down")
        window = stand.show(name)
        stand.shows(f"{taker} is in front and has the remotes")
        stays(lambda: remote.grabbed, "a hold ends first")
        remote.send(("PLAY", 1), ("PLAY", 0), ("VOLUMEUP", 0))
        stand.says("volume-up up")
        wait(lambda: not remote.grabbed, "let go of")
        remote.tap("PLAY")
        stand.shows(f"left to {taker}")
        listed = stand.ask("kvd-receiver", "--list", WAYLAND_DISPLAY=display, XDG_DATA_HOME=stand.run).stdout
        if f"\n{taker} is in front and has the remotes" not in listed:
            raise Failed(listed)
        window.kill()
        stand.shows("kvd has the remotes again")
    wait(lambda: remote.grabbed, "grabbed")
    remote.tap("PLAY")
    stand.says("play down")
    stand.end()
    shutil.copy(shutil.which("sleep"), f"{stand.run}/kodi.bin")
    runs = stand.start(f"{stand.run}/kodi.bin", "3600")
    stand.receive(WAYLAND_DISPLAY="")
    stand.shows("Kodi is in front")
    runs.kill()
    stand.says("unlocked")
    stand.end()


def stage(stand):
    """The rehearsal desktop plays, scans and changes the volume as it does for kvremote."""
    def journal_of(act):
        process = stand.start(f"{stand.programs}/kvd-stage", stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True)
        process.stdin.write("serve\n")
        process.stdin.close()
        served = next(line for line in process.stdout if "XDG_RUNTIME_DIR=" in line)
        act({"XDG_RUNTIME_DIR": served.strip().partition("=")[2]})
        return process.stdout.read()

    def by_command(where):
        for words in ["lock", "off"], ["play"], ["play"], ["volume-up"], ["forward", "--hold", "10ms"], ["quit"]:
            stand.ask("kvremote", *words, **where)

    def by_remote(where):
        remote = Device("rc0", "Remote", "PLAY FASTFORWARD VOLUMEUP", **IR)
        stand.receive(**where)
        wait(lambda: remote.grabbed, "grabbed")
        remote.tap("PLAY", "PLAY", "VOLUMEUP")
        remote.send(("FASTFORWARD", 1), ("FASTFORWARD", 2), ("FASTFORWARD", 0))
        stand.shows("Fast Forward (0x0C 0xB3) released")
        stand.ask("kvremote", "quit", **where)

    expected, told = journal_of(by_command), journal_of(by_remote)
    if told != expected or "output volume 50 → 55" not in told or "scans forward" not in told:
        raise Failed(f"{told}\nand not\n{expected}")


def main():
    scene, programs = sys.argv[1:]
    with Stand(programs) as stand:
        try:
            globals()[scene](stand)
            return 0
        except Failed as failure:
            print(failure, file=sys.stderr)
            return 1


# At a regular end the test bed would miss its directory.
os._exit(main())

"""Input devices that are not there, for programs under umockdev's preload library: sysfs, udev's announcements, and
nodes that answer as the kernel does."""
import errno
import os
import re
import struct
import time

import gi

gi.require_version("UMockdev", "1.0")
from gi.repository import UMockdev  # noqa: E402

with open("/usr/include/linux/input-event-codes.h", encoding="utf-8") as header:
    CODES = {name: int(number, 0) for name, number in re.findall(r"#define (\w+)\s+(0x\w+|\d+)\b", header.read())}
BUS_USB, BUS_BLUETOOTH, BUS_HOST, BUS_CEC = 0x03, 0x05, 0x19, 0x1E
EVIOCGNAME, EVIOCGKEY, EVIOCGBIT, EVIOCGRAB, EVIOCSCLOCKID = 0x06, 0x18, 0x20, 0x90, 0xA0  # the request's low byte
BED = UMockdev.Testbed.new()
KINDS = {"rc": ["SUBSYSTEM", "rc"], "usb": ["SUBSYSTEM", "usb", "DEVTYPE", "usb_device"], "misc": ["SUBSYSTEM", "misc"]}


def bit_map(bits):
    """As the kernel writes one in sysfs: words in hexadecimal, the highest first."""
    number = sum(1 << bit for bit in set(bits))
    return " ".join(f"{number >> shift & (1 << 64) - 1:x}" for shift in range(704, -1, -64))


def add(path, *properties, node="", **attributes):
    pairs = zip(properties[::2], properties[1::2])
    BED.add_from_string("\n".join([f"P: {path}", *([f"N: {node}"] if node else []),
                                   *(f"E: {name}={value}" for name, value in pairs),
                                   *(f"A: {name}={value}" for name, value in attributes.items()), "\n"]))


def add_cec_adapter(number, addresses):
    """An HDMI-CEC adapter that has so many addresses on its bus."""
    def answer(_, client):
        size = client.get_request() >> 16 & 0x3FFF
        client.get_arg().resolve(0, size).update(7, bytes([addresses]))  # num_log_addrs of cec_log_addrs
        client.complete(0, 0)
        return True
    ioctls = UMockdev.IoctlBase()
    ioctls.connect("handle-ioctl", answer)
    BED.attach_ioctl(f"/dev/cec{number}", ioctls)
    add(f"/devices/cec{number}", "SUBSYSTEM", "cec", "DEVNAME", f"/dev/cec{number}", node=f"cec{number}")


class Device:
    """One that is plugged in. `down` are the keys that are, `grabbed` says whether somebody has grabbed it."""
    parents, count = set(), 0

    def __init__(self, parent, name, keys, bus=BUS_USB, unique="", axes=(), clock=True, taken=False, **properties):
        """`parent` is rc…, usb… or misc, `keys` are KEY_… names without KEY_."""
        Device.count += 1
        self.name, self.keys, self.clock, self.taken = name, [CODES["KEY_" + key] for key in keys.split()], clock, taken
        self.down, self.grabbed, self.gone = set(), False, False
        if parent not in self.parents:
            self.parents.add(parent)
            add(f"/devices/{parent}", *KINDS[parent.rstrip("0123456789")])
        self.node, path = f"/dev/input/event{self.count}", f"/devices/{parent}/input{self.count}"
        self.path = f"{path}/event{self.count}"
        self.ioctls = UMockdev.IoctlBase()
        self.ioctls.connect("client-connected", self.opened)
        self.ioctls.connect("handle-ioctl", self.answer)
        self.ioctls.connect("handle-read", self.fail_to_read)
        # The announcement comes with the device, so that it is to answer before.
        BED.attach_ioctl(self.node, self.ioctls)
        add(path, "SUBSYSTEM", "input", **{"name": name, "uniq": unique, "id/bustype": f"{bus:04x}",
            "capabilities/key": bit_map(self.keys), "capabilities/rel": bit_map(axes)})
        add(self.path, "SUBSYSTEM", "input", "DEVNAME", self.node, "MAJOR", 13, "MINOR", 64 + self.count,
            *sum(properties.items(), ()), node=self.node[5:])
        self.file = BED.get_dev_fd(self.node)

    # These three run in a thread of umockdev's.

    def opened(self, *_):
        self.grabbed = False

    def fail_to_read(self, _, client):
        if self.gone:
            client.complete(-1, errno.ENODEV)
        return self.gone

    def answer(self, _, client):
        request, argument, result, error = client.get_request(), client.get_arg(), 0, 0
        number, size = request & 0xFF, request >> 16 & 0x3FFF
        if number == EVIOCGRAB:
            error = errno.EBUSY if self.taken else 0
            self.grabbed = any(argument.data) and not error
        elif number == EVIOCSCLOCKID:
            error = 0 if self.clock else errno.ENOTTY
        else:
            bits = {EVIOCGKEY: self.down, EVIOCGBIT: [CODES["EV_KEY"], CODES["EV_MSC"]],
                    EVIOCGBIT + CODES["EV_KEY"]: self.keys, EVIOCGBIT + CODES["EV_MSC"]: [CODES["MSC_SCAN"]]}
            data = sum(1 << bit for bit in bits.get(number, ())).to_bytes(size, "little")
            if number == EVIOCGNAME:
                data = self.name.encode().ljust(size, b"\0")
            argument.resolve(0, size).update(0, data)
            result = size if number >= EVIOCGNAME else 0
        client.complete(-1 if error else result, error)
        return True

    def write(self, stamp, *rows):
        os.write(self.file, b"".join(struct.pack("llHHi", *stamp, CODES[row[0]], CODES[row[1]], row[2])
                                     for row in [*rows, ("EV_SYN", "SYN_REPORT", 0)]))

    def send(self, *events, age=0.0):
        """Events (key, value) or (key, value, scan code), a frame each, that are so many seconds old."""
        now = time.clock_gettime(time.CLOCK_BOOTTIME if self.clock else time.CLOCK_REALTIME) - age
        for key, value, *scan in events:
            (self.down.add if value else self.down.discard)(CODES[f"KEY_{key}"])
            self.write((int(now), int(now % 1 * 1e6)), *(("EV_MSC", "MSC_SCAN", number) for number in scan),
                       ("EV_KEY", f"KEY_{key}", value))

    def tap(self, *keys):
        self.send(*((key, value) for key in keys for value in (1, 0)))

    def lose_events(self):
        """The kernel's queue ran over, and what is down has changed unseen."""
        self.down.clear()
        self.write((0, 0), ("EV_SYN", "SYN_DROPPED", 0))

    def unplug(self):
        # As the kernel does: when it tells, whoever looks does not find it any more.
        os.unlink(BED.get_root_dir() + self.node)
        os.unlink(f"{BED.get_root_dir()}/sys/class/input/{os.path.basename(self.path)}")
        BED.uevent("/sys" + self.path, "remove")
        self.down.clear()

    def hang_up(self):
        """Reading it fails from now on, of which udev has not told."""
        self.gone = True
        with open("/dev/null", "rb") as null:
            os.dup2(null.fileno(), self.file)
        self.down.clear()

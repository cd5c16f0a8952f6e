"""The volume: of the desktop, and of a player when the desktop's is at its top."""
from desktop import wait
from programs import Mpv, Strawberry


def volume_goes_by_five_within_its_limits(desktop):
    desktop.start_kvd()
    for button, start, end in (("volume-up", 50, 55), ("volume-down", 50, 45),
                               ("up", 98, 100), ("down", 3, 0)):
        desktop.volume(start)
        desktop.press(button)
        wait(lambda: desktop.volume() == end, f"{button} leads from {start} to {end}")
    desktop.read("pactl", "set-sink-mute", "@DEFAULT_SINK@", "1")
    desktop.press("volume-up")
    wait(lambda: not desktop.muted() and desktop.volume() == 5, "volume up unmutes")
    desktop.volume(140)
    for button in ("volume-up", "volume-down"):
        desktop.press(button)
    wait(lambda: desktop.volume() == 135, "louder leaves alone what is amplified")
    desktop.channels(20, 50)
    for button, ends in (("volume-up", [22, 55]), ("volume-down", [20, 50])):
        desktop.press(button)
        wait(lambda: desktop.channels() == ends, f"{button} keeps the balance")


def full_volume_raises_the_players_own(desktop):
    desktop.start_kvd()
    desktop.volume(100)
    music = Strawberry(desktop)
    music.ask("set-property", "Volume", "d", "0.5")
    music.follow(("volume-up", {"Volume": 0.52, "volume": 100}))
    film = Mpv(desktop, "--volume=50")
    desktop.read("pactl", "set-sink-mute", "@DEFAULT_SINK@", "1")
    film.follow(("volume-up", {"Volume": 0.5625, "volume": 100, "muted": False}),
                ("volume-down", {"volume": 95}))
    film.become(Volume=0.5625)
    music.become(Volume=0.52)

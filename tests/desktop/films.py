"""Films and discs."""
from desktop import wait
from programs import Celluloid, Mpv, Vlc

ON, OFF = {"pause": False, "speed": 1.0}, {"pause": True, "speed": 1.0}


def scan_ends_in_the_state_before(desktop):
    film = Mpv(desktop, "--start=60")
    desktop.start_kvd()
    fast = {"pause": False, "speed": 2.0}
    film.follow(("forward --press", fast), ("forward --release", ON), ("pause", OFF),
                ("forward --press", fast), ("forward --release", OFF), ("play", ON))
    desktop.press("rewind", "--press")
    wait(lambda: 0 < film.position() < 56, "the film goes back")
    film.follow(("rewind --release", ON))
    film.plays_on(beyond=30)


def scan_rates_climb(desktop):
    film = Celluloid(desktop)
    desktop.start_kvd()
    film.follow(*(("forward", {"Rate": rate}) for rate in (2.0, 4.0, 8.0, 2.0)))
    film.follow(("rewind", {"Rate": 1.0}), ("forward", {"Rate": 2.0}),
                ("playpause", {"Rate": 1.0, "PlaybackStatus": "Playing"}),
                ("pause", {"PlaybackStatus": "Paused"}), ("play", {"PlaybackStatus": "Playing"}))


def disc_menu(desktop):
    """The lower button of the menu leads to the second title, the upper one to the first."""
    disc = Vlc(desktop)
    desktop.start_kvd()
    disc.follow(("down", {}), ("select", {"colour": 2}), ("app-menu", {"colour": 3}), ("up", {}),
                ("select", {"colour": 1}), ("playpause", {"PlaybackStatus": "Paused"}),
                ("playpause", {"PlaybackStatus": "Playing"}), ("next", {}))
    wait(lambda: disc.position() >= 19, "the second chapter plays")
    volume = desktop.volume(50)
    disc.follow(("up", {"volume": volume + 5}), ("stop", {"PlaybackStatus": "Paused"}))

"""Players that die or hang, and servers that go and come back."""
import os
import signal

from desktop import wait
from music import PAUSED, PLAYING
from programs import Mpv, Strawberry


def player_dies_in_mid_scan(desktop):
    music = Strawberry(desktop)
    film = Mpv(desktop, "--start=60")
    desktop.start_kvd()
    desktop.press("rewind", "--press")
    wait(lambda: 0 < film.position() < 58, "the film goes back")
    film.end()
    desktop.press("rewind", "--release")
    desktop.rests()
    music.follow(("play", PLAYING), ("play", PAUSED))


def player_hangs(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("play", PLAYING))
    film = Mpv(desktop, "--pause")
    os.kill(music.process.pid, signal.SIGSTOP)
    film.follow(("play", {"pause": False}), ("play", {"pause": True}))
    os.kill(film.process.pid, signal.SIGSTOP)
    desktop.volume(50)
    desktop.press("play")
    film.follow(("volume-up", {"volume": 55}))
    for player in (music, film):
        os.kill(player.process.pid, signal.SIGCONT)
    music.become(**PAUSED)
    film.end()
    music.follow(("play", PLAYING), ("play", PAUSED))


def sound_server_restarts(desktop):
    def up(start):
        desktop.volume(start)
        desktop.press("volume-up")
        wait(lambda: desktop.volume() == start + 5, "kvd reaches the sound server")
    desktop.start_kvd()
    up(20)
    desktop.sound.kill()
    desktop.sound.wait()
    desktop.press("volume-up")
    desktop.rests()
    desktop.start_sound()
    up(40)
    desktop.read("pactl", "load-module", "module-null-sink", "sink_name=second")
    desktop.read("pactl", "set-default-sink", "second")
    up(60)


def bus_restarts(desktop):
    desktop.start_kvd()
    music = Strawberry(desktop)
    music.follow(("play", PLAYING))
    desktop.bus.kill()
    desktop.bus.wait()
    desktop.press("play")
    desktop.rests()
    music.end()
    desktop.start_bus()
    Strawberry(desktop).follow(("play", PLAYING), ("play", PAUSED))


def window_server_goes(desktop):
    desktop.start_kvd()
    desktop.volume(50)
    desktop.x.kill()
    desktop.x.wait()
    desktop.press("volume-up")
    wait(lambda: desktop.volume() == 55, "the volume needs no window server")
    desktop.rests()


def without_window_server(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd(DISPLAY=None)
    music.follow(("play", PLAYING), ("play", PAUSED))

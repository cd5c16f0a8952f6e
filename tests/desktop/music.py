"""Who gets a button, and what a music player makes of it."""
from desktop import stays, wait
from programs import Mpv, Strawberry

PLAYING = {"PlaybackStatus": "Playing", "under_way": True}
PAUSED = {"PlaybackStatus": "Paused"}


def play_and_pause(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("playpause", {**PLAYING, "title": "Track 1"}), ("playpause", PAUSED), ("play", PLAYING),
                 ("pause", PAUSED), ("select", PLAYING), ("next", {**PLAYING, "title": "Track 2"}),
                 ("right", {**PLAYING, "title": "Track 3"}), ("previous", {**PLAYING, "title": "Track 2"}),
                 ("play", PAUSED), ("play", PLAYING), ("stop", PAUSED))
    stays(lambda: music.process.poll() is None, "the player runs after Stop")


def frontmost_wins_over_playing(desktop):
    film = Mpv(desktop, "--start=30")
    film.become(pause=False)
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("play", PLAYING))
    film.become(pause=True, front="strawberry")
    music.end()
    film.become(front="mpv")
    film.follow(("play", {"pause": False}))
    wait(lambda: film.position() > 30, "the film has kept its place")

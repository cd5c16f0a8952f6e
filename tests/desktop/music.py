"""Who gets a button, and what a music player makes of it."""
from desktop import stays, wait
from programs import Mpv, Player, Strawberry

PLAYING = {"PlaybackStatus": "Playing", "under_way": True}
PAUSED = {"PlaybackStatus": "Paused"}

# A jukebox cast by its entry, which counts how often it was started.
ENTRY = ("[Desktop Entry]\nType=Application\nName=Counted\nExec={}/counted\n"
         "X-Kvd-Application=com.tarn.Lyrabox\n")
COUNTED = "#!/bin/sh\necho >>{0}/starts\nexec strawberry {0}/media/music/1.ogg\n"
AUDIO_TYPES = ("mpeg", "flac", "ogg", "x-vorbis+ogg", "mp4", "x-wav")


def play_and_pause(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("playpause", {**PLAYING, "title": "Track 1"}), ("playpause", PAUSED), ("play", PLAYING),
                 ("pause", PAUSED), ("select", PLAYING), ("next", {**PLAYING, "title": "Track 2"}),
                 ("right", {**PLAYING, "title": "Track 3"}), ("previous", {**PLAYING, "title": "Track 2"}),
                 ("play", PAUSED), ("play", PLAYING), ("stop", PAUSED))
    stays(lambda: music.process.poll() is None, "the player runs after Stop")


def back_goes_to_the_start_first(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("play", PLAYING), ("next", {**PLAYING, "title": "Track 2"}))
    music.skip(30)
    desktop.press("previous")
    wait(lambda: 0 < music.position() < 10, "the track starts over")
    music.become(title="Track 2")


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


def play_starts_the_music_player(desktop):
    def starts():
        return desktop.read("wc", "-l", "starts").partition(" ")[0]
    desktop.write("counted", COUNTED.format(desktop.home))
    desktop.write(".local/share/applications/counted.desktop", ENTRY.format(desktop.home))
    desktop.write(".config/mimeapps.list", "[Default Applications]\n" +
                  "".join(f"audio/{name}=counted.desktop\n" for name in AUDIO_TYPES))
    desktop.start_kvd()
    for button in (["lock", "on"], ["play"], ["lock", "off"], ["next"]):
        desktop.press(*button)
    stays(lambda: not starts() and not desktop.front(), "nothing is started while the screen is locked")
    desktop.press("play")
    desktop.press("play")
    music = Player(desktop, "strawberry", "strawberry")
    desktop.quit_kvd()
    desktop.start_kvd()
    music.become(CanPlay=True, settled=True)
    music.follow(("play", PLAYING))
    stays(lambda: starts() == "1", "it was started once")

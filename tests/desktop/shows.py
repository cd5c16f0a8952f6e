"""Slides and photos, told apart by their colours on the screen."""
from programs import Eog, Evince, Impress, Strawberry

SLIDES = (("next", {"colour": 2}), ("right", {"colour": 3}), ("previous", {"colour": 2}),
          ("rewind --press", {"colour": 1}), ("forward --press", {"colour": 3}),
          ("playpause", {"colour": None}), ("playpause", {"colour": 3}), ("stop", {"full_screen": []}))


def slides(desktop):
    music = Strawberry(desktop)
    desktop.start_kvd()
    music.follow(("play", {"PlaybackStatus": "Playing"}))
    Impress(desktop).follow(("play", {"corner": 1, "full_screen": ["Presenting: slides"]}), *SLIDES)
    music.become(PlaybackStatus="Paused")


def slides_of_a_document(desktop):
    desktop.start_kvd()
    Evince(desktop).follow(("play", {"colour": 1, "full_screen": ["slides.pdf"]}), *SLIDES)


def photos_by_keys(desktop):
    desktop.start_kvd()
    photos = Eog(desktop)
    photos.follow(("play", {"full_screen": ["1.png"], "colour": 1}), ("next", {"colour": 2}),
                  ("right", {"colour": 3}), ("left", {"colour": 2}), ("menu", {"full_screen": []}))

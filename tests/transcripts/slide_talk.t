# A talk. Play starts the slides, which take the display.
open slidewell
  Slidewell starts
front slidewell
  Slidewell comes to the front
tap play
  connects to the window server
  finds Slidewell running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Slidewell ×7
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = false
  script to Slidewell: start slideshow
  Slidewell takes the display
  Slidewell: slide 1 of 12

# Play and next both show the next slide; play-pause freezes and unfreezes.
tap play
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show next slide
  Slidewell: slide 2 of 12
tap next
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show next slide
  Slidewell: slide 3 of 12
tap playpause
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: if frozen then ⏎ set frozen to false ⏎ else ⏎ set frozen to true ⏎ end if
  Slidewell: slide 3 of 12, frozen
tap playpause
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: if frozen then ⏎ set frozen to false ⏎ else ⏎ set frozen to true ⏎ end if
  Slidewell: slide 3 of 12

# A question about slide 5: the switcher finds it.
tap app-menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show slide switcher
  Slidewell: slide 3 of 12, switcher at 3
tap right
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = true
  script to Slidewell: move slide switcher forward
  Slidewell: slide 3 of 12, switcher at 4
tap right
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = true
  script to Slidewell: move slide switcher forward
  Slidewell: slide 3 of 12, switcher at 5
tap pick
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = true
  script to Slidewell: accept slide switcher
  Slidewell: slide 5 of 12

# Forward goes to the last slide, rewind to the first; their releases do nothing.
tap forward
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show last slide of first slideshow
  Slidewell: slide 12 of 12
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
tap rewind
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show first slide of first slideshow
  Slidewell: slide 1 of 12
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true

# While slides show, the volume buttons of the remote stay the volume.
tap volume-up
  script: output volume of (get volume settings) = 50
  sound key up pressed
  output volume 50 → 55
  timer of 0.1s starts
  timer of 0.1s stops
  script: output volume of (get volume settings) = 55
  sound key up released

# Menu ends the talk.
tap menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: stop slideshow
  Slidewell gives the display back
  Slidewell: shows no slides
tap menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = false
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

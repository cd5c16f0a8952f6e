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

# Play shows the next slide now; play-pause freezes.
tap play
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show next slide
  Slidewell: slide 2 of 12
tap playpause
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: if frozen then ⏎ set frozen to false ⏎ else ⏎ set frozen to true ⏎ end if
  Slidewell: slide 2 of 12, frozen

# A question about slide 3: the switcher finds it.
tap app-menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show slide switcher
  Slidewell: slide 2 of 12, switcher at 2
tap right
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = true
  script to Slidewell: move slide switcher forward
  Slidewell: slide 2 of 12, switcher at 3
tap pick
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = true
  script to Slidewell: accept slide switcher
  Slidewell: slide 3 of 12, frozen

# Forward goes to the last slide; its release does nothing.
tap forward
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show last slide of first slideshow
  Slidewell: slide 12 of 12, frozen
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true

# Menu ends the talk.
tap menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: stop slideshow
  Slidewell gives the display back
  Slidewell: shows no slides
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

# A photo evening with version 7, whose shows take the display.
version snapvale 7.1.5
open snapvale
  Snapvale starts
front snapvale
  Snapvale comes to the front
tap previous
  connects to the window server
  finds Snapvale running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Snapvale ×4
  finds Snapvale running
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to 0 ⏎ repeat with i from 1 to count theA…
  Snapvale: album "Summer"
  key 48 to Snapvale
tap next
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count the…
  Snapvale: album "Events"
tap play
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: ignoring application responses ⏎ activate ⏎ start slideshow ⏎ end ignoring
  Snapvale takes the display
  Snapvale: album "Events", slideshow at photo 1
tap next
  asks who is in front: Snapvale
  finds Snapvale running
  key 124 pressed in Snapvale
  Snapvale: album "Events", slideshow at photo 2
  +0.05s  key 124 released in Snapvale
tap playpause
  asks who is in front: Snapvale
  finds Snapvale running
  key 49 pressed in Snapvale
  Snapvale: album "Events", slideshow at photo 2, paused
  +0.05s  key 49 released in Snapvale
tap volume-up
  script: output volume of (get volume settings) = 50
  sound key up pressed
  output volume 50 → 55
  timer of 0.1s starts
  timer of 0.1s stops
  script: output volume of (get volume settings) = 55
  sound key up released

# Menu ends a show with Return, and with none to end starts one.
tap menu
  asks who is in front: Snapvale
  finds Snapvale running
  key 36 pressed in Snapvale
  Snapvale gives the display back
  Snapvale: album "Events"
  +0.05s  key 36 released in Snapvale
tap menu
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: ignoring application responses ⏎ activate ⏎ start slideshow ⏎ end ignoring
  Snapvale takes the display
  Snapvale: album "Events", slideshow at photo 1
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: string ×21, list ×7, serial number ×8, source ×1, port ×1, event source ×1

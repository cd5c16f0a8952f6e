# A photo evening with version 8. Outside a show the arrows walk the albums in the order that the library shows them.
open snapvale
  Snapvale starts
front snapvale
  Snapvale comes to the front
tap right
  connects to the window server
  finds Snapvale running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Snapvale ×4
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count the…
  Snapvale: album "Photos"
tap right
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count the…
  Snapvale: album "Faces"
tap left
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to 0 ⏎ repeat with i from 1 to count theA…
  Snapvale: album "Photos"
tap left
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to 0 ⏎ repeat with i from 1 to count theA…
  key 48 to Snapvale
  key 126 to Snapvale
  Snapvale: album "Events"

# A show, paused and stepped by keys; the menu button ends it.
tap play
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: activate ⏎ start slideshow
  Snapvale: album "Events", slideshow at photo 1
tap play
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = true
  script to Snapvale: tell application "Keyhouse" ⏎ tell process id "com.tarn.Snapvale" ⏎ key code 49 ⏎ end tell ⏎ …
  key 49 to Snapvale
  Snapvale: album "Events", slideshow at photo 1, paused
tap right
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = true
  key 124 pressed in Snapvale
  Snapvale: album "Events", slideshow at photo 2, paused
  +0.05s  key 124 released in Snapvale
tap menu
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = true
  script to Snapvale: tell application "Keyhouse" ⏎ tell process id "com.tarn.Snapvale" ⏎ key code 53 ⏎ end tell ⏎ …
  key 53 to Snapvale
  Snapvale: album "Events"
tap menu
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: string ×27, list ×9, serial number ×10, source ×1, port ×1, event source ×1

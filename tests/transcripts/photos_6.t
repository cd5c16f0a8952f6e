# A photo evening with version 6, which compares a name with an album and so always goes back to the last one.
version snapvale 6.0
open snapvale
  Snapvale starts
front snapvale
  Snapvale comes to the front
tap next
  connects to the window server
  finds Snapvale running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Snapvale ×4
  finds Snapvale running
  script to Snapvale: set theAlbums to the name of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count t…
  Snapvale: album "Faces"
tap next
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: set theAlbums to the name of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count t…
  Snapvale: album "Places"
tap previous
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: set theAlbums to the name of every album ⏎ set albumIndex to 0 ⏎ repeat with i from 1 to count th…
  Snapvale: album "Summer"
tap next
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: set theAlbums to the name of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count t…
  Snapvale: album "Events"
tap stop
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: ignoring application responses ⏎ activate ⏎ start slideshow ⏎ end ignoring
  Snapvale takes the display
  Snapvale: album "Events", slideshow at photo 1
tap stop
  asks who is in front: Snapvale
  finds Snapvale running
  key 36 pressed in Snapvale
  Snapvale gives the display back
  Snapvale: album "Events"
  +0.05s  key 36 released in Snapvale

# The same for a library that does not tell its version.
version snapvale none
tap next
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: set theAlbums to the name of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count t…
  Snapvale: album "Faces"
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: string ×12, list ×6, serial number ×8, source ×1, port ×1, event source ×1

# Tracks and volume, with the jukebox in front.
open lyrabox
  Lyrabox starts
front lyrabox
  Lyrabox comes to the front
tap playpause
  connects to the window server
  finds Lyrabox running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Lyrabox ×3
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
tap next
  asks who is in front: Lyrabox
  script to Lyrabox: next track
  Lyrabox: plays "Paper Boats"
tap menu-left
  asks who is in front: Lyrabox
  script to Lyrabox: back track
  Lyrabox: plays "Harbour Lights"
wait 20s
hold rewind 1s
  asks who is in front: Lyrabox
  script to Lyrabox: rewind
  Lyrabox: scans back through "Harbour Lights"
  +1s  asks who is in front: Lyrabox
  +1s  script to Lyrabox: resume
  +1s  Lyrabox: plays "Harbour Lights"
tap pause
  asks who is in front: Lyrabox
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Harbour Lights" at 0:12

# Menu Pick is the one button that sends an event.
tap pick
  asks who is in front: Lyrabox
  event 'hook'/'RSel' to Lyrabox
  Lyrabox: plays "Harbour Lights"

# Of these the jukebox takes none.
tap menu
  asks who is in front: Lyrabox
tap menu-up
  asks who is in front: Lyrabox
raw 0x0C 0xB2 1
  asks who is in front: Lyrabox

# An album comes to its end by itself.
wait 20m
  +3m34s  Lyrabox: plays "Paper Boats"
  +6m41s  Lyrabox: plays "Slow Train North"
  +9m39s  asks who is in front: Lyrabox ×2
  +10m46s  Lyrabox: plays "Lantern Street"
  +14m7s  Lyrabox: plays "Last Ferry"
  +17m59s  Lyrabox: stopped
  +19m39s  asks who is in front: Lyrabox ×2
show
  Lyrabox (in front): stopped
  output volume 50
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

# A release counts as activity, as a press does.
start
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×6
wait 1h
  +10m to +1h  asks who is in front: nobody ×36
release play
  asks who is in front: nobody
  script to Lyrabox: launch
  Lyrabox starts
wait 2h
  +10m to +2h  asks who is in front: nobody ×72
close lyrabox
  Lyrabox quits

# The jukebox in front keeps the daemon for as long as it likes.
open lyrabox
  Lyrabox starts
front lyrabox
  Lyrabox comes to the front
wait 10h
  +10m to +10h  asks who is in front: Lyrabox ×120

# A photo application of the trade does not.
open com.tarn.Lumbra
  Lumbra starts
front com.tarn.Lumbra
  Lumbra comes to the front
wait 10m
  +10m  asks who is in front: Lumbra ×6
  +10m  notification com.tarn.kvd.terminated of com.tarn.kvd
  +10m  timer of 10m stops
  +10m  exit status 0
  left alive: source ×1, port ×1

# The professional photo application is driven by keys alone.
open lumbra
  Lumbra starts
front lumbra
  Lumbra comes to the front
tap down
  connects to the window server
  finds Lumbra running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Lumbra ×6
  asks whether Lumbra runs: yes
  asks who is in front: Lumbra
  key 125 pressed in Lumbra
  Lumbra: photo in row 2, column 1
  +0.05s  key 125 released in Lumbra
  +0.06s  asks whether Lumbra runs: yes
  +0.06s  asks who is in front: Lumbra
tap right
  asks who is in front: Lumbra
  key 124 pressed in Lumbra
  Lumbra: photo in row 2, column 2
  +0.05s  key 124 released in Lumbra

# Play-pause asks for a show with Shift-S and agrees with Return, and then pauses it.
tap playpause
  asks who is in front: Lumbra
  key 56 pressed in Lumbra
  +0.01s  key 1 pressed in Lumbra
  +0.01s  Lumbra: asks about a slideshow
  +0.06s  key 1 released in Lumbra
  +0.07s  key 56 released in Lumbra
  +0.09s  key 36 pressed in Lumbra
  +0.09s  Lumbra takes the display
  +0.09s  Lumbra: slideshow at photo 1
  +0.14s  key 36 released in Lumbra
tap playpause
  asks who is in front: Lumbra
  key 49 pressed in Lumbra
  Lumbra: slideshow at photo 1, paused
  +0.05s  key 49 released in Lumbra
tap forward
  asks who is in front: Lumbra
  key 124 pressed in Lumbra
  Lumbra: slideshow at photo 2, paused
  +0.05s  key 124 released in Lumbra
  +0.06s  asks who is in front: Lumbra

# With the display taken, up and down are the volume.
tap down
  asks whether Lumbra runs: yes
  script: output volume of (get volume settings) = 50
  sound key down pressed
  output volume 50 → 45
  timer of 0.1s starts
  timer of 0.1s stops
  asks whether Lumbra runs: yes
  script: output volume of (get volume settings) = 45
  sound key down released

tap menu
  asks who is in front: Lumbra
  key 53 pressed in Lumbra
  Lumbra gives the display back
  Lumbra: photo in row 2, column 2
  +0.05s  key 53 released in Lumbra
tap menu
  asks who is in front: Lumbra
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1, event source ×1

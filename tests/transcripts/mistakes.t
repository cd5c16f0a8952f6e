# What is wrong is told under its line, and the rest goes on.
tap ply
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×6
  error: unknown button 'ply', did you mean play?
tap
  error: usage: tap BUTTON
open nobody
  error: no application is called 'nobody'
open lyrabox
  Lyrabox starts
open lyrabox
  error: Lyrabox runs already; 'again' starts it once more
front spindle
  error: Spindle does not run
wait soon
  error: not a time: 'soon' (2s, 500ms, 1.5s, 2h10m; at most a year)
wait 400d
  error: not a time: '400d' (2s, 500ms, 1.5s, 2h10m; at most a year)
volume 101
  error: an output volume is 0 to 100, not 101
tell lyrabox to fly
  error: the variable 'fly' is not set
tell lyrabox
  error: usage: tell APP to STATEMENT
raw 0x0C 0x10000 1
  error: a usage is 0 to 65535, not 0x10000
dance
  error: unknown command 'dance'
tap play
  finds Lyrabox running
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSS'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
quit
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
tap play
  nobody is listening
  left alive: serial number ×1, source ×1, port ×1

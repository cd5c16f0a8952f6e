# A tour of the rehearsal desktop. What stands at the left margin is what a person does; below it, indented, is what
# kvd asks and does, and what changes on the desktop. Time is virtual: hours pass at once.

# Nobody is there. kvd starts by itself for the first button, and Play launches the jukebox.
tap play
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×7
  script to Lyrabox: launch
  Lyrabox starts

# The jukebox runs now, so the next Play reaches it, and one more pauses it: Play toggles.
tap play
  finds Lyrabox running
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSS'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
wait 1m30s
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: playpause
  Lyrabox: paused in "Harbour Lights" at 1:30

# Next track; then a scan for as long as the button is held.
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
tap next
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: next track
  Lyrabox: plays "Paper Boats"
hold forward 3s
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: fast forward
  Lyrabox: scans forward through "Paper Boats"
  +3s  asks who is in front: nobody
  +3s  asks whether Lyrabox runs: yes
  +3s  script to Lyrabox: get player state = 'kPSF'
  +3s  asks whether Lyrabox runs: yes
  +3s  script to Lyrabox: resume
  +3s  Lyrabox: plays "Paper Boats"

# An editor comes to the front. The jukebox still plays, so the remote is still its.
open com.example.Editor
  Editor starts
front com.example.Editor
  Editor comes to the front
tap pause
  finds Lyrabox running
  asks who is in front: Editor
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Paper Boats" at 0:24

# It plays no more, but it was the last one chosen.
tap play
  asks who is in front: Editor
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Paper Boats"

# With the screen locked kvd launches nothing.
tap stop
  asks who is in front: Editor
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: stop
  Lyrabox: stopped
close lyrabox
  Lyrabox quits
lock on
tap play
  asks who is in front: Editor

# Nobody touches the remote for an evening. After two hours kvd ends; the next button would start it again.
wait 3h
  +8m27s to +2h8m27s  asks who is in front: Editor ×78
  +2h8m27s  notification com.tarn.kvd.terminated of com.tarn.kvd
  +2h8m27s  timer of 10m stops
  +2h8m27s  exit status 0
  left alive: source ×1, port ×1

# The first evening: nobody is there, so the first press of Play launches the jukebox and is otherwise lost.
tap play
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×7
  script to Lyrabox: launch
  Lyrabox starts

# The second one plays, and the third pauses: Play toggles.
tap play
  finds Lyrabox running
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSS'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
wait 30s
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: playpause
  Lyrabox: paused in "Harbour Lights" at 0:30
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"

# A scan lasts while the button is held.
hold forward 3s
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: fast forward
  Lyrabox: scans forward through "Harbour Lights"
  +3s  asks who is in front: nobody
  +3s  asks whether Lyrabox runs: yes
  +3s  script to Lyrabox: get player state = 'kPSF'
  +3s  asks whether Lyrabox runs: yes
  +3s  script to Lyrabox: resume
  +3s  Lyrabox: plays "Harbour Lights"
tap stop
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: stop
  Lyrabox: stopped
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

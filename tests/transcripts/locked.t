# A locked screen keeps kvd from starting anything.
lock on
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×6
tap play
  asks who is in front: nobody
tap next
  asks who is in front: nobody
lock off
tap next
  asks who is in front: nobody
raw 0x01 0x89 0
  asks who is in front: nobody
  script to Lyrabox: launch
  Lyrabox starts

# It does not keep it from driving what runs.
lock on
tap play
  finds Lyrabox running
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSS'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

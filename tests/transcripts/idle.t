# The check of idleness comes every ten minutes; only a silence of more than two hours ends the daemon.
start
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×6
wait 2h
  +10m to +2h  asks who is in front: nobody ×72
lock on
wait 9m
wait 1m
  +1m  asks who is in front: nobody ×6
  +1m  notification com.tarn.kvd.terminated of com.tarn.kvd
  +1m  timer of 10m stops
  +1m  exit status 0
tap play
  nobody is listening
  left alive: source ×1, port ×1

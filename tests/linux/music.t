# A music player: play, pause, skip, and a scan while a button is held down.
player audacious length=3m
start
tap play
  audacious: Play
tap play
  audacious: Pause
tap next
  audacious: Next
# A track that has only begun is left for the one before, another begins anew.
tap previous
  audacious: Previous
audacious: Position=20s
tap previous
  audacious: SetPosition /track/1 0s
# A scan goes at eight times the speed, four steps a second, for as long as the button is held.
audacious: playing Position=1m
wait 1s
press forward
tell Lyrabox to fast forward
wait 0.5s
  +0.25s  audacious: SetPosition /track/1 62s
  +0.5s  audacious: SetPosition /track/1 64s
tell Lyrabox to get player state
  = 'kPSF'
release forward
wait 1s
press forward
tap next
  audacious: Next
wait 1s
release forward
# Backward it ends where the track begins, forward a second before its end, though the button is still down.
audacious: Position=3s
press rewind
wait 2s
  +0.25s  audacious: SetPosition /track/1 1s
  +0.5s  audacious: SetPosition /track/1 0s
release rewind
audacious: Position=2m55s
press forward
wait 2s
  +0.25s  audacious: SetPosition /track/1 177s
  +0.5s  audacious: SetPosition /track/1 179s
release forward
# Another track is scanned from where it stands.
press rewind
audacious: track=/track/2 Position=10s
wait 0.25s
  +0.25s  audacious: SetPosition /track/2 8s
release rewind
# Somebody pauses by hand: that ends the scan, at the second look, as some players pause to seek.
wait 1s
press forward
wait 0.25s
  +0.25s  audacious: SetPosition /track/2 10s
audacious: says=Paused
wait 0.25s
  +0.25s  audacious: SetPosition /track/2 12s
audacious: says=
wait 0.25s
  +0.25s  audacious: SetPosition /track/2 14s
audacious: paused
wait 1s
  +0.25s  audacious: SetPosition /track/2 16s
release forward
# What stands still is scanned silently, and stands still after it. Play in mid-scan stops it all.
press rewind
wait 0.25s
  +0.25s  audacious: SetPosition /track/2 14s
tell Lyrabox to get player state
  = 'kPSR'
release rewind
tell Lyrabox to get player state
  = 'kPSU'
audacious: playing
wait 1s
press rewind
tap play
  audacious: Pause
wait 1s
# A player that cannot seek any more is not scanned any longer, and one that has gone is forgotten.
press forward
audacious: refuses=SetPosition
wait 1s
  +0.25s  audacious: SetPosition /track/2 16s
release forward
press forward
quit audacious
wait 1s

# Players that were there before kvd, and one that came later: whatever failed, an hour later kvd knows them all.
player strawberry
player mpv title=Dune
start
tap next
  strawberry: Next
player celluloid as=io.github.celluloid_player.Celluloid length=2h
tap playpause
  strawberry: PlayPause
strawberry: stopped
mpv: stopped
celluloid: paused
wait 1h
window Song of strawberry class=strawberry
front Song
tap play
  strawberry: PlayPause
window Dune of mpv class=mpv
front Dune
tap play
  strawberry: Pause
  mpv: Play
window Film of celluloid class=celluloid
front Film
tap play
  mpv: Pause
  celluloid: Play

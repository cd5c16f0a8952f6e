# Films: faster by the player's own rate, scanned by seeking where it has none, stepped frame by frame.
player mpv length=2h MaximumRate=100 playing
window Dune of mpv class=mpv
start

# A person watches at 1.5 times the speed, and does so again after a scan. What stood still stands still again.
mpv: Rate=1.5 Position=1m
press forward
  mpv: Set Rate 2
release forward
  mpv: Set Rate 1.5
press rewind
wait 0.25s
  +0.25s  mpv: SetPosition /track/1 59.5s
release rewind
tap pause
  mpv: Pause
press forward
  mpv: Set Rate 2
  mpv: Play
release forward
  mpv: Pause
  mpv: Set Rate 1.5
# A rate that somebody else left behind is none at which people watch, and neither is 0.
mpv: Rate=4 playing
press forward
  mpv: Set Rate 2
release forward
  mpv: Set Rate 1
mpv: Rate=0
press forward
  mpv: Set Rate 2
release forward
  mpv: Set Rate 1

# A step is one frame, over mpv's channel, else by its key. It ends a scan.
press forward
  mpv: Set Rate 2
tap next
  mpv: Set Rate 1
  window Dune: key .
release forward
  mpv: Set Rate 1
mpv: channel=mpv-socket refuses=frame-step
tell VistremePlayer to step forward front movie
  mpv: channel: frame-step
  fails
# Another program takes the channel's path over: nothing that is meant for mpv goes there.
mpv: obeys=frame-step
program thief channel=mpv-socket
tap next
mpv: channel=other-socket
tap next
  mpv: channel: frame-step
quit mpv
# Neither does a program of another executable get what is meant for mpv.
player wrapper as=mpv title=Dune channel=mpv-socket
window Dune of wrapper class=mpv
front Dune
tap next
  window Dune: key .
quit wrapper
# Without a film there is nothing to play.
player empty as=mpv stopped
tell VistremePlayer to play front movie
  fails
quit empty

# The modern movie player climbs through its rates, and answers on the screen: in a notification that takes the
# place of the one before, or in its own picture.
player celluloid as=io.github.celluloid_player.Celluloid.instance-1 length=2h MaximumRate=8 playing
celluloid: url=file:///films/dune%201.mkv Rate=1.5
program desk owns=org.freedesktop.Notifications
tap forward
  desk: Notify kvd 0 io.github.celluloid_player.Celluloid dune 1.mkv 0:00 / 2:00:00 2000
  celluloid: Set Rate 2
tap forward
  desk: Notify kvd 7 io.github.celluloid_player.Celluloid dune 1.mkv 0:00 / 2:00:00 2000
  celluloid: Set Rate 4
celluloid: channel=mpv-socket Position=1h3m5s
tap rewind
  celluloid: channel: show-text dune 1.mkv|1:03:05 / 2:00:00
  celluloid: Set Rate 2
tap rewind
  celluloid: channel: show-text dune 1.mkv|1:03:05 / 2:00:00
  celluloid: Set Rate 1.5
tap rewind
  celluloid: channel: show-text dune 1.mkv|1:03:05 / 2:00:00
wait 0.25s
  +0.25s  celluloid: SetPosition /track/1 3784.5s
tap playpause
  celluloid: channel: show-text dune 1.mkv|1:03:04 / 2:00:00
wait 1s
celluloid: paused
tell VistremePlayerX to get rate of front document
  = 0
quit celluloid

# Milliseconds for one that counts them.
player showtime as=org.gnome.Showtime length=7.2s Position=0.06s playing
tap next
  desk: Notify kvd 7 org.gnome.Showtime Showtime 1:00 / 2:00:00 2000
  showtime: SetPosition /track/1 0.07s
showtime: length=1h Position=1m
tap next
  desk: Notify kvd 7 org.gnome.Showtime Showtime 1:00 / 1:00:00 2000
  showtime: SetPosition /track/1 70s
tap previous
  desk: Notify kvd 7 org.gnome.Showtime Showtime 1:10 / 1:00:00 2000
  showtime: SetPosition /track/1 60s
  desk: Notify kvd 7 org.gnome.Showtime Showtime 1:00 / 1:00:00 2000
tell VistremePlayerX to set audio volume of front document to 2
  showtime: Set Volume 1
showtime: Volume=0.7
tell VistremePlayerX to get audio volume of front document
  = 0
tell VistremePlayerX to stop front document
  showtime: Pause

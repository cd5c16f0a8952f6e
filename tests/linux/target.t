# Who gets a button: whoever is in front, else whoever plays, else who was last chosen, else the first that runs.
player strawberry
player mpv title=Dune
window Song of strawberry class=strawberry
window Dune of mpv class=mpv
front Dune
strawberry: playing
program shell hears=com.tarn.kvd.Notifications
start
  shell: Posted com.tarn.kvd.started com.tarn.kvd
tap playpause
  strawberry: Pause
  mpv: Play
front nobody
tap playpause
  mpv: Pause
tap playpause
  mpv: Play
quit mpv
tap playpause
  strawberry: PlayPause
# Pick brings it to the front.
tap pick
  window Song: activate
# Of two the one that plays, whoever did when they came.
player rhythmbox playing
window Tune of rhythmbox class=rhythmbox
front nobody
tap next
  rhythmbox: Next
rhythmbox: stopped
strawberry: playing
tap pick
  window Song: activate
quit rhythmbox
# Where nobody can tell who is in front, nobody is.
player mpv title=Dune
window Dune of mpv class=mpv
front Dune
front unknown
tap playpause
  strawberry: Pause

# Whoever starts silences the others first, in every role and in its own.
player vlc playing url=file:///film.mkv
player second as=mpv.instance2 title=Film
window Film of second class=mpv
strawberry: playing
mpv: playing
front Film
tap play
  strawberry: Pause
  vlc: Pause
  mpv: Pause
  second: Play
# Of two in one role the one in front comes first, else the one that plays, else the one that was last used, else the
# one that was started last.
mpv: playing
second: paused
front nobody
tap play
  mpv: Pause
tap play
  mpv: Play
front Film
second: playing
tap play
  mpv: Pause
  second: Pause
front Dune
tap play
  mpv: Play
mpv: paused
front nobody
tap play
  mpv: Play

# Nobody runs: play starts the default player, once in twenty seconds, by the bus or the service manager; nothing is
# started while the screen is locked.
quit second
quit mpv
player third as=mpv.instance3 title=Film
player fourth as=mpv.instance4 title=Film
tell VistremePlayer to play front movie
  fourth: Play
third: playing
fourth: paused
third: paused
tell VistremePlayer to play front movie
  third: Play
quit third
quit fourth
quit vlc
quit strawberry
entry org.strawberrymusicplayer.strawberry X-Kvd-Application=none
entry Hi-Fi Categories=AudioVideo;Audio;Player;
program manager owns=org.freedesktop.systemd1
tap play
  manager: StartTransientUnit app-kvd-Hi_Fi-86400000000000.service fail
wait 19s
tap play
wait 1s
tap play
  manager: StartTransientUnit app-kvd-Hi_Fi-86420000000000.service fail
wait 20s
entry org.example.Hi-Fi Categories=AudioVideo;Audio;Player; DBusActivatable=true
entry Hi-Fi X-Kvd-Application=none
program starter owns=org.example.Hi-Fi
lock on
tap play
lock off
tap play
  starter: Activate of Hi_Fi
tap play
# What runs is not started again, and comes to the front; whoever was set something was spoken to.
wait 20s
player rhythmbox
tell Lyrabox to launch
player elisa
tell Lyrabox to play
  elisa: Play
window Tune of rhythmbox class=rhythmbox
front Tune
tell Lyrabox to set sound volume to 50
  rhythmbox: Set Volume 0.5
elisa: paused
front nobody
tell Lyrabox to next track
  rhythmbox: Next
elisa: playing
rhythmbox: playing
tell Lyrabox to pause
  elisa: Pause
  rhythmbox: Pause
quit elisa
quit rhythmbox
tell Lyrabox to activate
  starter: Activate of Hi_Fi

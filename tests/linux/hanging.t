# Players that hang. Real time passes here: half a second for a question, a second for a command.
player strawberry silent counts playing
player mpv silent title=Dune
window Dune of mpv class=mpv
start
  strawberry: GetAll org.mpris.MediaPlayer2
# However much a button would ask of it, one that hangs costs its time once: it finds one question a button.
front Dune
stop strawberry
tap play
  mpv: Play
front nobody
tap play
  mpv: Pause
continue strawberry
  strawberry: Get org.mpris.MediaPlayer2.Player PlaybackStatus ×2
# A command that is not answered has failed, and is not sent again.
quit strawberry
wait 1s
mpv: holds=Play
tap play
  mpv: Play
mpv: answers
tap play
  mpv: Pause
quit mpv
# One that hangs when it comes is nobody until it tells who it is; one that refuses to tell is asked again.
entry newcomer Categories=AudioVideo;Audio;Player;
player newcomer holds=GetAll DesktopEntry=newcomer
tap play
newcomer: answers
tap play
  newcomer: Play
quit newcomer
player newcomer refuses=GetAll DesktopEntry=newcomer
tap play
newcomer: obeys=GetAll
tap play
  newcomer: Play
wait 1s
quit newcomer
# One that takes its time to say what it does is taken to do what it did last, and told without waiting.
player audacious silent
tell Lyrabox to get player state
  = 'kPSU'
audacious: holds=Get
tap play
  audacious: Play
audacious: answers paused holds=Play
wait 2s
tell Lyrabox to play
  audacious: Play
audacious: answers
tell Lyrabox to get player state
  = 'kPSP'
# One that does not say what it does does not keep another from playing.
audacious: paused
player elisa silent holds=Get
wait 2s
tell Lyrabox to play
  audacious: Play
quit elisa
# An action of one that is too busy to tell of it is done all the same.
program eog holds=Describe
window Photo of eog class=eog
tell Snapvale to start slideshow
  eog: SetState win.view-slideshow true of Photo

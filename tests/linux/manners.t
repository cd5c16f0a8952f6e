# What players do otherwise than they should.

# One that toggles is told only what it does not do yet, whoever else has told it something.
player celluloid as=io.github.celluloid_player.Celluloid.instance-1 toggles title=Dune
start
tap play
  celluloid: Play
celluloid: paused
tap pause
tap play
  celluloid: Play
quit celluloid

# What one announces is believed without a question.
player strawberry counts playing
  strawberry: GetAll org.mpris.MediaPlayer2
tell Lyrabox to get player state
  strawberry: Get org.mpris.MediaPlayer2.Player PlaybackStatus
  = 'kPSP'
wait 1s
strawberry: paused
tell Lyrabox to get player state
  = 'kPSU'
strawberry: playing
tell Lyrabox to get player state
  = 'kPSP'
quit strawberry

# One that announces nothing is asked; one that takes its time is believed for half a second to do as it was told,
# whatever it announces meanwhile.
player audacious silent
tap play
  audacious: Play
audacious: paused
wait 0.4s
tell Lyrabox to get player state
  = 'kPSP'
wait 0.1s
tell Lyrabox to get player state
  = 'kPSU'
quit audacious
player strawberry playing ignores=Pause
tap play
  strawberry: Pause
strawberry: playing
tell Lyrabox to get player state
  = 'kPSU'
wait 0.5s
tell Lyrabox to get player state
  = 'kPSP'

# One that plays only when it is told to toggle is asked first, whatever it announced.
strawberry: paused
strawberry: silent playing
tell Lyrabox to play

# One that refuses, and one that dies of it.
strawberry: paused refuses=PlayPause
tell Lyrabox to play
  strawberry: PlayPause
  fails
tell Lyrabox to get player state
  = 'kPSU'
strawberry: playing refuses=Pause
tell Lyrabox to pause
  strawberry: Pause
tell Lyrabox to get player state
  = 'kPSP'
strawberry: paused dies=PlayPause
tell Lyrabox to play
  strawberry: PlayPause
  strawberry: gone
  fails

# One that quick seeks bring to a stand for good is paused while it is scanned, however long it takes to pause.
player rhythmbox length=3m Position=1m playing says=Playing
press forward
  rhythmbox: Pause
wait 0.75s
  +0.25s  rhythmbox: SetPosition /track/1 62s
  +0.5s  rhythmbox: SetPosition /track/1 64s
  +0.75s  rhythmbox: SetPosition /track/1 66s
rhythmbox: says=
release forward
  rhythmbox: PlayPause
wait 1s
# It plays on where the track ends under the scan; played by hand it is left alone, and stopped it stays so.
rhythmbox: Position=2m55s
press forward
  rhythmbox: Pause
wait 0.5s
  +0.25s  rhythmbox: SetPosition /track/1 177s
  +0.5s  rhythmbox: SetPosition /track/1 179s
  +0.5s  rhythmbox: PlayPause
press rewind
  rhythmbox: Pause
wait 0.25s
  +0.25s  rhythmbox: SetPosition /track/1 177s
rhythmbox: playing
wait 0.75s
  +0.25s  rhythmbox: SetPosition /track/1 175s
release rewind
press rewind
  rhythmbox: Pause
tap play
wait 0.5s
press forward
wait 0.25s
  +0.25s  rhythmbox: SetPosition /track/1 177s
release forward
wait 1s
quit rhythmbox

# One that nobody knows, and that does not obey Play, gets PlayPause a second later, unless somebody else plays by then.
entry newcomer Categories=AudioVideo;Audio;Player;
player newcomer DesktopEntry=newcomer ignores=Play
tap play
  newcomer: Play
wait 2s
  +1s  newcomer: PlayPause
tap play
  newcomer: Pause
wait 1s
player mpv title=Film
tap play
  newcomer: Play
wait 0.5s
mpv: playing
wait 2s
mpv: paused silent
tell Lyrabox to play
  newcomer: Play
tell VistremePlayer to play front movie
  mpv: Play
wait 2s
quit mpv
quit newcomer

# A track id that is none is not sent back: the bus would throw kvd out.
player vlc url=file:///film.mkv length=1h Position=10m CanGoPrevious=false track:s=42 playing
tap previous
  vlc: Seek -600s
vlc: track=/org/mpris/MediaPlayer2/TrackList/NoTrack Position=10m
tap previous
  vlc: Seek -600s
# Numbers that are none, numbers out of all bounds, values of other types.
vlc: Position:d=nan Volume:d=inf
tell Spindle to get elapsed time
  = 0
tell Spindle to get audio volume
  = 255
vlc: Position:d=1e300 Volume:d=-3
tell Spindle to get elapsed time
  = 0
tell Spindle to get audio volume
  = 255
vlc: Position:s=soon PlaybackStatus:d=1 Metadata:s=none
wait 1s
tell Spindle to get elapsed time
  = 0
tell Spindle to get dvd state
  = 'esid'
vlc: Tracks=/track/1,/track/2
tell Spindle to get has media
  = 1
quit vlc
# A length of nothing is none. What does not say that it can seek cannot, and neither can what is stopped.
player audacious length=0s Position=1m playing
press forward
wait 0.25s
  +0.25s  audacious: SetPosition /track/1 62s
release forward
wait 1s
audacious: stopped
tell Lyrabox to fast forward
  fails
audacious: CanSeek:s=yes Volume=1.5 playing
tell Lyrabox to fast forward
  fails
tap previous
  audacious: Previous
tell Lyrabox to get sound volume
  = 100
# After a step nobody knows what it does, and it is asked.
audacious: silent
tap next
  audacious: Next
audacious: paused
tap play
  audacious: Play
quit audacious
# What one announces when its time is over is believed again.
player audacious counts playing ignores=Pause
  audacious: GetAll org.mpris.MediaPlayer2
tell Lyrabox to pause
  audacious: Get org.mpris.MediaPlayer2.Player PlaybackStatus
  audacious: Pause
wait 2s
audacious: playing
tell Lyrabox to get player state
  = 'kPSP'

# A disc in VLC, over MPRIS2 and VLC's rc interface.
player vlc url=dvd:///dev/sr0 length=2h playing channel=rc rc.title=0/3 rc.chapter=0/12
window Dune of vlc class=vlc
player strawberry playing
front Dune
start
# In the menu: select picks, there is nothing to scan, and one goes back to the film.
tap select
  strawberry: Pause
  vlc: channel: key key-nav-activate
press forward
wait 0.5s
tell Spindle to get dvd state
  = 'esps'
tell Spindle to stop dvd
  vlc: Stop
tell Spindle to get dvd menu active
  = 0
vlc: playing
tap app-menu
  vlc: channel: title 1
  vlc: channel: seek 0
# In the film: chapters. The menu comes and goes, and the film goes on where it was.
vlc: rc.title=2/3 rc.chapter=4/12 Position=30m
tap next
  vlc: channel: chapter 5
vlc: rc.chapter=0/1
tap next
  window Dune: key Shift+n
vlc: rc.chapter=4/12
tell Spindle to get chapter
  = 5
tell Spindle to go return to dvd
tap app-menu
  vlc: channel: key key-disc-menu
vlc: rc.title=0/1
tap app-menu
  vlc: channel: title 2
  vlc: channel: seek 1800
vlc: rc.title=2/3
# While it stands still VLC does not tell where, and takes no numbers: it is where it was.
tap playpause
  vlc: Pause
tap next
  vlc: channel: key key-chapter-next
tap app-menu
  vlc: channel: key key-disc-menu
  vlc: Play
tell Spindle to set dvd scan rate to playing
tell Spindle to get dvd scan rate
  = 'xs02'
# Scans: by VLC's rate forward, by seeking backward; begun while it stood still they end so.
press forward
wait 0.25s
  +0.25s  vlc: SetPosition /track/1 1802s
release forward
vlc: Position=30m MaximumRate=30
press forward
  vlc: Set Rate 8
release forward
  vlc: Set Rate 1
press forward
  vlc: Set Rate 8
tap next
  vlc: Set Rate 1
  vlc: channel: chapter 5
release forward
tap pause
  vlc: Pause
press rewind
wait 0.25s
  +0.25s  vlc: SetPosition /track/1 1798s
tell Spindle to get dvd state
  = 'espl'
release rewind
tell Spindle to set chapter to 13
  fails
# Without rc nobody tells of chapters: one goes on or back by key.
quit vlc
player vlc url=dvdsimple:///dev/sr0 length=2h playing
window Dune of vlc class=vlc
tap previous
  window Dune: key Shift+p
# A file's chapters are the play list, of which VLC says that it goes on for ever.
vlc: url=file:///film.mkv Tracks=/track/1,/track/2
tap next
  vlc: Next
vlc: track=/track/2 Position=1m
tap next
tap previous
  vlc: Previous

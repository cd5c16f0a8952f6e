# Who plays which role: what a person wrote into the desktop entry, else the table, else the entry's categories.
entry mpv X-Kvd-Application=com.tarn.Lyrabox
entry vlc X-Kvd-Application=none
entry firefox Categories=Network;WebBrowser; X-Kvd-Application=com.tarn.VistremePlayerX
entry newcomer Categories=AudioVideo;Audio;Player;
entry organiser Categories=Graphics;Photography;
player mpv DesktopEntry=mpv
player vlc DesktopEntry=vlc
player firefox as=firefox.instance_1 DesktopEntry=firefox title=Film stopped
start
tell Lyrabox to play
  mpv: Play
tell Lyrabox to activate
tell Spindle to play dvd
  fails
tell VistremePlayerX to play front document
  firefox: Play
quit mpv
player newcomer DesktopEntry=Newcomer.desktop
tell Lyrabox to play
  newcomer: Play
program organiser
window Photos of organiser class=organiser
front Photos
tap right
  window Photos: key Right
# Browsers, proxies and headsets whom nobody cast.
quit newcomer
player playerctld DesktopEntry=mpv
player chromium as=chromium.instance4711 DesktopEntry=newcomer
player headset
player handset as=kdeconnect.mpris_2 DesktopEntry=newcomer
tell Lyrabox to play
  fails
player phone as=kdeconnect.mpris_1 DesktopEntry=mpv
tell Lyrabox to play
  phone: Play
quit phone
# In another role a program is not what its row says.
entry org.gnome.eog X-Kvd-Application=com.tarn.Officra.Slidewell
program eog
window Show of eog class=eog full-screen
tell Slidewell to get playing
  = 1
quit eog

# A sandboxed player speaks through a proxy, so that its window has another process: its entry tells whose it is.
player proxy as=sandboxed title=Film DesktopEntry=org.gnome.Totem
program sandbox
window Film of sandbox id=org.gnome.Totem
front Film
tap play
  firefox: Pause
  proxy: Play
quit sandbox
window Film of nobody id=org.gnome.Totem
front Film
tap play
  proxy: Pause
close Film
tell VistremePlayerX to activate
  proxy: Raise
# A player with two names stays while it has one of them.
player rhythmbox playing owns=org.mpris.MediaPlayer2.rhythmbox.instance7
tell Lyrabox to pause
  rhythmbox: Pause
rhythmbox: drops=org.mpris.MediaPlayer2.rhythmbox
tell Lyrabox to play
  rhythmbox: PlayPause
rhythmbox: drops=org.mpris.MediaPlayer2.rhythmbox.instance7
tell Lyrabox to play
  fails
wait 1s

# Windows of which nobody knows the process are those of the player whose title they have.
player mpv title=Dune
player mpv.instance7 title=Jaws
window Dune of nobody id=mpv
window Jaws of nobody id=mpv
front Jaws
tap play
  mpv.instance7: Play
front Dune
tap play
  mpv.instance7: Pause
  mpv: Play

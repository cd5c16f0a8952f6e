# No browser is started to play films.
entry org.gnome.Epiphany DBusActivatable=true
program web owns=org.gnome.Epiphany
start
tell VistremePlayerX to launch

# A browser is a player while a page has something to play.
entry firefox-esr Categories=Network;WebBrowser;
player strawberry
player firefox as=firefox.instance_1_6 DesktopEntry=firefox-esr stopped
window Page of firefox class=firefox-esr
front Page
tap play
  strawberry: PlayPause
firefox: length=1h playing
tap play
  strawberry: Pause
  firefox: Pause
tap play
  firefox: Play
# It says that it can play faster, and does not.
firefox: MaximumRate=4
press forward
wait 0.25s
  +0.25s  firefox: SetPosition /track/1 0.5s
tap play
wait 1s
tell VistremePlayerX to close front document
  firefox: Pause
firefox: stopped
tap play
  strawberry: PlayPause
# The extension that speaks for it is heard where it does not speak for itself; its window is the browser's.
firefox: playing
player extension as=plasma-browser-integration DesktopEntry=firefox-esr title=Film playing
tap play
  strawberry: Pause
  firefox: Pause
firefox: drops=org.mpris.MediaPlayer2.firefox.instance_1_6
extension: paused
strawberry: playing
tap play
  strawberry: Pause
  extension: Play
quit extension
firefox: owns=org.mpris.MediaPlayer2.firefox.instance_1_6 playing
# One whose entry says so is none.
quit firefox
entry chromium X-Kvd-Application=none
player chromium as=chromium.instance4711 title=Film playing
tap play
  strawberry: PlayPause

# Photos: by actions where the program has them.
program eog win.view-slideshow=false
window Cat of eog class=Eog
front Cat
start
tap play
  window Cat: activate
  eog: SetState win.view-slideshow true of Cat
tell Snapvale to start slideshow
tap next
  eog: Activate win.go-next of Cat
tap menu
  eog: SetState win.view-slideshow false of Cat
tell Snapvale to stop slideshow
tell Snapvale to select album 8
  fails
# A display is captured by a shown window that covers most of it. Then play is a key, which pauses the show.
eog: win.view-slideshow=false
outputs 0,0,1280,720 1280,0,1920,1080
window Cat full-screen area=1300,0,1500,1080
tap play
  eog: Activate win.pause-slideshow of Cat
window Cat area=1280,0,960,1080
tap play
  window Cat: activate
  eog: SetState win.view-slideshow true of Cat
eog: win.view-slideshow=false
window Cat hidden area=0,0,1280,720
tap play
  window Cat: activate
  eog: SetState win.view-slideshow true of Cat
quit eog

# By keys to the window that a person would type into: the active one, else a full-screen one, else the topmost.
program shotwell
window Library of shotwell class=shotwell
window Editor of shotwell class=shotwell
front Library
tap next
  window Library: key Right
front nobody
tell Snapvale to select album 7
  window Editor: key Right
window Library full-screen
tell Snapvale to select album 5
  window Library: key Left
front Editor
tell Snapvale to stop slideshow
  window Library: key Escape
front nobody
# Where keys reach the active window alone, the others get none.
window Library ordinary
keys focused
tell Snapvale to select album 5
  fails
front Editor
tell Snapvale to select album 5
  window Editor: key Left
keys any
tell Keyhouse to key code 36 using command down
  fails
# Who was spoken to last goes before who came last.
program gthumb
window Album of gthumb class=gthumb
front nobody
tell Snapvale to select album 5
  window Editor: key Left
quit gthumb
quit shotwell
# The show of a player that is stopped is its ordinary window.
player gwenview as=Gwenview playing
window View of gwenview class=gwenview full-screen
tell Snapvale to get slideshow running
  = 1
gwenview: stopped
tell Snapvale to get slideshow running
  = 0
quit gwenview
# Professional photos: one that is in no table gets the keys as they are, shifted where they are so.
entry studio X-Kvd-Application=com.tarn.Lumbra
program studio
window Shoot of studio id=studio class=studio
front Shoot
tap playpause
  window Shoot: key Shift+s
  window Shoot: key Return
tap right
  window Shoot: key Right
tell Keyhouse to key code 36 using option down
  window Shoot: key Return

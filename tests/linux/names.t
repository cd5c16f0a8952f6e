# Programs that no window system tells of: the bus does. One without a window serves in the background.
front unknown
program eog
start
tell Snapvale to get slideshow running
  fails
eog: windows=1
tell Snapvale to start slideshow
  eog: SetState win.view-slideshow true of 1
tell Snapvale to get slideshow running
  = 1
# Of several windows the newest has what is asked for.
eog: windows=1,12,2
tell Snapvale to stop slideshow
  eog: SetState win.view-slideshow false of 12
quit eog
tell Snapvale to get slideshow running
  fails
# By its name, whatever it runs. Its windows join it though the compositor tells no process.
program viewer owns=org.gnome.gThumb windows=1 win.slideshow-close=none
window Album of nobody id=org.gnome.gThumb
front Album
tap play
  window Album: activate
  viewer: Activate win.slideshow of 1
viewer: win.slideshow-close=true
window Show of nobody id=org.gnome.gThumb full-screen
tap next
  viewer: Activate win.slideshow-next-image of 1
tap menu
  viewer: Activate win.slideshow-close of 1
window Own of viewer class=gthumb
front Own
tap next
  viewer: Activate win.slideshow-next-image of Own
quit viewer
# KDE's, whose methods step.
program okular owns=org.kde.okular-$PID windows=okular__Shell_1
window Slides of okular class=okular
window Show of okular class=okular full-screen
front Slides
tap next
  okular: slotNextPage
press forward
  okular: slotGotoLast
tap menu
  okular: slotTogglePresentation
quit okular
# One that hangs is there; it is asked once.
program evince windows=1 counts
stop evince
tell Slidewell to get playing
  = 0
tell Slidewell to get playing
  = 0
continue evince
  evince: Introspect
tell Slidewell to start slideshow
  evince: Introspect
  evince: Describe win.presentation of 1
  evince: Activate win.presentation of 1
quit evince
# Papers disables an action while it shows. It takes no keys from here.
program papers windows=1 win.fullscreen=disabled
front unknown
tap next
tell Slidewell to get playing
  = 1
tap menu
  papers: Activate win.escape of 1

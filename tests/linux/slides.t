# Slides. LibreOffice shows them in a window of their own; its letters are none of our business.
program office
window Letter of office class=libreoffice-writer
window Talk of office class=libreoffice-impress
player strawberry playing
front Letter
start
tap play
  strawberry: Pause
front Talk
strawberry: playing
tap play
  strawberry: Pause
  window Talk: key F5
# Alone on the screen it is no show.
window Palette of office class=soffice
window Talk full-screen
tell Slidewell to get playing
  = 0
close Palette
window Talk ordinary
window Show of office class=libreoffice-impress full-screen
tell Slidewell to start slideshow
tap next
  window Show: key Right
press rewind
  window Show: key Home
# Nobody tells whether the picture is taken away: it is remembered, until a step, a jump or the end.
tap playpause
  window Show: key b
tap playpause
  window Show: key b
tell Slidewell to get frozen
  = 0
tap playpause
  window Show: key b
tap next
  window Show: key Right
tell Slidewell to get frozen
  = 0
tap playpause
  window Show: key b
press forward
  window Show: key End
tell Slidewell to get frozen
  = 0
tap playpause
  window Show: key b
tap menu
  window Show: key Escape ×2
tell Slidewell to get frozen
  = 0
# There is no show to end; the next one begins with its picture, and one that nobody sees is none.
close Show
tell Slidewell to stop slideshow
tap play
  window Talk: key F5
window Show of office class=libreoffice-impress full-screen
tap playpause
  window Show: key b
tell Slidewell to set frozen to true
close Show
window Show of office class=libreoffice-impress full-screen
tell Slidewell to get frozen
  = 0
window Show hidden
tap play
  window Talk: key F5
# The window is the same, but it is a sheet now.
close Show
tell Slidewell to get playing
  = 0
window Talk class=libreoffice-calc
tap play
  strawberry: PlayPause

# Evince shows in the window that it has. Full screen by its own action is no show.
program evince win.fullscreen=false
window Paper of evince class=evince
front Paper
tap play
  strawberry: Pause
  evince: Activate win.presentation of Paper
window Paper full-screen
tap next
  window Paper: key Right
evince: win.fullscreen=true
tap next
# Of several documents the active one is shown, else the topmost; a dialog is none.
window Paper ordinary
window Other of evince class=evince
window Options of evince class=evince dialog
tell Slidewell to start slideshow
  evince: Activate win.presentation of Paper
front nobody
tell Slidewell to start slideshow
  evince: Activate win.presentation of Other

# Where a step leaves the picture away, the key for it comes first.
program okular
window Book of okular class=okular
window Pages of okular class=okular full-screen
front Pages
tap playpause
  window Pages: key b
tap next
  window Pages: key b
  window Pages: key Right
press rewind
  window Pages: key Home

# A tour of the rehearsal desktop. What stands at the left margin is what a person does; below it, indented, is what
# kvd asks and does, and what changes on the desktop. Time is virtual: hours pass at once.

# Nobody is there. kvd starts by itself for the first button, and Play launches the jukebox.
tap play
  connects to the window server
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: nobody ×7
  script to Lyrabox: launch
  Lyrabox starts

# The jukebox runs now, so the next Play reaches it, and one more pauses it: Play toggles.
tap play
  finds Lyrabox running
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSS'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
wait 1m30s
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: playpause
  Lyrabox: paused in "Harbour Lights" at 1:30
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether Lyrabox runs: yes
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"

# The disc player comes to the front and gets the remote. Its menu button opens the disc's menu and silences the music.
open spindle
  Spindle starts
front spindle
  Spindle comes to the front
tap app-menu
  finds Lyrabox running
  finds Spindle running
  asks who is in front: Spindle
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Harbour Lights" at 1:30
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'esps'
  script to Spindle: go to main menu
  Spindle: shows the disc menu, at "Play the film"
tap select
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  script to Spindle: press enter key
  Spindle: plays chapter 1 at 0:00

# A scan lasts while the button is held, and ends as it began.
hold forward 3s
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espl'
  script to Spindle: set scanRate to dvd scan rate ⏎ set dvd scan rate to x8 ⏎ fast forward dvd ⏎ set dvd scan rate …
  Spindle: scans forward ×8 from chapter 1 at 0:00
  +3s  asks who is in front: Spindle
  +3s  script to Spindle: get dvd menu active = false
  +3s  script to Spindle: play dvd
  +3s  Spindle: plays chapter 1 at 0:24

# The volume goes up as long as the button is held: at once, after a second, then ten times a second.
hold volume-up 1.2s
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: set audio muted to false = false
  script: output volume of (get volume settings) = 50
  sound key up pressed
  output volume 50 → 55
  timer of 0.1s starts
  +1.05s  asks whether Spindle runs: yes
  +1.05s  script to Spindle: set audio muted to false = false
  +1.05s  script: output volume of (get volume settings) = 55
  +1.05s  sound key up pressed, repeated
  +1.05s  output volume 55 → 60
  +1.15s  asks whether Spindle runs: yes
  +1.15s  script to Spindle: set audio muted to false = false
  +1.15s  script: output volume of (get volume settings) = 60
  +1.15s  sound key up pressed, repeated
  +1.15s  output volume 60 → 65
  +1.2s  timer of 0.1s stops
  +1.2s  asks whether Spindle runs: yes
  +1.2s  asks who is in front: Spindle
  +1.2s  script: output volume of (get volume settings) = 65
  +1.2s  sound key up released

# Two movie players. Each one that starts stops what plays.
open vistremeplayer
  VistremePlayer starts
front vistremeplayer
  VistremePlayer comes to the front
tap play
  finds Lyrabox running
  finds Spindle running
  finds VistremePlayer running
  asks who is in front: VistremePlayer
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espl'
  script to Spindle: pause dvd
  Spindle: paused in chapter 1 at 0:25
  script to VistremePlayer: set frontMovie to front movie ⏎ if frontMovie is playing then ⏎ pause frontMovie ⏎ else ⏎ pla…
  VistremePlayer: plays "Dune Walk"
open com.tarn.VistremePlayerX
  VistremePlayerX starts
front com.tarn.VistremePlayerX
  VistremePlayerX comes to the front
tap play
  finds Lyrabox running
  finds Spindle running
  finds VistremePlayerX running
  finds VistremePlayer running
  asks who is in front: VistremePlayerX
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: stop front movie
  VistremePlayer: stands in "Dune Walk" at 0:00
  script to VistremePlayerX: get rate of front document = 0
  script to VistremePlayerX: set frontMovie to front document ⏎ tell front document to show remote hud ⏎ if frontMovie is play…
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk"

# The modern one scans faster with every press: 2, 4, 8.
tap forward
  asks who is in front: VistremePlayerX
  script to VistremePlayerX: get rate of front document = 1
  script to VistremePlayerX: get playing of front document = true
  script to VistremePlayerX: tell front document to show remote hud ⏎ set rate of front document to 2.0
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk" at rate 2
  asks who is in front: VistremePlayerX
  script to VistremePlayerX: get rate of front document = 2
tap forward
  asks who is in front: VistremePlayerX
  script to VistremePlayerX: get rate of front document = 2
  script to VistremePlayerX: set maxRate to 8.0 ⏎ set scanRate to rate of front document ⏎ tell front document to show remote …
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk" at rate 4
  asks who is in front: VistremePlayerX
  script to VistremePlayerX: get rate of front document = 4

# A talk: the slides take the display. Next slide, frozen, the end.
open slidewell
  Slidewell starts
front slidewell
  Slidewell comes to the front
tap play
  finds Lyrabox running
  finds Spindle running
  finds VistremePlayerX running
  finds VistremePlayer running
  finds Slidewell running
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = false
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  VistremePlayerX: stands in "Dune Walk" at 0:00
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: stop front movie
  script to Slidewell: start slideshow
  Slidewell takes the display
  Slidewell: slide 1 of 12
tap next
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: show next slide
  Slidewell: slide 2 of 12
tap playpause
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: if frozen then ⏎ set frozen to false ⏎ else ⏎ set frozen to true ⏎ end if
  Slidewell: slide 2 of 12, frozen
tap menu
  asks who is in front: Slidewell
  script to Slidewell: get slide switcher visible = false
  script to Slidewell: get playing = true
  script to Slidewell: stop slideshow
  Slidewell gives the display back
  Slidewell: shows no slides

# Photos: the library walks its albums, then shows one; the professional application is driven by keys.
open snapvale
  Snapvale starts
front snapvale
  Snapvale comes to the front
tap next
  finds Lyrabox running
  finds Snapvale running
  finds Spindle running
  finds VistremePlayerX running
  finds VistremePlayer running
  finds Slidewell running
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  script to Snapvale: set theAlbums to the id of every album ⏎ set albumIndex to -1 ⏎ repeat with i from 1 to count the…
  Snapvale: album "Photos"
tap play
  asks who is in front: Snapvale
  finds Snapvale running
  script to Snapvale: slideshow running = false
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: stop front movie
  asks whether Slidewell runs: yes
  script to Slidewell: stop slideshow
  script to Snapvale: activate ⏎ start slideshow
  Snapvale: album "Photos", slideshow at photo 1
open lumbra
  Lumbra starts
front lumbra
  Lumbra comes to the front
tap playpause
  finds Lyrabox running
  finds Snapvale running
  finds Lumbra running
  finds Spindle running
  finds VistremePlayerX running
  finds VistremePlayer running
  finds Slidewell running
  asks who is in front: Lumbra
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  asks whether Snapvale runs: yes
  script to Snapvale: ignoring application responses ⏎ stop slideshow ⏎ end ignoring
  Snapvale: album "Photos"
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: stop front movie
  asks whether Slidewell runs: yes
  script to Slidewell: stop slideshow
  key 56 pressed in Lumbra
  +0.01s  key 1 pressed in Lumbra
  +0.01s  Lumbra: asks about a slideshow
  +0.06s  key 1 released in Lumbra
  +0.07s  key 56 released in Lumbra
  +0.09s  key 36 pressed in Lumbra
  +0.09s  Lumbra takes the display
  +0.09s  Lumbra: slideshow at photo 1
  +0.14s  key 36 released in Lumbra
tap menu
  asks who is in front: Lumbra
  key 53 pressed in Lumbra
  Lumbra gives the display back
  Lumbra: photo in row 1, column 1
  +0.05s  key 53 released in Lumbra

# An editor comes to the front. Nothing plays any more; the jukebox is the first in the fixed order that runs.
open com.example.Editor
  Editor starts
front com.example.Editor
  Editor comes to the front
tap play
  finds Lyrabox running
  finds Snapvale running
  finds Lumbra running
  finds Spindle running
  finds VistremePlayerX running
  finds VistremePlayer running
  finds Slidewell running
  asks who is in front: Editor
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether Spindle runs: yes
  script to Spindle: get dvd state = 'espa'
  script to Spindle: get dvd menu active = false
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: get playing of front document = false
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: get playing of front movie = false
  asks whether Slidewell runs: yes
  script to Slidewell: get playing = false
  asks whether Lyrabox runs: yes
  asks whether Snapvale runs: yes
  script to Snapvale: ignoring application responses ⏎ stop slideshow ⏎ end ignoring
  asks whether Lumbra runs: yes
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  asks whether VistremePlayer runs: yes
  script to VistremePlayer: stop front movie
  asks whether Slidewell runs: yes
  script to Slidewell: stop slideshow
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"

# With the screen locked kvd launches nothing.
tap stop
  asks who is in front: Editor
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: stop
  Lyrabox: stopped
close lyrabox
  Lyrabox quits
close spindle
  Spindle quits
close vistremeplayer
  VistremePlayer quits
close com.tarn.VistremePlayerX
  VistremePlayerX quits
lock on
tap play
  finds Snapvale running
  finds Lumbra running
  finds Slidewell running
  asks who is in front: Editor
  asks whether Slidewell runs: yes
  script to Slidewell: get playing = false

# Nobody touches the remote for an evening. After two hours kvd ends; the next button would start it again.
wait 3h
  +8m25.59s to +2h8m25.59s  asks who is in front: Editor ×78
  +2h8m25.59s  notification com.tarn.kvd.terminated of com.tarn.kvd
  +2h8m25.59s  timer of 10m stops
  +2h8m25.59s  exit status 0
  left alive: string ×6, list ×2, serial number ×5, source ×1, port ×1, event source ×1

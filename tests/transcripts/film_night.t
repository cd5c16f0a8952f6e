# A film night: music plays, then a disc goes in front.
open lyrabox
  Lyrabox starts
tell lyrabox to play
  Lyrabox: plays "Harbour Lights"
open spindle
  Spindle starts
front spindle
  Spindle comes to the front

# The app menu button silences the music and opens the disc menu; the arrows move in it, select chooses.
tap app-menu
  connects to the window server
  finds Lyrabox running
  finds Spindle running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Spindle ×2
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Harbour Lights" at 0:00
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'esps'
  script to Spindle: go to main menu
  Spindle: shows the disc menu, at "Play the film"
tap down
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
  script to Spindle: press down arrow key
  Spindle: menu at "Chapter 4"
  timer of 0.01s starts
  timer of 0.01s stops
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
tap select
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  script to Spindle: press enter key
  Spindle: plays chapter 4 at 0:00

# Half a minute into chapter 4 somebody wants to see the end of the one before.
wait 30s
tap previous
  asks who is in front: Spindle
  script to Spindle: if chapter > 1 then ⏎ set chapter to chapter - 1 ⏎ else if elapsed time > 5 then ⏎ set chapter …
  Spindle: goes to chapter 3

# A scan from pause ends in pause.
wait 20s
tap pause
  asks who is in front: Spindle
  script to Spindle: pause dvd
  Spindle: paused in chapter 3 at 0:20
hold forward 2s
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'espa'
  script to Spindle: set scanRate to dvd scan rate ⏎ set dvd scan rate to x8 ⏎ fast forward dvd ⏎ set dvd scan rate …
  Spindle: scans forward ×8 from chapter 3 at 0:20
  +2s  asks who is in front: Spindle
  +2s  script to Spindle: get dvd menu active = false
  +2s  script to Spindle: pause dvd
  +2s  Spindle: paused in chapter 3 at 0:36

tap play
  asks who is in front: Spindle
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  script to Spindle: if dvd state is playing then ⏎ pause dvd ⏎ else ⏎ play dvd ⏎ end if
  Spindle: plays chapter 3 at 0:36
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×2, source ×1, port ×1

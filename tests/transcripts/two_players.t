# Two players at once: what is in front gets the remote, and what starts silences the other.
open lyrabox
  Lyrabox starts
open com.tarn.VistremePlayerX
  VistremePlayerX starts
tell lyrabox to play
  Lyrabox: plays "Harbour Lights"
front com.tarn.VistremePlayerX
  VistremePlayerX comes to the front
tap play
  connects to the window server
  finds Lyrabox running
  finds VistremePlayerX running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: VistremePlayerX ×6
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Harbour Lights" at 0:00
  script to VistremePlayerX: get rate of front document = 0
  script to VistremePlayerX: set frontMovie to front document ⏎ tell front document to show remote hud ⏎ if frontMovie is play…
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk"

# A scan climbs: 2, then 4. Play-pause goes back to what was before.
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
tap playpause
  asks who is in front: VistremePlayerX
  asks whether Lyrabox runs: yes
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  script to VistremePlayerX: get rate of front document = 4
  script to VistremePlayerX: tell front document to show remote hud ⏎ play front document
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk"
  script to VistremePlayerX: get playing of front document = true

# The jukebox comes to the front and plays; the film stops.
front lyrabox
  Lyrabox comes to the front
tap play
  asks who is in front: Lyrabox
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  VistremePlayerX: stands in "Dune Walk" at 0:00
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"

# Nobody is in front: the one that plays has the remote.
front nobody
tap pause
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSP'
  script to Lyrabox: if player state is playing then ⏎ pause ⏎ end if
  Lyrabox: paused in "Harbour Lights" at 0:00

# Neither plays: the one that had it last keeps it.
tap play
  asks who is in front: nobody
  asks whether Lyrabox runs: yes
  script to Lyrabox: get player state = 'kPSU'
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: get playing of front document = false
  asks whether Lyrabox runs: yes
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: stop front document
  script to Lyrabox: playpause
  Lyrabox: plays "Harbour Lights"
close lyrabox
  Lyrabox quits
tap play
  finds VistremePlayerX running
  asks who is in front: nobody
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: get playing of front document = false
  asks whether VistremePlayerX runs: yes
  script to VistremePlayerX: get rate of front document = 0
  script to VistremePlayerX: set frontMovie to front document ⏎ tell front document to show remote hud ⏎ if frontMovie is play…
  VistremePlayerX: shows its remote display
  VistremePlayerX: plays "Dune Walk"
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

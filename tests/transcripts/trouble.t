# An application that refuses, one that says nothing, one that hangs: kvd goes on as if it had been told no.
open spindle
  Spindle starts
front spindle
  Spindle comes to the front
tell spindle to play dvd
  Spindle: plays chapter 1 at 0:00
answers spindle errors
tap app-menu
  connects to the window server
  finds Spindle running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Spindle ×2
  script to Spindle: get dvd menu active, fails in line 1: Spindle refuses
  script to Spindle: get dvd state, fails in line 1: Spindle refuses
  script to Spindle: go to beginning of disc, fails in line 1: Spindle refuses
answers spindle nothing
tap app-menu
  asks who is in front: Spindle
  script to Spindle: get dvd menu active
  script to Spindle: get dvd state
  script to Spindle: go to beginning of disc
answers spindle normally

# A hung application holds the daemon up for as long as it hangs; the next button waits.
hang spindle 20s
tap pause
  asks who is in front: Spindle
  script to Spindle: pause dvd
  +20s  Spindle: paused in chapter 1 at 0:20
tap play
  asks who is in front: Spindle
  script to Spindle: if dvd state is playing then ⏎ pause dvd ⏎ else ⏎ play dvd ⏎ end if
  Spindle: plays chapter 1 at 0:20

# Nothing to play.
disc out
  Spindle: gives the disc out
tap play
  asks who is in front: Spindle
  script to Spindle: if dvd state is playing then ⏎ pause dvd ⏎ else ⏎ play dvd ⏎ end if, fails in line 5: there is no disc
tap app-menu
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'esid'
  script to Spindle: go to beginning of disc, fails in line 1: there is no disc

# Menu Pick sends the jukebox an event instead of a script.
open lyrabox
  Lyrabox starts
front lyrabox
  Lyrabox comes to the front
tap pick
  finds Lyrabox running
  finds Spindle running
  asks who is in front: Lyrabox
  asks whether Spindle runs: yes
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'esid'
  event 'hook'/'RSel' to Lyrabox
  Lyrabox: plays "Harbour Lights"
close lyrabox
  Lyrabox quits

# Keys find no process, sound keys no window server, displays no answer.
open lumbra
  Lumbra starts
front lumbra
  Lumbra comes to the front
break process-lookup
tap right
  finds Lumbra running
  finds Spindle running
  asks who is in front: Lumbra
break event-records
front nobody
tap volume-up
  asks whether Spindle runs: yes
  asks who is in front: nobody
  asks whether Spindle runs: yes
  script to Spindle: get dvd state = 'esid'
  script to Spindle: get dvd menu active = false
  asks whether Spindle runs: yes
  script to Spindle: set audio muted to false = false
  script: output volume of (get volume settings) = 50
  timer of 0.1s starts
  timer of 0.1s stops
  asks whether Spindle runs: yes
  asks who is in front: nobody
  asks whether Spindle runs: yes
  script to Spindle: get dvd state = 'esid'
  script to Spindle: get dvd menu active = false
  asks whether Spindle runs: yes
  script: output volume of (get volume settings) = 50
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×2, source ×1, port ×1, event source ×1

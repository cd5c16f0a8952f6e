# A menu button that is held steps a hundred times a second, after a second's wait, until anything else is pressed.
open spindle
  Spindle starts
front spindle
  Spindle comes to the front
tap app-menu
  connects to the window server
  finds Spindle running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Spindle ×2
  script to Spindle: get dvd menu active = false
  script to Spindle: get dvd state = 'esps'
  script to Spindle: go to main menu
  Spindle: shows the disc menu, at "Play the film"
hold down 1.5s
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
  script to Spindle: press down arrow key
  Spindle: menu at "Chapter 4"
  timer of 0.01s starts
  +1.05s  asks whether Spindle runs: yes
  +1.05s  script to Spindle: get dvd menu active = true
  +1.05s  script to Spindle: press down arrow key
  +1.05s  Spindle: menu at "Subtitles"
  +1.06s to +1.5s  ×45:
    asks whether Spindle runs: yes
    script to Spindle: get dvd menu active = true
    script to Spindle: press down arrow key
  +1.5s  timer of 0.01s stops
  +1.5s  asks whether Spindle runs: yes
  +1.5s  asks who is in front: Spindle
  +1.5s  script to Spindle: get dvd menu active = true

# If the menu goes away in the middle, the held button turns into volume down: kvd unmutes the player and posts
# the sound key, marked as repeated, at the same pace and without an end of its own.
volume 5
  output volume 50 → 5
press down
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = true
  script to Spindle: press down arrow key
  timer of 0.01s starts
wait 1.1s
  +1.05s to +1.1s  ×6:
    asks whether Spindle runs: yes
    script to Spindle: get dvd menu active = true
    script to Spindle: press down arrow key
tell spindle to play dvd
  Spindle: plays chapter 1 at 0:00
wait 1m
  +0.01s  asks whether Spindle runs: yes
  +0.01s  script to Spindle: get dvd menu active = false
  +0.01s  script to Spindle: set audio muted to false = false
  +0.01s  script: output volume of (get volume settings) = 5
  +0.01s  sound key down pressed, repeated
  +0.01s  output volume 5 → 0
  +0.02s to +1m  ×5999:
    asks whether Spindle runs: yes
    script to Spindle: get dvd menu active = false
    script to Spindle: set audio muted to false = false
    script: output volume of (get volume settings) = 0
    sound key down pressed, repeated
release down
  timer of 0.01s stops
  asks whether Spindle runs: yes
  asks who is in front: Spindle
  script to Spindle: get dvd menu active = false
  script: output volume of (get volume settings) = 0
  sound key down released
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

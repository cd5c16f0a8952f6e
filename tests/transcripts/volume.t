# Volume to the top: the sound key, again after a second, then ten times a second.
open lyrabox
  Lyrabox starts
front lyrabox
  Lyrabox comes to the front
volume 90
  output volume 50 → 90
hold volume-up 1.2s
  connects to the window server
  finds Lyrabox running
  holds the user's own input back for 0 s after a synthetic event
  service transactions on
  timer of 10m starts
  notification com.tarn.kvd.started of com.tarn.kvd
  asks who is in front: Lyrabox ×2
  script: output volume of (get volume settings) = 90
  sound key up pressed
  output volume 90 → 95
  timer of 0.1s starts
  +1.05s  script: output volume of (get volume settings) = 95
  +1.05s  sound key up pressed, repeated
  +1.05s  output volume 95 → 100
  +1.15s  script: output volume of (get volume settings) = 100
  +1.15s  script: output muted of (get volume settings) = false
  +1.15s  sound key up pressed
  +1.15s  asks who is in front: Lyrabox
  +1.15s  script to Lyrabox: set sound volume to sound volume + 2
  +1.15s  Lyrabox: volume 60 → 62
  +1.2s  timer of 0.1s stops
  +1.2s  script: output volume of (get volume settings) = 100
  +1.2s  sound key up released

# And beyond: at the top the output is unmuted and the player's own volume goes up, a step at a time.
mute on
  output muted
hold volume-up 1.2s
  script: output volume of (get volume settings) = 100
  script: output muted of (get volume settings) = true
  script: set volume without output muted
  output no longer muted
  sound key up pressed
  asks who is in front: Lyrabox
  script to Lyrabox: set sound volume to sound volume + 2
  Lyrabox: volume 62 → 64
  timer of 0.1s starts
  +1.05s  script: output volume of (get volume settings) = 100
  +1.05s  script: output muted of (get volume settings) = false
  +1.05s  sound key up pressed
  +1.05s  script to Lyrabox: set sound volume to sound volume + 2
  +1.05s  Lyrabox: volume 64 → 66
  +1.15s  script: output volume of (get volume settings) = 100
  +1.15s  script: output muted of (get volume settings) = false
  +1.15s  sound key up pressed
  +1.15s  script to Lyrabox: set sound volume to sound volume + 2
  +1.15s  Lyrabox: volume 66 → 68
  +1.2s  timer of 0.1s stops
  +1.2s  script: output volume of (get volume settings) = 100
  +1.2s  sound key up released

# Down is plainer: it looks at neither the level nor the mute.
mute on
  output muted
hold down 1.1s
  script: output volume of (get volume settings) = 100
  sound key down pressed
  output volume 100 → 95
  timer of 0.1s starts
  +1.05s  script: output volume of (get volume settings) = 95
  +1.05s  sound key down pressed, repeated
  +1.05s  output volume 95 → 90
  +1.1s  timer of 0.1s stops
  +1.1s  script: output volume of (get volume settings) = 90
  +1.1s  sound key down released

# A button that nobody lets go stops by itself: ten seconds after the press.
volume 5
  output volume 90 → 5
press volume-down
  script: output volume of (get volume settings) = 5
  sound key down pressed
  output volume 5 → 0
  timer of 0.1s starts
wait 1h
  +1.05s to +9.95s  ×90:
    script: output volume of (get volume settings) = 0
    sound key down pressed, repeated
  +10.05s  timer of 0.1s stops
  +9m56.5s to +59m56.5s  asks who is in front: Lyrabox ×12
  end of input
  notification com.tarn.kvd.terminated of com.tarn.kvd
  timer of 10m stops
  exit status 0
  left alive: serial number ×1, source ×1, port ×1

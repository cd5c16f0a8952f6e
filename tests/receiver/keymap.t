# An infrared remote, without keys for the volume.
remote 1 infrared
keys 1 PLAY PLAYCD PAUSE PAUSECD PLAYPAUSE STOP STOPCD NEXT NEXTSONG PREVIOUS PREVIOUSSONG
  play play pause pause playpause stop stop next next previous previous
keys 1 FASTFORWARD REWIND FASTREVERSE FORWARD BACK EXIT ESC
  forward rewind rewind - menu menu menu
keys 1 UP DOWN LEFT RIGHT OK SELECT ENTER KPENTER
  up down left right select select select select
keys 1 MENU ROOT_MENU MEDIA_TOP_MENU TITLE DVD PROG1
  app-menu app-menu app-menu app-menu app-menu app-menu
keys 1 MUTE POWER CHANNELUP 5 NUMERIC_5 RED A
  - - - - - - -

# With keys for the volume, Up and Down are left for menus.
remote 2 infrared volume
keys 2 VOLUMEUP VOLUMEDOWN UP DOWN LEFT RIGHT
  volume-up volume-down menu-up menu-down left right

# What a television passes on: tracks by other keys, and a channel.
remote 3 cec
keys 3 FORWARD BACK PREVIOUS PREVIOUSSONG EXIT STOP UP
  next previous - previous menu stop up

remote 4 avrcp
keys 4 PLAYCD PAUSECD STOPCD NEXTSONG PREVIOUSSONG FASTFORWARD REWIND
  play pause stop next previous forward rewind

# STOP, FORWARD and BACK belong to a browser on HID; the last is good for leaving a show all the same.
remote 5 hid
keys 5 STOP STOPCD FORWARD BACK UP ENTER ESC
  - stop - menu up select menu

# What the scan code tells goes first, ...
0 5 UP down c0042
  0 menu-up down
100 5 UP up c0042
200 5 MENU down c0040
  200 menu down
300 5 MENU up c0040
400 5 SELECT down c0041
  400 pick down
500 5 SELECT up c0041
# ... but not where a person has remapped it, where kvd does not know it, or for a keyboard's arrow.
600 5 PLAYPAUSE down c00b5
  600 playpause down
700 5 PLAYPAUSE up c00b5
800 5 NEXTSONG down c0223
  800 next down
900 5 NEXTSONG up c0223
1000 5 LEFT down 70050
  1000 left down
1100 5 LEFT up 70050
# On infrared it is the remote's own number.
1200 2 UP down 1008c
  1200 menu-up down

# Buttons that people hold say both, all others the press alone; the kernel's repeats come to nothing elsewhere.
remote 1 infrared volume
0 1 VOLUMEUP down
  0 volume-up down
900 1 VOLUMEUP up
  900 volume-up up
1000 1 PLAY down
  1000 play down
1200 1 PLAY up

# Infrared does not bounce: two presses in one frame are two.
2000 1 FASTFORWARD down
  2000 forward down
2000 1 FASTFORWARD up
  2000 forward up
2000 1 FASTFORWARD down
  2000 forward down
2126 1 FASTFORWARD up
  2126 forward up

# A release whose press nobody saw is none, and a press whose release was lost makes it up.
3000 1 REWIND up
3100 1 VOLUMEUP down
  3100 volume-up down
3200 1 VOLUMEUP down
  3200 volume-up up
  3200 volume-up down
3300 1 VOLUMEUP up
  3300 volume-up up

# Contacts bounce: while they do, a hold is one press and one release.
remote 2 hid
4000 2 FASTFORWARD down
  4000 forward down
4005 2 FASTFORWARD up
4012 2 FASTFORWARD down
5000 2 FASTFORWARD up
  5000 forward up
# A short press is over when they have settled, ...
6000 2 FASTFORWARD down
  6000 forward down
6008 2 FASTFORWARD up
6016 2 FASTFORWARD down
6024 2 FASTFORWARD up
6100 2 PLAYPAUSE down
  6040 forward up
  6100 playpause down
6110 2 PLAYPAUSE up
6120 2 PLAYPAUSE down
6139 2 PLAYPAUSE up
# ... a press after that is another one, and no other release is late.
6140 2 PLAYPAUSE down
  6140 playpause down
6180 2 PLAYPAUSE up
6200 2 REWIND down
  6200 rewind down
6240 2 REWIND up
  6240 rewind up
# Another key, and the same key of another remote, have bounces of their own.
remote 3 hid
6300 2 REWIND down
  6300 rewind down
6310 3 REWIND down
  6310 rewind down
6320 2 FASTFORWARD down
  6320 forward down
6330 2 REWIND up

# Whatever was down when a remote goes, comes up; a press that follows is a new one.
6600 2 gone
  6340 rewind up
  6600 forward up
6605 3 REWIND up
  6605 rewind up
6600 2 REWIND down
  6600 rewind down
6610 2 REWIND up
6620 2 gone
  6620 rewind up
6700 1 VOLUMEUP down
  6700 volume-up down
6700 3 REWIND down
  6700 rewind down
6700 3 PLAY down
  6700 play down
6800 end
  6800 volume-up up
  6800 rewind up
6900 3 REWIND up

// The script texts of the consumer photo library. Their odd spots (a missing blank before a quote, a missing
// "then", a name compared with an album) belong to them.
#pragma once

namespace snapvale_scripts {

/// One walk in the words of each generation; version6 serves all before 7, version8 all from 8 on.
struct Generations {
  const char* version6;
  const char* version7;
  const char* version8;
};

inline constexpr char kSlideshowRunning[] = R"(tell application id "com.tarn.Snapvale"
slideshow running
end tell)";

inline constexpr char kCommandEscape[] = R"(tell application id "com.tarn.Snapvale"
tell application "Keyhouse"
key code 53 using command down
end tell
end tell)";

inline constexpr char kEscape[] = R"(tell application id "com.tarn.Snapvale"
tell application "Keyhouse"
tell process id "com.tarn.Snapvale"
key code 53
end tell
end tell
end tell)";

inline constexpr char kSpace[] = R"(tell application id "com.tarn.Snapvale"
tell application "Keyhouse"
tell process id "com.tarn.Snapvale"
key code 49
end tell
end tell
end tell)";

inline constexpr char kStartWithoutWaiting[] = R"(tell application id "com.tarn.Snapvale"
ignoring application responses
activate
start slideshow
end ignoring
end tell)";

inline constexpr char kStart[] = R"(tell application id "com.tarn.Snapvale"
activate
start slideshow
end tell)";

inline constexpr Generations kNextAlbum = {
    R"(tell application id "com.tarn.Snapvale"
set theAlbums to the name of every album
set albumIndex to -1
repeat with i from 1 to count theAlbums
if item i of theAlbums is the name of current album then
set albumIndex to i
end if
end repeat
if albumIndex >= the (count of theAlbums) then
select album 1
else if albumIndex > 0 then
select album (albumIndex + 1)
end if
end tell)",
    R"(tell application id "com.tarn.Snapvale"
set theAlbums to the id of every album
set albumIndex to -1
repeat with i from 1 to count theAlbums
if the id of current album is item i of theAlbums then
set albumIndex to i
end if
end repeat
if albumIndex >= the (count of theAlbums) then
select album 1
else if albumIndex > 0 then
select album (albumIndex + 1)
end if
end tell)",
    R"(tell application id"com.tarn.Snapvale"
set theAlbums to the id of every album
set albumIndex to -1
repeat with i from 1 to count theAlbums
if the id of current album is item i of theAlbums then
set albumIndex to i
end if
end repeat
if the current album is album 1 then
tell application id "com.tarn.Snapvale" to activate
select album 4
else if current album is album 4
tell application id "com.tarn.Snapvale" to activate
select album 2
else if the current album is album 2
tell application id "com.tarn.Snapvale" to activate
select album 3
else if the current album is album 3
select album 5
else if albumIndex >= the (count of theAlbums) then
select album (count theAlbums)
else if albumIndex > 0 then
select album (albumIndex + 1)
end if
end tell)"};

inline constexpr Generations kPreviousAlbum = {
    R"(tell application id "com.tarn.Snapvale"
set theAlbums to the name of every album
set albumIndex to 0
repeat with i from 1 to count theAlbums
if item i of theAlbums is the current album then
set albumIndex to i
end if
end repeat
if albumIndex > 1 then
select album (albumIndex - 1)
else
select album (count theAlbums)
end if
end tell)",
    R"(tell application id "com.tarn.Snapvale"
set theAlbums to the id of every album
set albumIndex to 0
repeat with i from 1 to count theAlbums
if id of current album is item i of theAlbums then
set albumIndex to i
end if
end repeat
if the current album is album 1 then
select album (count theAlbums)
tell application id "com.tarn.Snapvale" to activate
tell application "Keyhouse"
tell process id "com.tarn.Snapvale"
key code 48
end tell
end tell
else if albumIndex > 1 then
select album (albumIndex - 1)
else
select album (count theAlbums)
end if
end tell)",
    R"(tell application id "com.tarn.Snapvale"
set theAlbums to the id of every album
set albumIndex to 0
repeat with i from 1 to count theAlbums
if id of current album is item i of theAlbums then
set albumIndex to i
end if
end repeat
if the current album is album 3 then
tell application id "com.tarn.Snapvale" to activate
select album 2
else if the current album is album 2 then
tell application id "com.tarn.Snapvale" to activate
select album 4
else if the current album is album 4 then
tell application id "com.tarn.Snapvale" to activate
tell application "Keyhouse"
tell process id "com.tarn.Snapvale"
key code 48
key code 126
end tell
end tell
else if the current album is album 5 then
tell application id "com.tarn.Snapvale" to activate
select album 3
else if albumIndex > 1 then
select album (albumIndex - 1)
end if
end tell)"};

}  // namespace snapvale_scripts

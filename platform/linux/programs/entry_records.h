// What kvd-entries writes and kvd reads.
//
// A record a program, its fields ended by kFieldEnd: identifier, window class, role as a number, 1 where it
// was cast, 1 where it can be started over the bus, directory, then the words of its command.
#pragma once

namespace linux::programs {

// Neither byte can stand in a desktop entry's value.
inline constexpr char kFieldEnd = '\x1f';
inline constexpr char kRecordEnd = '\x1e';

/// Asks for the identifier of the default music player instead.
inline constexpr const char* kDefaultMusicPlayerOption = "--default-music-player";

}  // namespace linux::programs

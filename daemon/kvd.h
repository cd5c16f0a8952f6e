// The values that every part of the daemon passes around, and the state of the whole process.
#pragma once

#include <bit>
#include <cstdint>

#include "platform/host.h"

// ---- Button events ----

/// One button event of the remote. Its value travels beside it as a signed 32-bit number: non-zero is
/// pressed, zero is released.
struct HIDEvent {
  std::uint16_t usagePage;  ///< USB HID usage page
  std::uint16_t usage;      ///< USB HID usage id within the page
  std::uint16_t extra;      ///< the sender's own; kept with the event, never interpreted
};

/// A HIDEvent as one number: usagePage in bits 0–15, usage in 16–31, extra in 32–47, the rest zero.
using PackedHIDEvent = std::uint64_t;

inline constexpr PackedHIDEvent kPackedHIDEventMask = 0xFFFF'FFFF'FFFF;

constexpr PackedHIDEvent PackHIDEvent(HIDEvent event) {
  return PackedHIDEvent{event.extra} << 32 | PackedHIDEvent{event.usage} << 16 | event.usagePage;
}

constexpr HIDEvent UnpackHIDEvent(PackedHIDEvent event) {
  return {static_cast<std::uint16_t>(event), static_cast<std::uint16_t>(event >> 16),
          static_cast<std::uint16_t>(event >> 32)};
}

/// The usage page of a packed event, as adapters take it.
constexpr std::uint32_t UsagePageOf(PackedHIDEvent event) { return event & 0xFFFF; }
/// The usage of a packed event, as adapters take it.
constexpr std::uint32_t UsageOf(PackedHIDEvent event) { return static_cast<std::uint32_t>(event) >> 16; }

/// The button of an event: (usagePage << 16) | usage. Every table compares these.
using UsageKey = std::uint32_t;

constexpr UsageKey UsageKeyOf(std::uint32_t usagePage, std::uint32_t usage) {
  return (usagePage << 16) + usage;
}
constexpr UsageKey UsageKeyOf(PackedHIDEvent event) {
  return std::rotl(static_cast<std::uint32_t>(event), 16);
}

/// The keys in use, by their names in the USB HID Usage Tables.
namespace Key {
inline constexpr UsageKey Undefined = 0x00000000;

// Generic Desktop page
inline constexpr UsageKey SystemAppMenu = 0x00010086;
inline constexpr UsageKey SystemMenuSelect = 0x00010089;
inline constexpr UsageKey SystemMenuRight = 0x0001008A;
inline constexpr UsageKey SystemMenuLeft = 0x0001008B;
inline constexpr UsageKey SystemMenuUp = 0x0001008C;
inline constexpr UsageKey SystemMenuDown = 0x0001008D;

// Consumer page
inline constexpr UsageKey Menu = 0x000C0040;
inline constexpr UsageKey MenuPick = 0x000C0041;
inline constexpr UsageKey MenuUp = 0x000C0042;
inline constexpr UsageKey MenuDown = 0x000C0043;
inline constexpr UsageKey MenuLeft = 0x000C0044;
inline constexpr UsageKey MenuRight = 0x000C0045;
inline constexpr UsageKey Play = 0x000C00B0;
inline constexpr UsageKey Pause = 0x000C00B1;
inline constexpr UsageKey FastForward = 0x000C00B3;
inline constexpr UsageKey Rewind = 0x000C00B4;
inline constexpr UsageKey ScanNextTrack = 0x000C00B5;
inline constexpr UsageKey ScanPreviousTrack = 0x000C00B6;
inline constexpr UsageKey Stop = 0x000C00B7;
inline constexpr UsageKey PlayPause = 0x000C00CD;
inline constexpr UsageKey VolumeIncrement = 0x000C00E9;
inline constexpr UsageKey VolumeDecrement = 0x000C00EA;
}  // namespace Key

// ---- Applications ----

/// A four-character code, first character in the most significant byte.
using FourCharCode = std::uint32_t;

consteval FourCharCode FourCC(const char (&text)[5]) {
  FourCharCode code = 0;
  for (int i = 0; i < 4; ++i) code = code << 8 | static_cast<unsigned char>(text[i]);
  return code;
}

/// The application that a button goes to.
using AppCode = FourCharCode;

namespace App {
inline constexpr AppCode Lyra = FourCC("Lyra");  ///< music jukebox
inline constexpr AppCode Snap = FourCC("Snap");  ///< consumer photo library
inline constexpr AppCode Lumb = FourCC("Lumb");  ///< professional photo application
inline constexpr AppCode Spin = FourCC("Spin");  ///< disc player
inline constexpr AppCode Vist = FourCC("Vist");  ///< classic movie player
inline constexpr AppCode VstX = FourCC("VstX");  ///< modern movie player
inline constexpr AppCode Slid = FourCC("Slid");  ///< presentation application
inline constexpr AppCode None = FourCC("none");  ///< no application applies
inline constexpr AppCode Nval = FourCC("nval");  ///< not computed yet
}  // namespace App

/// The identifiers by which running applications are known, compared exactly; two of them differ in little
/// more than case. Scripts address some applications with other spellings.
namespace Bundle {
inline constexpr const char* Lyrabox = "com.tarn.Lyrabox";
inline constexpr const char* Snapvale = "com.tarn.Snapvale";
inline constexpr const char* Lumbra = "com.tarn.Lumbra";
inline constexpr const char* Spindle = "com.tarn.Spindle";
inline constexpr const char* VistremePlayer = "com.tarn.vistremeplayer";
inline constexpr const char* VistremePlayerX = "com.tarn.VistremePlayerX";
inline constexpr const char* Slidewell = "com.tarn.Officra.Slidewell";
inline constexpr const char* Daemon = "com.tarn.kvd";
}  // namespace Bundle

// ---- Process-wide state ----

/// The connection to the window server; 0 before start-up.
extern HostConnectionID gKVDConnection;
/// The main thread's run loop, borrowed.
extern HostRunLoopRef gRunLoop;
/// The run-loop source of the service port; off the loop exactly while one button is dispatched.
extern HostSourceRef gServicePortSource;
/// What the last setscreenlocked message said.
extern bool gScreenLocked;
/// The application-list seed last seen; start-up takes the first one, the dispatcher follows it.
extern std::uint32_t gApplicationListSeed;
/// Flags for other code of the process; the daemon itself neither changes nor reads them.
extern bool gRemoteUIRunning;
extern bool gRemoteUIVisible;

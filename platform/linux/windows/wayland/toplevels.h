// The windows of which a compositor tells by events alone, whichever its protocol is.
#pragma once

#include <sys/types.h>

#include <cstdint>
#include <string>
#include <vector>

struct wl_output;

namespace linux::windows::wayland {

/// What is told of a window; changes of it come together.
struct Description {
  std::string applicationID;
  std::string title;
  bool isActive = false;
  bool isFullScreen = false;
  bool isMinimized = false;
  bool isDialog = false;
  /// Those that show a part of it.
  std::vector<wl_output*> outputs;
};

struct Toplevel {
  /// Never used again, and never 0.
  std::uint64_t number = 0;
  /// The later a window was opened, the greater.
  std::int64_t age = 0;
  /// What the protocol knows it by, and owns.
  void* handle = nullptr;
  /// Another one, where a second protocol tells the rest.
  void* details = nullptr;
  Description description;
  /// What has been told since the last of its changes was complete.
  Description next;
  /// It has been described at all.
  bool isComplete = false;

  // What the compositor's own language tells (processes.h).
  pid_t process = 0;
  std::int64_t container = 0;
  /// Where it differs from what the protocol tells.
  std::string applicationID;
};

/// Begins with none.
void beginToplevels();
/// From here on those that come are new: the first to be told of are those that were there, the last that was
/// opened first.
void noteAllAreKnown();

/// A window of which nothing is known yet. Borrowed, until it is removed.
Toplevel& addToplevel(void* handle);
/// What has been told of it is complete.
void completeToplevel(Toplevel& toplevel);
void removeToplevel(const Toplevel& toplevel);
/// Removes all, each after a last look at it.
void forgetToplevels(void (*last)(const Toplevel& toplevel));

/// All of them, those described too; the last that was active or opened first.
std::vector<Toplevel*> toplevels();
/// Null when it has gone.
Toplevel* findToplevel(std::uint64_t number);

/// Counts changes: windows that came or went, another active one, another application id.
unsigned toplevelChanges();

/// An output has gone.
void leaveOutput(wl_output* output);

}  // namespace linux::windows::wayland

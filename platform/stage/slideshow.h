// A slideshow of photos that keys drive: what the two photo applications share.
#pragma once

#include <cstdint>
#include <string>

namespace stage {

struct Slideshow {
  bool running = false;
  bool paused = false;
  int photo = 1;

  void start() { *this = {.running = true}; }
  void stop() { *this = {}; }

  /// Space pauses and goes on, the arrows step. False when the key means nothing to it or no show runs.
  bool receiveKey(std::uint16_t virtualKey);
  /// "slideshow at photo 3, paused"; empty when no show runs.
  std::string describe() const;
};

}  // namespace stage

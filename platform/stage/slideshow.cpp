#include "platform/stage/slideshow.h"

#include <algorithm>

#include "platform/host.h"

namespace stage {

namespace {

constexpr int kPhotoCount = 40;

}  // namespace

bool Slideshow::receiveKey(std::uint16_t virtualKey) {
  if (!running) return false;
  switch (virtualKey) {
    case HostVirtualKey::Space:
      paused = !paused;
      return true;
    case HostVirtualKey::RightArrow:
      photo = std::min(photo + 1, kPhotoCount);
      return true;
    case HostVirtualKey::LeftArrow:
      photo = std::max(photo - 1, 1);
      return true;
    default:
      return false;
  }
}

std::string Slideshow::describe() const {
  if (!running) return {};
  return "slideshow at photo " + std::to_string(photo) + (paused ? ", paused" : "");
}

}  // namespace stage

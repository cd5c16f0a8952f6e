#include "platform/stage/lumbra.h"

#include <algorithm>

#include "platform/host.h"
#include "platform/stage/desktop.h"

namespace stage {

void Lumbra::ended() {
  asks_ = false;
  slideshow_.stop();
}

std::string Lumbra::describe() const {
  if (slideshow_.running) return slideshow_.describe();
  if (asks_) return "asks about a slideshow";
  return "photo in row " + std::to_string(row_) + ", column " + std::to_string(column_);
}

void Lumbra::receiveKey(std::uint16_t virtualKey, bool withShift) {
  if (slideshow_.running) {
    if (virtualKey == HostVirtualKey::Escape) {
      ended();
      giveDisplayBack(*this);
    } else if (!slideshow_.receiveKey(virtualKey)) {
      return;
    }
  } else if (asks_) {
    if (virtualKey != HostVirtualKey::Return && virtualKey != HostVirtualKey::Escape) return;
    asks_ = false;
    if (virtualKey == HostVirtualKey::Return) {
      slideshow_.start();
      takeDisplay(*this);
    }
  } else {
    switch (virtualKey) {
      case HostVirtualKey::S:
        if (!withShift) return;
        asks_ = true;
        break;
      case HostVirtualKey::UpArrow:
        row_ = std::max(row_ - 1, 1);
        break;
      case HostVirtualKey::DownArrow:
        ++row_;
        break;
      case HostVirtualKey::LeftArrow:
        column_ = std::max(column_ - 1, 1);
        break;
      case HostVirtualKey::RightArrow:
        ++column_;
        break;
      default:
        return;
    }
  }
  changed(describe());
}

}  // namespace stage

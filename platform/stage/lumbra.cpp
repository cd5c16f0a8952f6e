#include "platform/stage/lumbra.h"

#include <algorithm>

#include "platform/stage/desktop.h"
#include "platform/stage/virtual_keys.h"

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
    if (virtualKey == keys::kEscape) {
      ended();
      giveDisplayBack(*this);
    } else if (!slideshow_.receiveKey(virtualKey)) {
      return;
    }
  } else if (asks_) {
    if (virtualKey != keys::kReturn && virtualKey != keys::kEscape) return;
    asks_ = false;
    if (virtualKey == keys::kReturn) {
      slideshow_.start();
      takeDisplay(*this);
    }
  } else {
    switch (virtualKey) {
      case keys::kS:
        if (!withShift) return;
        asks_ = true;
        break;
      case keys::kUpArrow:
        row_ = std::max(row_ - 1, 1);
        break;
      case keys::kDownArrow:
        ++row_;
        break;
      case keys::kLeftArrow:
        column_ = std::max(column_ - 1, 1);
        break;
      case keys::kRightArrow:
        ++column_;
        break;
      default:
        return;
    }
  }
  changed(describe());
}

}  // namespace stage

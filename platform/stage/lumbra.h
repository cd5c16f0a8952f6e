// The model professional photo application: keys alone drive it. Shift-S and Return start a slideshow, which
// takes the display.
#pragma once

#include <string>

#include "platform/stage/application.h"
#include "platform/stage/slideshow.h"

namespace stage {

class Lumbra final : public Application {
 public:
  Lumbra() : Application(scripting::kLumbra, "3.4") {}

  void receiveKey(std::uint16_t virtualKey, bool withShift) override;
  void ended() override;
  std::string describe() const override;

 private:
  /// Asks how the slideshow shall be; Return agrees.
  bool asks_ = false;
  int row_ = 1;
  int column_ = 1;
  Slideshow slideshow_;
};

}  // namespace stage

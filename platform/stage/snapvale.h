// The model consumer photo library: albums, and a slideshow. Before version 8 the slideshow takes the
// display; from then on it runs in a window of its own.
#pragma once

#include <string>
#include <vector>

#include "platform/stage/application.h"
#include "platform/stage/slideshow.h"

namespace stage {

class Snapvale final : public Application {
 public:
  Snapvale();

  const tarnscript::Dictionary& dictionary() const override;
  void receiveKey(std::uint16_t virtualKey, bool withShift) override;
  void ended() override;
  std::string describe() const override;
  std::string details() const override;

 protected:
  tarnscript::Value read(const tarnscript::ObjectRef& object, tarnscript::Code property) override;
  std::vector<tarnscript::ObjectRef> list(const tarnscript::ObjectRef& object, tarnscript::Code cls) override;
  tarnscript::Value obey(const tarnscript::Event& event) override;

 private:
  void select(std::size_t album);
  void selectAbove();
  void startSlideshow();
  void stopSlideshow();

  /// From 0, in the order of the list that scripts see.
  std::size_t album_ = 0;
  bool sourceListHasFocus_ = false;
  Slideshow slideshow_;
};

}  // namespace stage

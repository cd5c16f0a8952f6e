#include "receiver/names.h"

#include <libevdev/libevdev.h>

#include <array>
#include <cstdio>

namespace receiver {

std::string nameOf(std::uint16_t key) {
  const char* const name = libevdev_event_code_get_name(EV_KEY, key);
  return name != nullptr ? name : "key " + std::to_string(key);
}

std::string nameOf(const remote::Button& button) {
  std::array<char, 64> text{};
  std::snprintf(text.data(), text.size(), "%s (0x%02X 0x%02X)", button.hidName.data(), button.usagePage,
                button.usage);
  return text.data();
}

std::string nameOf(const Node& node) {
  // A device may call itself anything, and a terminal obeys some of it.
  std::string name;
  for (const char character : node.name) {
    const auto code = static_cast<unsigned char>(character);
    name += code < ' ' || code == 0x7F ? '?' : character;
  }
  return node.path + " \"" + name + "\"";
}

}  // namespace receiver

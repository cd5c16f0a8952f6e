// The buttons of a media remote by name.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace remote {

/// What a remote sends when a button goes down, and when it comes up.
inline constexpr std::int32_t kPressed = 1;
inline constexpr std::int32_t kReleased = 0;

/// One button: its short name, the published USB HID usage that it sends, and whether it is one that people
/// hold down. Both texts are literals, ended by NUL.
struct Button {
  std::string_view name;
  std::uint16_t usagePage;
  std::uint16_t usage;
  std::string_view hidName;
  bool held;
};

/// Every button, in the order to show them.
std::span<const Button> buttons();

/// The button with this name, short or HID, whatever the case and with any punctuation for a hyphen
/// ("play-pause", "Play/Pause"); null when there is none.
const Button* findButton(std::string_view name);

/// The button that sends this usage; null when there is none.
const Button* findButton(std::uint16_t usagePage, std::uint16_t usage);

/// The button with a name that must be one; throws UsageError with the nearest names.
const Button& knownButton(std::string_view name);

/// At most three names close to one that findButton does not know, nearest first.
std::vector<std::string> nearestButtonNames(std::string_view name);

/// The values that a tap of the button sends, in order: a press and, for a button that is held, a release.
/// Applications act on every message of the other buttons, so that a release would act a second time.
std::span<const std::int32_t> tapValues(const Button& button);

}  // namespace remote

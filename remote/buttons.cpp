#include "remote/buttons.h"

#include <algorithm>
#include <array>
#include <utility>

#include "remote/words.h"

namespace remote {
namespace {

constexpr std::uint16_t kDesktop = 0x01;
constexpr std::uint16_t kConsumer = 0x0C;

constexpr bool kHeld = true;
constexpr bool kTapped = false;

constexpr auto kButtons = std::to_array<Button>({
    {"play", kConsumer, 0xB0, "Play", kTapped},
    {"pause", kConsumer, 0xB1, "Pause", kTapped},
    {"playpause", kConsumer, 0xCD, "Play/Pause", kTapped},
    {"stop", kConsumer, 0xB7, "Stop", kTapped},
    {"next", kConsumer, 0xB5, "Scan Next Track", kTapped},
    {"previous", kConsumer, 0xB6, "Scan Previous Track", kTapped},
    {"forward", kConsumer, 0xB3, "Fast Forward", kHeld},
    {"rewind", kConsumer, 0xB4, "Rewind", kHeld},
    {"volume-up", kConsumer, 0xE9, "Volume Increment", kHeld},
    {"volume-down", kConsumer, 0xEA, "Volume Decrement", kHeld},
    {"menu", kConsumer, 0x40, "Menu", kTapped},
    {"pick", kConsumer, 0x41, "Menu Pick", kTapped},
    {"menu-up", kConsumer, 0x42, "Menu Up", kTapped},
    {"menu-down", kConsumer, 0x43, "Menu Down", kTapped},
    {"menu-left", kConsumer, 0x44, "Menu Left", kTapped},
    {"menu-right", kConsumer, 0x45, "Menu Right", kTapped},
    {"app-menu", kDesktop, 0x86, "System App Menu", kTapped},
    {"select", kDesktop, 0x89, "System Menu Select", kTapped},
    {"right", kDesktop, 0x8A, "System Menu Right", kTapped},
    {"left", kDesktop, 0x8B, "System Menu Left", kTapped},
    {"up", kDesktop, 0x8C, "System Menu Up", kHeld},
    {"down", kDesktop, 0x8D, "System Menu Down", kHeld},
});

constexpr std::size_t kMostSuggestions = 3;

// "Play/Pause" as one types it: play-pause.
std::string spelling(std::string_view name) {
  std::string result(name);
  for (char& character : result) {
    const bool upper = character >= 'A' && character <= 'Z';
    const bool kept = (character >= 'a' && character <= 'z') || (character >= '0' && character <= '9');
    if (upper) {
      character = static_cast<char>(character - 'A' + 'a');
    } else if (!kept) {
      character = '-';
    }
  }
  return result;
}

// How many characters to insert, remove, replace or swap with their neighbour to turn one text into the
// other.
std::size_t editDistance(std::string_view from, std::string_view to) {
  std::vector<std::vector<std::size_t>> edits(from.size() + 1, std::vector<std::size_t>(to.size() + 1));
  for (std::size_t i = 0; i <= from.size(); ++i) {
    for (std::size_t j = 0; j <= to.size(); ++j) {
      if (i == 0 || j == 0) {
        edits[i][j] = i + j;
        continue;
      }
      const std::size_t replaced = edits[i - 1][j - 1] + (from[i - 1] == to[j - 1] ? 0 : 1);
      edits[i][j] = std::min({replaced, edits[i - 1][j] + 1, edits[i][j - 1] + 1});
      const bool swapped = i > 1 && j > 1 && from[i - 1] == to[j - 2] && from[i - 2] == to[j - 1];
      if (swapped) edits[i][j] = std::min(edits[i][j], edits[i - 2][j - 2] + 1);
    }
  }
  return edits.back().back();
}

// A name that was only begun is as near as one wrong letter.
std::size_t distance(std::string_view typed, std::string_view name) {
  return !typed.empty() && name.starts_with(typed) ? 1 : editDistance(typed, name);
}

}  // namespace

std::span<const Button> buttons() { return kButtons; }

const Button* findButton(std::string_view name) {
  const std::string wanted = spelling(name);
  const auto* found = std::find_if(kButtons.begin(), kButtons.end(), [&](const Button& button) {
    return button.name == wanted || spelling(button.hidName) == wanted;
  });
  return found == kButtons.end() ? nullptr : found;
}

const Button* findButton(std::uint16_t usagePage, std::uint16_t usage) {
  const auto* found = std::find_if(kButtons.begin(), kButtons.end(), [&](const Button& button) {
    return button.usagePage == usagePage && button.usage == usage;
  });
  return found == kButtons.end() ? nullptr : found;
}

const Button& knownButton(std::string_view name) {
  if (const Button* button = findButton(name)) return *button;
  std::string nearest;
  for (const std::string& near : nearestButtonNames(name)) nearest += (nearest.empty() ? "" : ", ") + near;
  throw UsageError(
      "unknown button " + inQuotes(name) +
      (nearest.empty() ? " ('kvremote list' shows them all)" : ", did you mean " + nearest + "?"));
}

std::vector<std::string> nearestButtonNames(std::string_view name) {
  // One slip in three letters; beyond that, and beyond this many, a name resembles every other one.
  constexpr std::size_t kFarthest = 3;
  // Nothing so long is near a name, and the comparison takes time by its length.
  constexpr std::size_t kLongest = 32;
  if (name.size() > kLongest) return {};

  const std::string typed = spelling(name);
  const std::size_t limit = std::clamp<std::size_t>(typed.size() / 3, 1, kFarthest);
  std::vector<std::pair<std::size_t, std::string>> near;
  for (const Button& button : kButtons) {
    const std::string hidName = spelling(button.hidName);
    const std::size_t byName = distance(typed, button.name);
    const std::size_t byHIDName = distance(typed, hidName);
    const std::size_t nearer = std::min(byName, byHIDName);
    if (nearer <= limit) near.emplace_back(nearer, byName <= byHIDName ? std::string(button.name) : hidName);
  }
  std::stable_sort(near.begin(), near.end(), [](const auto& a, const auto& b) { return a.first < b.first; });

  std::vector<std::string> names;
  for (auto& [edits, nearName] : near) {
    if (names.size() == kMostSuggestions) break;
    names.push_back(std::move(nearName));
  }
  return names;
}

std::span<const std::int32_t> tapValues(const Button& button) {
  static constexpr std::array kValues = {kPressed, kReleased};
  return std::span(kValues).first(button.held ? 2 : 1);
}

}  // namespace remote

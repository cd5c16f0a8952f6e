#include "receiver/devices.h"

#include <linux/input.h>

#include <algorithm>
#include <charconv>
#include <climits>
#include <filesystem>
#include <optional>
#include <set>
#include <string_view>
#include <utility>

#include "receiver/udev.h"

namespace receiver {
namespace {

std::string usbDevice(sd_device* device) { return sysfsPathOf(parentOf(device, "usb", "usb_device")); }

unsigned long hexadecimal(std::string_view digits) {
  unsigned long number = 0;
  std::from_chars(digits.data(), digits.data() + digits.size(), number, 16);
  return number;
}

/// The numbers of the bits that are set in one of the kernel's bit maps: words in hexadecimal, the highest
/// first.
std::vector<std::uint16_t> bitsOf(std::string_view map) {
  constexpr std::size_t kWord = sizeof(unsigned long) * CHAR_BIT;
  std::vector<std::uint16_t> bits;
  for (std::size_t first = 0; !map.empty(); first += kWord) {
    const std::size_t begin = map.rfind(' ') + 1;  // 0 where only one word is left
    const unsigned long word = hexadecimal(map.substr(begin));
    for (std::size_t bit = 0; bit < kWord; ++bit) {
      if ((word >> bit & 1) != 0) bits.push_back(static_cast<std::uint16_t>(first + bit));
    }
    map = map.substr(0, begin == 0 ? 0 : begin - 1);
  }
  return bits;
}

bool hasAll(const std::vector<std::uint16_t>& bits, std::uint16_t first, std::uint16_t last) {
  return std::ranges::count_if(bits, [=](auto bit) { return bit >= first && bit <= last; }) ==
         last - first + 1;
}

bool has(const std::vector<std::uint16_t>& bits, std::uint16_t bit) { return hasAll(bits, bit, bit); }

Road roadOf(sd_device* device, const std::string& name, unsigned long bus) {
  if (parentOf(device, "rc") != nullptr) return bus == BUS_CEC ? Road::CEC : Road::Infrared;
  return name.ends_with(" (AVRCP)") ? Road::AVRCP : Road::HID;
}

bool isCalled(const Node& node, const std::string& word) {
  std::error_code error;
  return word == node.name ||
         (word.starts_with('/') && std::filesystem::equivalent(word, node.path, error)) || word == node.path;
}

std::optional<Node> describe(sd_device* device, const std::vector<std::string>& named) {
  Node node;
  node.path = nodeOf(device);
  if (node.path.empty()) return std::nullopt;
  sd_device* const parent = parentOf(device, "input");
  node.name = attributeOf(parent, "name");
  node.vendor = attributeOf(parent, "id/vendor");
  node.product = attributeOf(parent, "id/product");
  node.keys = bitsOf(attributeOf(parent, "capabilities/key"));
  const unsigned long bus = hexadecimal(attributeOf(parent, "id/bustype"));
  node.road = roadOf(device, node.name, bus);
  node.physical = usbDevice(device);
  const std::string unique = attributeOf(parent, "uniq");
  if (bus == BUS_BLUETOOTH && !unique.empty()) node.physical = "bluetooth " + unique;
  // As udev itself finds out which input devices are keyboards and mice; what it found is not there before
  // its rules have run.
  const auto axes = bitsOf(attributeOf(parent, "capabilities/rel"));
  node.keyboard = hasFlag(device, "ID_INPUT_KEYBOARD") || hasAll(node.keys, KEY_ESC, KEY_S);
  node.mouse = hasFlag(device, "ID_INPUT_MOUSE") || (has(axes, REL_X) && has(node.keys, BTN_LEFT));
  node.marked = hasFlag(device, "ID_REMOTE_CONTROL");
  node.named = std::ranges::any_of(named, [&node](const std::string& word) { return isCalled(node, word); });
  return node;
}

}  // namespace

std::vector<Node> findDevices(const std::vector<std::string>& named) {
  std::vector<Node> nodes;
  forEachDevice("input", "event*", [&](sd_device* device) {
    if (auto node = describe(device, named); node && !node->keys.empty()) nodes.push_back(std::move(*node));
  });
  std::set<std::string> soundCards;
  forEachDevice("sound", "card*", [&](sd_device* device) { soundCards.insert(usbDevice(device)); });
  for (Node& node : nodes) node.sound = !node.physical.empty() && soundCards.contains(node.physical);
  std::ranges::sort(nodes, {}, [](const Node& node) { return std::pair(node.path.size(), node.path); });
  judge(nodes);
  return nodes;
}

DeviceMonitor::DeviceMonitor(sd_event* loop, std::function<void()> changed) : changed_(std::move(changed)) {
  sd_device_monitor* made = nullptr;
  if (sd_device_monitor_new(&made) < 0) return;
  monitor_.reset(made);
  sd_device_monitor_filter_add_match_subsystem_devtype(made, "input", nullptr);
  sd_device_monitor_attach_event(made, loop);
  sd_device_monitor_start(
      made,
      [](sd_device_monitor*, sd_device*, void* self) {
        static_cast<DeviceMonitor*>(self)->changed_();
        return 0;
      },
      this);
}

}  // namespace receiver
